#include "diagnostics/mdlTracert.h"

#include "forms/Form.h"
#include "forms/controls/CommandButton.h"
#include "forms/controls/TextBox.h"
#include "forms/headless/HeadlessDesktop.h"
#include "platform/simulated/SimulatedMachine.h"
#include "platform/unavailable/UnavailableSockets.h"

#include <gtest/gtest.h>

namespace quendra::diagnostics {

namespace {

using Box = forms::headless::HeadlessDesktop::Box;
using platform::simulated::AddressOf;

struct PanelForm : forms::Form {
  PanelForm() : Form(u"frmPanel") {}
  void Design() override {}
  forms::CommandButton start{*this, u"frmSurf_cmdStart"};
  forms::TextBox result{*this, u"frmSurf_txtPingResult"};
};

const Box kQuestionAtTheEnd{u"המעקב הסתיים. \r\nהאם לשלוח דו\"ח?", 0x180024, u"זלמר בינלאומי@נט"};

/// A socket library that keeps which of its versions was asked for.
struct AskedSockets : platform::unavailable::UnavailableSockets {
  std::int32_t WSAStartup(std::uint16_t asked) override {
    version = asked;
    return 0;
  }
  std::uint16_t version = 0;
};

/// Names that keep what was asked for.
struct AskedHostNames : platform::simulated::SimulatedHostNames {
  std::optional<std::vector<platform::Ipv4Address>> gethostbyname(const std::string& asked) override {
    name = asked;
    return SimulatedHostNames::gethostbyname(asked);
  }
  std::string name;
};

/// The panel as its button leaves it, and a web host "www.example.com" at 192.0.2.1.
class Trace : public testing::Test {
 protected:
  Trace() {
    machine.hostNames.Add("www.example.com", {"192.0.2.1"});
    form.start.Caption = u"המתן";
    form.start.Enabled = false;
  }

  platform::simulated::ScriptedRoute& Route() { return machine.icmp.RouteTo("192.0.2.1"); }
  /// The report, with a bar for each line break.
  std::string Run(const Text& host = u"www.example.com") {
    tracert.Trace(host, form.result);
    return Report();
  }
  std::string Report() { return ToUtf8(Replaced(form.result.Value(), u"\r\n", u"|")); }
  /// The report of a trace whose first listed router answers after that long.
  std::string LineOfDelay(std::uint32_t delay) {
    machine.icmp.RouteTo("192.0.2.1") = {};
    Route().Hop("10.0.0.1").Target(delay);
    return Run();
  }
  bool IsReady() { return form.start.Caption() == u"התחל" && form.start.Enabled; }

  platform::simulated::SimulatedMachine machine;
  forms::headless::HeadlessDesktop desktop;
  PanelForm form;
  mdlTracert tracert{{machine.sockets, machine.hostNames, machine.icmp}, desktop, form.start};
};

const std::string kHead = "Tracing to www.example.com (192.0.2.1)...|";

TEST_F(Trace, It_lists_the_hops_behind_the_first_router_and_ends_with_the_target) {
  Route().Hop("10.0.0.138").Hop("10.1.0.1", 12).Hop("10.2.0.1", 9).Target(30);
  EXPECT_EQ(Run(), kHead + "Hop #\t1\t12 ms\t10.1.0.1|Hop #\t2\t<10 ms\t10.2.0.1|Hop #\t3\t30 ms\t192.0.2.1|"
                           "|Trace Route Complete");
  EXPECT_TRUE(IsReady());
}

TEST_F(Trace, An_echo_is_32_letters_a_with_its_TTL_alone_in_the_options) {
  Route().Hop("10.0.0.138").Hop("10.1.0.1").Target();
  Run();
  ASSERT_EQ(machine.icmp.Echoes.size(), 2u);
  for (std::size_t i = 0; i < 2; ++i) {
    const auto& echo = machine.icmp.Echoes[i];
    EXPECT_EQ(echo.address, AddressOf("192.0.2.1"));
    EXPECT_EQ(echo.data, std::string(32, 'a'));
    EXPECT_EQ(echo.options,
              (std::vector<std::uint8_t>{static_cast<std::uint8_t>(2 + i), 0, 0, 0, 0, 0, 0, 0}));
    EXPECT_EQ(echo.bufferSize, 295u);
    EXPECT_EQ(echo.limit, 2400u);
  }
}

TEST_F(Trace, A_target_at_the_second_hop_ends_it_with_one_line) {
  Route().Hop("10.0.0.138").Target(3);
  EXPECT_EQ(Run(), kHead + "Hop #\t1\t<10 ms\t192.0.2.1||Trace Route Complete");
}

TEST_F(Trace, A_target_next_door_answers_the_first_echo_too) {
  Route().Target(3);
  EXPECT_EQ(Run(), kHead + "Hop #\t1\t<10 ms\t192.0.2.1||Trace Route Complete");
}

TEST_F(Trace, The_time_is_told_in_three_ways) {
  struct Case {
    std::uint32_t delay;
    const char* text;
  };
  for (const Case& tested :
       {Case{0, "<10 ms"}, Case{9, "<10 ms"}, Case{10, "10 ms"}, Case{11, "11 ms"}, Case{1199, "1199 ms"},
        Case{1200, "1200 ms"}, Case{1201, ">1200 ms"}, Case{2399, ">1200 ms"}})
    EXPECT_EQ(LineOfDelay(tested.delay),
              kHead + "Hop #\t1\t" + tested.text + "\t192.0.2.1||Trace Route Complete");
}

TEST_F(Trace, A_silent_hop_in_the_middle_ends_it_after_the_tenth_try_though_the_target_would_answer) {
  Route().Hop("10.0.0.138").Hop("10.1.0.1").SilentHop().Target();
  EXPECT_EQ(Run(), kHead + "Hop #\t1\t<10 ms\t10.1.0.1||Request timed out!!!");
  ASSERT_EQ(machine.icmp.Echoes.size(), 11u);
  for (std::size_t i = 1; i < 11; ++i) EXPECT_EQ(machine.icmp.Echoes[i].ttl, 3);
  EXPECT_EQ(tracert.TraceTimeouts, 10);
  EXPECT_TRUE(IsReady());
}

TEST_F(Trace, A_reply_after_nine_losses_goes_on_and_the_count_begins_anew) {
  Route().Hop("10.0.0.138").Hop("10.1.0.1").Target().Lose(9);
  desktop.OnYield = [&] {
    // The first line stands: nine more are lost before the next hop.
    if (machine.icmp.Echoes.size() == 10) Route().Lose(9);
  };
  EXPECT_EQ(Run(), kHead + "Hop #\t1\t<10 ms\t10.1.0.1|Hop #\t2\t<10 ms\t192.0.2.1||Trace Route Complete");
  EXPECT_EQ(machine.icmp.Echoes.size(), 20u);
  EXPECT_EQ(tracert.TraceTimeouts, 0);
}

TEST_F(Trace, A_lost_echo_is_tried_again_with_the_same_TTL) {
  Route().Hop("10.0.0.138").Hop("10.1.0.1").Target().Lose(1);
  Run();
  std::vector<int> ttls;
  for (const auto& echo : machine.icmp.Echoes) ttls.push_back(echo.ttl);
  EXPECT_EQ(ttls, (std::vector<int>{2, 2, 3}));
}

TEST_F(Trace, Time_outs_of_an_earlier_trace_do_not_count) {
  Route().Hop("10.0.0.138").SilentHop();
  Run();
  machine.icmp.Echoes.clear();
  Run();
  EXPECT_EQ(machine.icmp.Echoes.size(), 10u);
}

TEST_F(Trace, Any_status_of_a_reply_makes_a_line) {
  Route().Hop("10.0.0.138").TargetWithStatus(platform::kEchoHostUnreachable, 15);
  EXPECT_EQ(Run(), kHead + "Hop #\t1\t15 ms\t192.0.2.1||Trace Route Complete");
}

TEST_F(Trace, A_route_that_never_ends_stops_at_TTL_255_and_nothing_is_appended) {
  for (int hop = 1; hop <= 300; ++hop) Route().Hop("10.1." + std::to_string(hop / 100) + ".1");
  const std::string report = Run();
  EXPECT_EQ(machine.icmp.Echoes.size(), 254u);
  EXPECT_EQ(machine.icmp.Echoes.back().ttl, 255);
  EXPECT_TRUE(report.ends_with("Hop #\t254\t<10 ms\t10.1.2.1|")) << report;
  EXPECT_EQ(desktop.Boxes, std::vector<Box>{kQuestionAtTheEnd});
}

TEST_F(Trace, The_dotted_address_of_the_target_ends_as_its_name_does) {
  machine.hostNames.Add("192.0.2.1", {"192.0.2.1"});
  Route().Hop("10.0.0.138").Hop("10.1.0.1").Target();
  EXPECT_EQ(Run(u"192.0.2.1"), "Tracing to 192.0.2.1 (192.0.2.1)...|Hop #\t1\t<10 ms\t10.1.0.1|"
                               "Hop #\t2\t<10 ms\t192.0.2.1||Trace Route Complete");
}

TEST_F(Trace, A_hop_that_equals_the_host_text_ends_it_also_when_the_name_leads_elsewhere) {
  machine.hostNames.Add("10.1.0.1", {"192.0.2.1"});
  Route().Hop("10.0.0.138").Hop("10.1.0.1").Target();
  EXPECT_EQ(Run(u"10.1.0.1"),
            "Tracing to 10.1.0.1 (192.0.2.1)...|Hop #\t1\t<10 ms\t10.1.0.1||Trace Route Complete");
}

TEST_F(Trace, Of_several_addresses_the_first_is_traced) {
  machine.hostNames.Add("www.example.com", {"192.0.2.1", "192.0.2.9"});
  Route().Hop("10.0.0.138").Target();
  EXPECT_TRUE(Run().starts_with(kHead));
  EXPECT_EQ(machine.icmp.Echoes.back().address, AddressOf("192.0.2.1"));
}

TEST_F(Trace, A_name_that_cannot_be_resolved_ends_in_the_wrong_all_clear_after_the_first_echo) {
  EXPECT_EQ(Run(u"no.such.host"), "Tracing to no.such.host ()...||Trace Route Complete");
  ASSERT_EQ(machine.icmp.Echoes.size(), 1u);
  EXPECT_EQ(machine.icmp.Echoes.front().address, platform::kNoAddress);
  EXPECT_TRUE(IsReady());
}

TEST_F(Trace, A_name_that_cannot_be_resolved_goes_on_as_long_as_somebody_answers) {
  machine.icmp.RouteTo("255.255.255.255").Hop("10.0.0.138").Hop("10.1.0.1").SilentHop();
  EXPECT_EQ(Run(u"no.such.host"),
            "Tracing to no.such.host ()...|Hop #\t1\t<10 ms\t10.1.0.1||Request timed out!!!");
}

TEST_F(Trace, A_name_service_that_fails_gives_the_same_all_clear) {
  machine.hostNames.FailAddresses = true;
  EXPECT_EQ(Run(), "Tracing to www.example.com ()...||Trace Route Complete");
}

TEST_F(Trace, It_asks_for_version_1_1_of_the_socket_library_and_for_the_name_with_its_NUL) {
  AskedSockets sockets;
  AskedHostNames hostNames;

  mdlTracert({sockets, hostNames, machine.icmp}, desktop, form.start).Trace(u"modem", form.result);

  EXPECT_EQ(sockets.version, 0x0101);
  EXPECT_EQ(hostNames.name, std::string("modem\0", 6));
}

TEST_F(Trace, Without_the_socket_library_it_says_so_asks_nothing_and_cleans_nothing) {
  machine.sockets.Fail("WSAStartup", 10091);
  form.result.Value = u"before";
  EXPECT_EQ(Run(), "before|Unable to initialize the Windows Sockets");
  EXPECT_TRUE(desktop.Boxes.empty());
  EXPECT_TRUE(machine.Calls.empty());
  EXPECT_TRUE(machine.icmp.Echoes.empty());
  EXPECT_TRUE(IsReady());
}

TEST_F(Trace, Without_a_handle_it_says_so_and_still_asks_at_the_end) {
  machine.icmp.FailHandle = true;
  EXPECT_EQ(Run(), "|Unable to Open an Icmp File Handle");
  EXPECT_EQ(desktop.Boxes, std::vector<Box>{kQuestionAtTheEnd});
  EXPECT_TRUE(IsReady());
}

TEST_F(Trace, A_missing_right_is_named_on_a_line_of_its_own) {
  machine.icmp.LackedRight = "CAP_NET_RAW";
  EXPECT_EQ(Run(), "|Unable to Open an Icmp File Handle|אין הרשאה לשלוח מנות ICMP: חסרה CAP_NET_RAW");
}

TEST_F(Trace, A_failed_clean_up_has_a_box_before_the_question) {
  Route().Hop("10.0.0.138").Target();
  machine.sockets.Fail("WSACleanup", 10093);
  Run();
  const Box failed{u"Windows Sockets error occurred during Cleanup.", 0x30, u"Quendra"};
  EXPECT_EQ(desktop.Boxes, (std::vector<Box>{failed, kQuestionAtTheEnd}));
}

TEST_F(Trace, The_library_is_started_and_cleaned_up_once_and_a_socket_of_others_lives_on) {
  Route().Hop("10.0.0.138").Target();
  machine.sockets.WSAStartup(257);
  const auto socket = machine.sockets.socket(platform::kInternetFamily, platform::kStreamSocket, 6);
  Run();
  EXPECT_EQ(machine.Calls, std::vector<std::string>{"WSACleanup"});
  EXPECT_EQ(machine.sockets.closesocket(socket), 0);
}

TEST_F(Trace, Neither_answer_to_the_question_changes_anything) {
  Route().Hop("10.0.0.138").Target();
  for (const int answer : {6, 7}) {
    desktop.AnswerNextBox(answer);
    EXPECT_EQ(Run(), kHead + "Hop #\t1\t<10 ms\t192.0.2.1||Trace Route Complete");
    EXPECT_TRUE(IsReady());
  }
}

TEST_F(Trace, The_button_stays_disabled_until_the_question_is_answered) {
  Route().Hop("10.0.0.138").Target();
  bool wasReady = true;
  desktop.OnBox = [&] { wasReady = IsReady(); };
  Run();
  EXPECT_FALSE(wasReady);
  EXPECT_TRUE(IsReady());
}

TEST_F(Trace, Messages_are_processed_after_each_echo_answered_or_not) {
  Route().Hop("10.0.0.138").Hop("10.1.0.1").Target().Lose(3);
  std::vector<std::size_t> echoesAtYield;
  desktop.OnYield = [&] { echoesAtYield.push_back(machine.icmp.Echoes.size()); };
  Run();
  EXPECT_EQ(echoesAtYield, (std::vector<std::size_t>{1, 2, 3, 4, 5}));
}

TEST_F(Trace, A_line_stands_in_the_box_when_messages_are_processed) {
  Route().Hop("10.0.0.138").Hop("10.1.0.1").Target();
  std::string seen;
  desktop.OnYield = [&] {
    if (seen.empty()) seen = Report();
  };
  Run();
  EXPECT_EQ(seen, kHead + "Hop #\t1\t<10 ms\t10.1.0.1|");
}

TEST_F(Trace, The_end_of_the_program_between_two_echoes_unwinds_it_and_closes_its_handle) {
  Route().Hop("10.0.0.138").Hop("10.1.0.1").Target();
  desktop.OnYield = [&] { desktop.Post([&] { desktop.End(); }); };
  desktop.Dispatch([&] { tracert.Trace(u"www.example.com", form.result); });
  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 0);
  EXPECT_EQ(machine.icmp.Echoes.size(), 1u);
  EXPECT_EQ(machine.icmp.CountOpen(), 0u);
  EXPECT_TRUE(desktop.Boxes.empty());
  EXPECT_EQ(Report(), kHead + "Hop #\t1\t<10 ms\t10.1.0.1|");
}

TEST_F(Trace, The_handle_is_closed_at_every_end) {
  Route().Hop("10.0.0.138").Target();
  Run();
  Run(u"no.such.host");
  EXPECT_EQ(machine.icmp.CountOpen(), 0u);
}

} // namespace

} // namespace quendra::diagnostics
