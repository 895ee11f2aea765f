#include "platform/BehaviourFixture.h"
#include "platform/icmp/Icmp.h"
#include "runtime/ByteFields.h"

#include <array>

namespace quendra::platform {
namespace {

constexpr Ipv4Address kSelf = Ipv4Address::FromHost(0x7F000001);

struct IcmpBehaviourTest : BehaviourTest {
  Icmp& icmp = machine.icmp;
  const IcmpHandle handle = icmp.IcmpCreateFile();

  ~IcmpBehaviourTest() override { icmp.IcmpCloseHandle(handle); }

  /// Sends one to this machine itself.
  std::uint32_t EchoToSelf(std::span<std::uint8_t> reply) {
    const std::array<std::uint8_t, 5> data{'h', 'e', 'l', 'l', 'o'};
    return icmp.IcmpSendEcho(handle, {kSelf, data, {}}, reply, 2000);
  }
};

TEST_P(IcmpBehaviourTest, An_echo_to_the_own_machine_comes_back_with_its_data) {
  ASSERT_NE(handle, kNoIcmp);
  EXPECT_EQ(icmp.MissingRight(), "");
  std::array<std::uint8_t, 280> reply{};

  EXPECT_EQ(EchoToSelf(reply), 1U);

  EXPECT_EQ(Little32(reply, kReplyAddress), kSelf.InMemory());
  EXPECT_EQ(Little32(reply, kReplyStatus), kEchoSuccess);
  EXPECT_EQ(Little16(reply, kReplyDataSize), 5);
  EXPECT_EQ(std::string(reply.begin() + kEchoReplySize, reply.begin() + kEchoReplySize + 5), "hello");
}

TEST_P(IcmpBehaviourTest, A_buffer_too_small_for_a_reply_stays_as_it_was) {
  std::array<std::uint8_t, kEchoReplySize - 1> reply{};
  EXPECT_EQ(EchoToSelf(reply), 0U);
  EXPECT_EQ(reply, decltype(reply){});
}

TEST_P(IcmpBehaviourTest, An_echo_handle_is_closed_once_and_sends_nothing_afterwards) {
  EXPECT_TRUE(icmp.IcmpCloseHandle(handle));
  std::array<std::uint8_t, 280> reply{};

  EXPECT_EQ(EchoToSelf(reply), 0U);

  EXPECT_EQ(Little32(reply, kReplyStatus), kEchoBadRequest);
  EXPECT_FALSE(icmp.IcmpCloseHandle(handle));
  EXPECT_FALSE(icmp.IcmpCloseHandle(kNoIcmp));
}

INSTANTIATE_TEST_SUITE_P(, IcmpBehaviourTest, kEveryBackend, NameOfBackend);

} // namespace
} // namespace quendra::platform
