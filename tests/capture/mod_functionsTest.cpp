#include "capture/mod_functions.h"

#include "capture/TestFrames.h"

#include <bit>
#include <gtest/gtest.h>

namespace quendra::capture {
namespace {

TEST(IpFromLong, Writes_the_bytes_in_memory_order_without_leading_zeros) {
  EXPECT_EQ(
      mod_functions::IpFromLong(std::bit_cast<std::uint32_t>(std::array<std::uint8_t, 4>{10, 0, 0, 138})),
      u"10.0.0.138");
}

TEST(IpFromLong, Writes_high_addresses_without_a_sign) {
  EXPECT_EQ(mod_functions::IpFromLong(0xFFFFFFFF), u"255.255.255.255");
  EXPECT_EQ(mod_functions::IpFromLong(0), u"0.0.0.0");
}

const Bytes kBytes{0x01, 0x02, 0x03, 0x84, 0x05};

TEST(ReadBytes, Copies_in_memory_order) {
  EXPECT_EQ(mod_functions::ReadBytes(FrameOf(kBytes), 0, 4), 0x84030201u);
  EXPECT_EQ(mod_functions::ReadBytes(FrameOf(kBytes), 1, 2), 0x0302u);
  EXPECT_EQ(mod_functions::ReadBytes(FrameOf(kBytes), 1, 0), 0u);
}

TEST(ReadBytes, Copies_at_most_four_bytes) {
  EXPECT_EQ(mod_functions::ReadBytes(FrameOf(kBytes), 0, 5), 0x84030201u);
  EXPECT_EQ(mod_functions::ReadBytes(FrameOf(kBytes), 1, 9), 0x05840302u);
}

TEST(ReadBytes, Raises_fault_9_beyond_the_array) {
  EXPECT_THROW(mod_functions::ReadBytes(FrameOf(kBytes), 2, 4), Fault);
  EXPECT_THROW(mod_functions::ReadBytes(FrameOf(kBytes), -1, 1), Fault);
}

TEST(HexRunTwin, Writes_as_its_elder_does) {
  EXPECT_EQ(mod_functions::HexRun(FrameOf(kBytes), 2, 2), u"03:84:05");
}

TEST(HexRunTwin, Tests_no_bounds_first_and_raises_fault_9_beyond_them) {
  try {
    mod_functions::HexRun(FrameOf(kBytes), 2, 3);
    FAIL() << "no fault";
  } catch (const Fault& fault) {
    EXPECT_EQ(fault.number, Fault::kSubscript);
  }
}

TEST(HexRunTwin, Takes_indexes_of_32_bits) {
  const Bytes many(40000, 0xAB);
  EXPECT_EQ(mod_functions::HexRun(FrameOf(many), 39998, 1), u"AB:AB");
}

} // namespace
} // namespace quendra::capture
