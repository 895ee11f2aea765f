#include "provisioning/ModemTable.h"

#include <gtest/gtest.h>

namespace quendra::provisioning {
namespace {

TEST(ModemTable, The_third_modem_alone_is_dialled_as_a_vpn) {
  for (std::int16_t number = 0; number < 5; ++number) {
    const ConnectionKind kind = number == 2 ? ConnectionKind::Vpn : ConnectionKind::Pppoe;
    ASSERT_TRUE(FindModem(number)) << number;
    EXPECT_EQ(FindModem(number)->kind, kind) << number;
  }
}

TEST(ModemTable, The_fifth_modem_alone_goes_by_way_of_a_temporary_entry) {
  for (std::int16_t number = 0; number < 5; ++number)
    EXPECT_EQ(FindModem(number)->viaTemporaryEntry, number == 4) << number;
}

TEST(ModemTable, No_other_number_is_a_modem) {
  for (const int number : {-32768, -1, 5, 32767})
    EXPECT_EQ(FindModem(static_cast<std::int16_t>(number)), nullptr) << number;
}

} // namespace
} // namespace quendra::provisioning
