#include "platform/icmp/EchoReply.h"

#include "platform/icmp/IcmpNumbers.h"
#include "runtime/ByteFields.h"

#include <gtest/gtest.h>

#include <array>

namespace quendra::platform {

namespace {

EchoReply Reply() { return {Ipv4Address::FromHost(0x0A000001), 11013, 258, 63, 5, {'a', 'b', 'c'}}; }

TEST(EchoReplyTest, The_record_has_its_published_layout_and_the_data_stands_behind_it) {
  std::array<std::uint8_t, 32> buffer;
  buffer.fill(0xEE);
  ASSERT_TRUE(PutEchoReply(buffer, Reply()));
  const std::array<std::uint8_t, 32> expected{10, 0, 0, 1, 0x05, 0x2B, 0, 0, 2, 1, 0, 0, 3,   0,   0,   0,
                                              0,  0, 0, 0, 63,   5,    0, 0, 0, 0, 0, 0, 'a', 'b', 'c', 0xEE};
  EXPECT_EQ(buffer, expected);
}

TEST(EchoReplyTest, Data_that_does_not_fit_is_cut_and_the_record_says_how_much_is_there) {
  std::array<std::uint8_t, kEchoReplySize + 2> buffer{};
  ASSERT_TRUE(PutEchoReply(buffer, Reply()));
  EXPECT_EQ(Little16(buffer, kReplyDataSize), 2);
  EXPECT_EQ(buffer.back(), 'b');
}

TEST(EchoReplyTest, A_buffer_that_is_too_small_for_the_record_stays_as_it_was) {
  std::array<std::uint8_t, kEchoReplySize - 1> buffer{};
  EXPECT_FALSE(PutEchoReply(buffer, Reply()));
  EXPECT_EQ(buffer, decltype(buffer){});
}

TEST(EchoReplyTest, A_failure_is_an_empty_record_with_a_status) {
  std::array<std::uint8_t, kEchoReplySize> buffer;
  buffer.fill(0xEE);
  ASSERT_TRUE(PutEchoFailure(buffer, kEchoTimedOut));
  std::array<std::uint8_t, kEchoReplySize> expected{};
  PutLittle32(expected, kReplyStatus, 11010);
  EXPECT_EQ(buffer, expected);
}

} // namespace

} // namespace quendra::platform
