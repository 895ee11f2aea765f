#include "diagnostics/mdlPing.h"

#include "platform/simulated/SimulatedMachine.h"

#include <gtest/gtest.h>

namespace quendra::diagnostics {

namespace {

/// A subscriber's machine with a modem that may answer.
class Ping : public testing::Test {
 protected:
  std::int32_t Send(const Text& address) { return ping.Ping(address, reply); }

  platform::simulated::SimulatedMachine machine;
  mdlPing ping{machine.icmp};
  mdlPing::Reply reply{};
};

TEST_F(Ping, A_target_that_answers_gives_0_and_fills_the_callers_record) {
  machine.icmp.RouteTo("192.168.0.1").Target(4);
  EXPECT_EQ(Send(u"192.168.0.1"), 0);
  EXPECT_EQ(Little32(reply, platform::kReplyAddress),
            platform::simulated::AddressOf("192.168.0.1").InMemory());
  EXPECT_EQ(Little32(reply, platform::kReplyRoundTripTime), 4u);
}

TEST_F(Ping, One_echo_says_hello_without_options_for_a_second_with_a_buffer_of_280_bytes) {
  Send(u"10.0.0.138");
  ASSERT_EQ(machine.icmp.Echoes.size(), 1u);
  const auto& echo = machine.icmp.Echoes.front();
  EXPECT_EQ(echo.address, platform::simulated::AddressOf("10.0.0.138"));
  EXPECT_EQ(echo.data, "hello");
  EXPECT_TRUE(echo.options.empty());
  EXPECT_EQ(echo.limit, 1000u);
  EXPECT_EQ(echo.bufferSize, 280u);
}

TEST_F(Ping, A_target_that_does_not_answer_gives_the_status_of_a_time_out) {
  EXPECT_EQ(Send(u"10.0.0.138"), 11010);
}

TEST_F(Ping, A_target_that_cannot_be_reached_gives_its_status) {
  machine.icmp.RouteTo("10.0.0.1").TargetWithStatus(11003);
  EXPECT_EQ(Send(u"10.0.0.1"), 11003);
}

TEST_F(Ping, A_record_of_an_earlier_ping_does_not_show_through_a_time_out) {
  machine.icmp.RouteTo("10.0.0.1").Target();
  Send(u"10.0.0.1");
  EXPECT_EQ(Send(u"10.0.0.138"), 11010);
  EXPECT_EQ(Little32(reply, platform::kReplyAddress), 0u);
}

TEST_F(Ping, What_is_no_address_gives_minus_1_and_opens_no_handle) {
  for (const char16_t* text : {u"", u"localhost", u"10.0.0.256", u"0.0.0.0", u"0", u"255.255.255.255"})
    EXPECT_EQ(Send(text), -1) << ToUtf8(text);
  EXPECT_TRUE(machine.icmp.Echoes.empty());
  EXPECT_EQ(reply, mdlPing::Reply{});
}

TEST_F(Ping, Names_are_not_resolved_even_if_they_could_be) {
  machine.hostNames.Add("modem", {"10.0.0.138"});
  machine.icmp.RouteTo("10.0.0.138").Target();
  EXPECT_EQ(Send(u"modem"), -1);
}

TEST_F(Ping, Without_a_handle_it_gives_minus_1) {
  machine.icmp.RouteTo("10.0.0.138").Target();
  machine.icmp.FailHandle = true;
  EXPECT_EQ(Send(u"10.0.0.138"), -1);
}

TEST_F(Ping, The_handle_is_closed_after_success_and_failure) {
  machine.icmp.RouteTo("10.0.0.138").Target();
  Send(u"10.0.0.138");
  Send(u"10.0.0.1");
  EXPECT_EQ(machine.icmp.CountOpen(), 0u);
}

} // namespace

} // namespace quendra::diagnostics
