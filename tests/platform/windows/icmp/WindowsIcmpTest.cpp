#include "platform/windows/icmp/WindowsIcmp.h"

#include "runtime/ByteFields.h"

#include <gtest/gtest.h>

#include <array>
#include <vector>

namespace quendra::platform::windows {

namespace {

constexpr Ipv4Address kSelf = Ipv4Address::FromHost(0x7F000001);

TEST(WindowsIcmpTest, An_echo_with_options_and_without_data_is_answered) {
  WindowsIcmp icmp;
  const IcmpHandle handle = icmp.IcmpCreateFile();
  ASSERT_NE(handle, kNoIcmp);
  std::array<std::uint8_t, kEchoOptionsSize> options{};
  options[kOptionsTtl] = 5;
  std::array<std::uint8_t, 64> reply{};
  EXPECT_EQ(icmp.IcmpSendEcho(handle, {kSelf, {}, options}, reply, 2000), 1u);
  EXPECT_EQ(Little32(reply, kReplyStatus), kEchoSuccess);
  EXPECT_EQ(Little16(reply, kReplyDataSize), 0);
  EXPECT_TRUE(icmp.IcmpCloseHandle(handle));
}

TEST(WindowsIcmpTest, More_data_than_a_message_carries_is_a_bad_request) {
  WindowsIcmp icmp;
  const IcmpHandle handle = icmp.IcmpCreateFile();
  const std::vector<std::uint8_t> data(65'508);
  std::array<std::uint8_t, kEchoReplySize> reply{};
  EXPECT_EQ(icmp.IcmpSendEcho(handle, {kSelf, data, {}}, reply, 2000), 0u);
  EXPECT_EQ(Little32(reply, kReplyStatus), kEchoBadRequest);
  icmp.IcmpCloseHandle(handle);
}

TEST(WindowsIcmpTest, Data_that_does_not_fit_behind_the_record_is_cut) {
  WindowsIcmp icmp;
  const IcmpHandle handle = icmp.IcmpCreateFile();
  const std::array<std::uint8_t, 4> data{'a', 'b', 'c', 'd'};
  std::array<std::uint8_t, kEchoReplySize + 2> reply{};
  EXPECT_EQ(icmp.IcmpSendEcho(handle, {kSelf, data, {}}, reply, 2000), 1u);
  EXPECT_EQ(Little16(reply, kReplyDataSize), 2);
  EXPECT_EQ(reply.back(), 'b');
  icmp.IcmpCloseHandle(handle);
}

} // namespace

} // namespace quendra::platform::windows
