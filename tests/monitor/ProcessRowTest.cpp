#include "monitor/ProcessRow.h"

#include "runtime/Fault.h"

#include <gtest/gtest.h>

namespace quendra::monitor {

TEST(ProcessRow, The_key_is_p_and_the_decimal_process_id) {
  EXPECT_EQ(KeyOfProcess(1234), u"p1234");
  EXPECT_EQ(KeyOfProcess(0), u"p0");
}

TEST(ProcessRow, The_process_id_is_the_key_from_its_second_character_on) {
  EXPECT_EQ(ProcessIdOfKey(u"p1234"), 1234);
}

TEST(ProcessRow, Process_ids_have_32_bits) {
  EXPECT_EQ(KeyOfProcess(0xFFFFFFFF), u"p4294967295");
  EXPECT_EQ(ProcessIdOfKey(KeyOfProcess(0xFFFFFFFF)), 0xFFFFFFFF);
}

TEST(ProcessRow, A_key_without_a_number_is_a_type_mismatch) {
  try {
    ProcessIdOfKey(u"px");
    FAIL() << "no fault";
  } catch (const Fault& fault) {
    EXPECT_EQ(fault.number, Fault::kTypeMismatch);
  }
}

} // namespace quendra::monitor
