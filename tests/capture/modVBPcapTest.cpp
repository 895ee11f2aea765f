#include "capture/modVBPcap.h"

#include "capture/TestFrames.h"

#include <gtest/gtest.h>

namespace quendra::capture {
namespace {

TEST(WordFromBytes, Puts_the_high_byte_first) { EXPECT_EQ(modVBPcap::WordFromBytes(0x08, 0x00), 2048); }

TEST(WordFromBytes, Is_negative_when_the_high_byte_has_bit_7_set) {
  EXPECT_EQ(modVBPcap::WordFromBytes(0xFF, 0xFF), -1);
  EXPECT_EQ(modVBPcap::WordFromBytes(0x80, 0x00), -32768);
  EXPECT_EQ(modVBPcap::WordFromBytes(0xC3, 0x50), -15536);
}

TEST(WordFromBytes, Has_a_twin_that_takes_the_bytes_in_the_opposite_order) {
  EXPECT_EQ(modVBPcap::WordFromLowHigh(0x00, 0x08), 2048);
}

TEST(LongFromWords, Takes_both_words_without_their_sign) {
  EXPECT_EQ(modVBPcap::LongFromWords(-1, 0), 0x0000FFFF);
  EXPECT_EQ(modVBPcap::LongFromWords(2, 1), 0x00010002);
  EXPECT_EQ(modVBPcap::LongFromWords(-1, -1), -1);
  EXPECT_EQ(modVBPcap::LongFromWords(0, -32768), INT32_MIN);
}

const Bytes kMac{0x00, 0x0C, 0x29, 0x3A, 0x10, 0xF2};

TEST(HexRun, Writes_two_capital_digits_a_byte_with_colons_between_them) {
  EXPECT_EQ(modVBPcap::HexRun(FrameOf(kMac), 0, 5), u"00:0C:29:3A:10:F2");
  EXPECT_EQ(modVBPcap::HexRun(FrameOf(kMac), 3, 0), u"3A");
}

TEST(HexRun, Is_0_when_the_run_passes_the_upper_bound) {
  EXPECT_EQ(modVBPcap::HexRun(FrameOf(kMac), 1, 4), u"0C:29:3A:10:F2");
  EXPECT_EQ(modVBPcap::HexRun(FrameOf(kMac), 1, 5), u"0");
}

TEST(HexRun, Is_0_when_the_run_begins_below_the_lower_bound) {
  EXPECT_EQ(modVBPcap::HexRun(FrameOf(kMac), -1, 5), u"0");
}

TEST(HexRun, Overflows_where_an_index_passes_16_bits) {
  try {
    modVBPcap::HexRun(FrameOf(kMac), 32767, 5);
    FAIL() << "no fault";
  } catch (const Fault& fault) {
    EXPECT_EQ(fault.number, Fault::kOverflow);
  }
}

} // namespace
} // namespace quendra::capture
