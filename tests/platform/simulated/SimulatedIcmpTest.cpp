#include "platform/simulated/SimulatedMachine.h"

#include "runtime/ByteFields.h"

#include <gtest/gtest.h>

#include <array>

namespace quendra::platform::simulated {

namespace {

/// A machine with an open handle and a reply record.
class SimulatedIcmpTest : public testing::Test {
 protected:
  std::uint32_t Send(std::uint8_t ttl, std::uint32_t limit = 1000) {
    const std::array<std::uint8_t, kEchoOptionsSize> options{ttl};
    return machine.icmp.IcmpSendEcho(handle, {AddressOf("192.0.2.1"), data, options}, reply, limit);
  }
  std::string From() const { return Ipv4Address::FromMemory(Little32(reply, kReplyAddress)).AsAscii(); }
  std::uint32_t Status() const { return Little32(reply, kReplyStatus); }
  std::uint32_t RoundTrip() const { return Little32(reply, kReplyRoundTripTime); }

  SimulatedMachine machine;
  IcmpHandle handle = machine.icmp.IcmpCreateFile();
  std::array<std::uint8_t, 2> data{'h', 'i'};
  std::array<std::uint8_t, 40> reply{};
};

TEST_F(SimulatedIcmpTest, Each_router_answers_the_echo_that_ends_at_it_and_the_target_all_that_go_further) {
  machine.icmp.RouteTo("192.0.2.1").Hop("10.0.0.1", 5).Hop("10.0.1.1", 7).Target(12);
  EXPECT_EQ(Send(2), 1u);
  EXPECT_EQ(From(), "10.0.1.1");
  EXPECT_EQ(Status(), kEchoTtlExpiredInTransit);
  EXPECT_EQ(RoundTrip(), 7u);
  for (const std::uint8_t ttl : {3, 255}) {
    EXPECT_EQ(Send(ttl), 1u);
    EXPECT_EQ(From(), "192.0.2.1");
    EXPECT_EQ(Status(), kEchoSuccess);
    EXPECT_EQ(TextOf(std::span(reply).subspan(kEchoReplySize, 2)), "hi");
  }
}

TEST_F(SimulatedIcmpTest, An_echo_moves_the_clock_by_its_delay_or_by_its_limit) {
  machine.icmp.RouteTo("192.0.2.1").SilentHop().Target(12);
  const std::uint32_t before = machine.system.GetTickCount();
  EXPECT_EQ(Send(2), 1u);
  EXPECT_EQ(machine.system.GetTickCount() - before, 12u);
  EXPECT_EQ(Send(1, 800), 0u);
  EXPECT_EQ(Status(), kEchoTimedOut);
  EXPECT_EQ(machine.system.GetTickCount() - before, 812u);
}

TEST_F(SimulatedIcmpTest, A_reply_that_takes_as_long_as_the_limit_comes_too_late) {
  machine.icmp.RouteTo("192.0.2.1").Target(1000);
  EXPECT_EQ(Send(9, 1000), 0u);
  EXPECT_EQ(Send(9, 1001), 1u);
}

TEST_F(SimulatedIcmpTest, Lost_echoes_time_out_and_the_next_one_arrives) {
  machine.icmp.RouteTo("192.0.2.1").Target().Lose(2);
  EXPECT_EQ(Send(9), 0u);
  EXPECT_EQ(Send(9), 0u);
  EXPECT_EQ(Send(9), 1u);
}

TEST_F(SimulatedIcmpTest, A_target_may_refuse_with_a_status_of_its_own) {
  machine.icmp.RouteTo("192.0.2.1").TargetWithStatus(kEchoHostUnreachable);
  EXPECT_EQ(Send(9), 1u);
  EXPECT_EQ(Status(), kEchoHostUnreachable);
}

TEST_F(SimulatedIcmpTest, Where_no_route_leads_nobody_answers) {
  EXPECT_EQ(Send(9), 0u);
  EXPECT_EQ(Status(), kEchoTimedOut);
}

TEST_F(SimulatedIcmpTest, A_handle_is_closed_once_and_sends_nothing_afterwards) {
  EXPECT_TRUE(machine.icmp.IcmpCloseHandle(handle));
  EXPECT_FALSE(machine.icmp.IcmpCloseHandle(handle));
  EXPECT_EQ(Send(9), 0u);
  EXPECT_TRUE(machine.icmp.Echoes.empty());
}

TEST_F(SimulatedIcmpTest, Without_the_right_there_is_no_handle) {
  machine.icmp.LackedRight = "the right to ping";
  EXPECT_EQ(machine.icmp.IcmpCreateFile(), kNoIcmp);
  EXPECT_EQ(machine.icmp.MissingRight(), "the right to ping");
}

} // namespace

} // namespace quendra::platform::simulated
