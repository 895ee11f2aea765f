#include "diagnostics/SurfChecks.h"

#include "diagnostics/SurfFixture.h"

namespace quendra::diagnostics {
namespace {

using SurfChecksTest = SurfTest;

const std::vector<Text> kCaptions = {
    u"DNS תקשורת עם שרת",
    u"Web תקשורת עם שרת",
    u"תקשורת עם שרת דואר נכנס",
    u"תקשורת עם שרת דואר יוצא",
    u"מחיקת קבצי אינטרנט זמניים",
    u"ניצולת מעבד",
    u"ניצולת רשת",
    u"תוכנות שיתוף קבצים",
};
constexpr const char16_t* kEnd = u"הסתיים";

TEST_F(SurfChecksTest, The_first_check_begins_when_the_page_opens_before_the_frame_is_shown) {
  ComeHome();
  bool frameWasShown = true;
  struct Watcher : forms::ListViewObserver {
    explicit Watcher(std::function<void()> onRow) : onRow(std::move(onRow)) {}
    void RowAdded(int) override { onRow(); }
    void RowRemoved(int) override {}
    void RowChanged(int, int) override {}
    void RowsMoved() override {}
    void RowsCleared() override {}
    void ColumnsChanged() override {}
    std::function<void()> onRow;
  } watcher([&] { frameWasShown = page.frameSurfProb.Visible(); });
  List().Observe(&watcher);

  ClickSurf();

  List().Observe(nullptr);
  EXPECT_FALSE(frameWasShown);
  EXPECT_TRUE(page.frameSurfProb.Visible());
  ASSERT_EQ(RowCount(), 1);
  EXPECT_EQ(CaptionOf(1), kCaptions[0]);
}

TEST_F(SurfChecksTest, Eight_checks_run_one_after_another_to_the_end_of_the_list) {
  AllServersAnswer();

  OpenPage();

  ASSERT_EQ(RowCount(), 10);
  for (int row = 1; row <= 8; ++row) EXPECT_EQ(CaptionOf(row), kCaptions[static_cast<std::size_t>(row - 1)]);
  EXPECT_EQ(Row(9).CellCount(), 0);
  EXPECT_EQ(CaptionOf(10), kEnd);
  EXPECT_EQ(checks.Step(), 9);
}

TEST_F(SurfChecksTest, Four_answering_servers_are_four_ticks) {
  AllServersAnswer();

  OpenPage();

  EXPECT_EQ(Icons(5), (std::vector<int>{kTick, kTick, kTick, kTick, kTick}));
}

TEST_F(SurfChecksTest, Only_the_caption_of_the_row_under_way_is_bold_and_that_of_the_end_stays_so) {
  WebByName();
  OpenPage();
  EXPECT_TRUE(Bold(1));
  AllServersAnswer();

  Connection(WebByName()).Send("x");
  Run();

  for (int row = 1; row <= 8; ++row) EXPECT_FALSE(Bold(row)) << row;
  EXPECT_TRUE(Bold(10));
}

TEST_F(SurfChecksTest, The_captions_of_network_checks_have_a_key_and_those_of_local_ones_have_none) {
  AllServersAnswer();

  OpenPage();

  for (int row = 1; row <= 4; ++row) EXPECT_EQ(Row(row).CellKey(2), u"b0") << row;
  for (int row = 5; row <= 8; ++row) EXPECT_EQ(Row(row).CellKey(2), u"") << row;
}

TEST_F(SurfChecksTest, Each_socket_has_the_number_of_its_step_and_all_are_there_from_the_start) {
  OpenPage();

  EXPECT_EQ(checks.Sockets()->ArrayCount(), 8);
  for (std::int16_t index = 1; index <= 8; ++index) EXPECT_TRUE(checks.Sockets()->ArrayIndexInUse(index));
}

TEST_F(SurfChecksTest, Each_server_gets_its_request_to_the_letter) {
  AllServersAnswer();

  OpenPage();

  EXPECT_EQ(Connection(WebByName()).Received, "GET / HTTP/1.0\n\n");
  EXPECT_EQ(Connection(WebByAddress()).Received, "GET / HTTP/1.0\n\n");
  EXPECT_EQ(Connection(IncomingMail()).Received, "USER temp");
  EXPECT_EQ(Connection(OutgoingMail()).Received, "HELO localhost");
}

TEST_F(SurfChecksTest, The_sockets_of_finished_steps_stay_connected_until_the_page_is_left) {
  AllServersAnswer();
  OpenPage();
  for (std::int16_t index = 1; index <= 4; ++index)
    EXPECT_EQ(checks.Sockets()->State(index), foundation::sckConnected) << index;

  desktop.Click(page.surf_lblBack);

  EXPECT_EQ(checks.Sockets(), nullptr);
  EXPECT_TRUE(Connection(WebByName()).Ended);
  EXPECT_EQ(machine.sockets.OpenSockets(), 0);
}

TEST_F(SurfChecksTest, The_first_step_needs_the_name_and_the_second_the_address_alone) {
  AllServersAnswer();
  machine.sockets.FailName(webName, 11001);

  OpenPage();

  EXPECT_EQ(Icon(1), kCross);
  EXPECT_EQ(Detail(1), u"11001 - Host not found.");
  EXPECT_EQ(Icon(2), kTick);
}

TEST_F(SurfChecksTest, A_name_that_nobody_answers_for_is_told_with_its_number) {
  AllServersAnswer();
  machine.sockets.FailName(webName, 11002);

  OpenPage();

  EXPECT_EQ(Detail(1), u"11002 - Nonauthoritative host not found.");
  EXPECT_EQ(Icon(1), kCross);
}

TEST_F(SurfChecksTest, A_look_up_that_never_ends_holds_the_first_step_until_the_page_is_left) {
  machine.sockets.NeverAnswer(webName);
  OpenPage();

  desktop.Advance(24 * 3'600'000);

  EXPECT_EQ(RowCount(), 1);
  EXPECT_EQ(machine.sockets.LookUpsUnderWay(), 1);
  desktop.Click(page.surf_lblBack);
  EXPECT_EQ(machine.sockets.LookUpsUnderWay(), 0);
  EXPECT_FALSE(page.frameSurfProb.Visible());
}

TEST_F(SurfChecksTest, A_refused_connection_shows_number_and_text_in_red_and_a_cross_and_goes_on) {
  AllServersAnswer();
  WebByAddress().Refuse();

  OpenPage();

  EXPECT_EQ(Detail(2), u"10061 - Connection refused.");
  EXPECT_EQ(Row(2).CellColour(1), 255u);
  EXPECT_EQ(Icons(4), (std::vector<int>{kTick, kCross, kTick, kTick}));
  EXPECT_EQ(checks.FailCount(), 1);
  EXPECT_EQ(CaptionOf(10), kEnd);
}

TEST_F(SurfChecksTest, A_connection_that_the_system_gives_up_shows_the_time_out) {
  AllServersAnswer();
  WebByName().Refuse(platform::kConnectionTimedOut);

  OpenPage();

  EXPECT_EQ(Detail(1), u"10060 - Connection timed out.");
  EXPECT_EQ(Icon(1), kCross);
}

TEST_F(SurfChecksTest, A_filtered_port_holds_its_step_without_a_time_limit) {
  AllServersAnswer();
  WebByName().StaySilent();
  OpenPage();

  desktop.Advance(24 * 3'600'000);

  EXPECT_EQ(RowCount(), 1);
  EXPECT_EQ(Icon(1), 0);
}

TEST_F(SurfChecksTest, A_server_that_accepts_and_says_nothing_holds_its_step) {
  AllServersAnswer();
  OpenPage();
  desktop.Click(page.surf_lblBack);
  machine.sockets.Listen("192.0.2.81", 110);
  machine.hostNames.Add(mailName, {"192.0.2.81"});
  machine.hostNames.Add(webName, {"192.0.2.81"});
  machine.sockets.Listen("192.0.2.81", 80);
  ClickSurf();
  Run();

  desktop.Advance(24 * 3'600'000);

  EXPECT_EQ(RowCount(), 1);
  EXPECT_EQ(checks.Step(), 1);
  EXPECT_TRUE(desktop.Click(page.surf_lblBack));
  EXPECT_EQ(checks.Sockets(), nullptr);
}

TEST_F(SurfChecksTest, A_server_that_closes_without_a_byte_leaves_its_row_without_icon_and_is_no_failure) {
  AllServersAnswer();
  machine.sockets.Listen("192.0.2.82", 80).Close();
  machine.sockets.Listen("192.0.2.82", 110).Close();
  machine.sockets.Listen("192.0.2.82", 25).Greet("220\r\n");
  machine.hostNames.Add(webName, {"192.0.2.82"});
  machine.hostNames.Add(mailName, {"192.0.2.82"});

  OpenPage();

  EXPECT_EQ(Icon(1), 0);
  EXPECT_EQ(Detail(1), u"");
  EXPECT_EQ(Icon(2), kTick);
  EXPECT_EQ(Icon(3), 0);
  EXPECT_EQ(Icon(4), kTick);
  EXPECT_EQ(checks.FailCount(), 0);
}

TEST_F(SurfChecksTest, One_byte_is_a_pass_and_so_are_garbage_and_an_error_page) {
  WebByName().Greet("x");
  WebByAddress().Answer({"HTTP/1.0 404 Not Found\r\n\r\n"});
  IncomingMail().Greet(std::string("\0\xFF\x80\x00", 4));
  OutgoingMail().Greet("554 go away\r\n");

  OpenPage();

  EXPECT_EQ(Icons(4), (std::vector<int>{kTick, kTick, kTick, kTick}));
}

TEST_F(SurfChecksTest, What_a_server_said_stays_in_its_socket) {
  AllServersAnswer();

  OpenPage();

  EXPECT_EQ(checks.Sockets()->BytesReceived(std::int16_t{3}), 5);
}

TEST_F(SurfChecksTest, A_server_that_resets_before_it_says_anything_is_a_failure) {
  AllServersAnswer();
  machine.sockets.Listen("192.0.2.83", 80).Reset();
  machine.hostNames.Add(webName, {"192.0.2.83"});
  machine.hostNames.Add(mailName, {"192.0.2.83"});

  OpenPage();

  EXPECT_EQ(Detail(1), u"10054 - Connection reset by peer.");
  EXPECT_EQ(Icon(1), kCross);
}

TEST_F(SurfChecksTest, Data_that_arrives_twice_on_a_socket_adds_one_tick) {
  WebByName();
  WebByAddress();
  OpenPage();
  Connection(WebByName()).Send("one");
  Run();

  Connection(WebByName()).Send("two");
  Run();

  EXPECT_EQ(Row(1).CellCount(), 3);
  EXPECT_EQ(checks.Step(), 2);
  EXPECT_EQ(RowCount(), 2);
}

TEST_F(SurfChecksTest, A_late_close_of_an_old_socket_does_nothing) {
  WebByName();
  WebByAddress();
  OpenPage();
  Connection(WebByName()).Send("one");
  Run();

  Connection(WebByName()).Close();
  Run();

  EXPECT_EQ(checks.Step(), 2);
  EXPECT_EQ(Icons(2), (std::vector<int>{kTick, 0}));
}

/// The step that waits while socket 1, open since its pass, is reset.
class LateError : public SurfTest, public testing::WithParamInterface<int> {
 protected:
  /// Lets all servers before that step answer and the one of the step wait.
  void WaitInStep(int step) {
    WebByName();
    WebByAddress();
    IncomingMail();
    OutgoingMail();
    OpenPage();
    platform::simulated::SimulatedServer* servers[] = {&WebByName(), &WebByAddress(), &IncomingMail(),
                                                       &OutgoingMail()};
    for (int passed = 1; passed < step; ++passed) {
      Connection(*servers[passed - 1]).Send("x");
      Run();
    }
    ASSERT_EQ(checks.Step(), step);
  }
};

TEST_P(LateError, Of_the_first_socket_fails_the_step_that_waits_and_starts_the_next) {
  const int step = GetParam();
  WaitInStep(step);

  Connection(WebByName()).Reset();
  Run();

  EXPECT_EQ(Detail(step), u"10054 - Connection reset by peer.");
  EXPECT_EQ(Row(step).CellColour(1), 255u);
  EXPECT_EQ(Icon(step), kCross);
  EXPECT_EQ(Icon(1), kTick);
  EXPECT_EQ(checks.FailCount(), 1);
  EXPECT_GT(checks.Step(), step);
}

INSTANTIATE_TEST_SUITE_P(DuringEveryLaterStep, LateError, testing::Values(2, 3, 4));

TEST_F(LateError, Makes_the_data_of_the_step_that_it_ended_come_too_late) {
  WaitInStep(3);
  Connection(WebByName()).Reset();
  Run();

  Connection(IncomingMail()).Send("+OK\r\n");
  Run();

  EXPECT_EQ(checks.Step(), 4);
  EXPECT_EQ(Row(3).CellCount(), 3);
  EXPECT_EQ(Icon(3), kCross);
  EXPECT_EQ(Icon(4), 0);
}

TEST_F(LateError, After_the_end_fails_the_row_of_the_end_and_adds_another_end) {
  AllServersAnswer();
  OpenPage();

  Connection(WebByName()).Reset();
  Run();

  ASSERT_EQ(RowCount(), 12);
  EXPECT_EQ(Detail(10), u"10054 - Connection reset by peer.");
  EXPECT_EQ(Row(10).CellColour(1), 255u);
  EXPECT_EQ(Icon(10), kCross);
  EXPECT_TRUE(Bold(10));
  EXPECT_EQ(Row(11).CellCount(), 0);
  EXPECT_EQ(CaptionOf(12), kEnd);
  EXPECT_TRUE(Bold(12));
  EXPECT_EQ(checks.Step(), 10);
}

TEST_F(LateError, After_the_end_comes_once_for_each_socket_that_is_open) {
  AllServersAnswer();
  OpenPage();

  for (auto* server : {&WebByName(), &WebByAddress(), &IncomingMail(), &OutgoingMail()})
    Connection(*server).Reset();
  Run();

  EXPECT_EQ(RowCount(), 18);
  EXPECT_EQ(checks.Step(), 13);
  EXPECT_FALSE(desktop.Ended);
}

TEST_F(SurfChecksTest, Each_step_shows_its_rule_at_its_height_and_the_form_is_drawn_at_once) {
  WebByName();
  OpenPage();
  EXPECT_EQ(Rules(), (std::vector<bool>{true, false, false, false, false, false, false, false}));
  EXPECT_GE(desktop.CountOf("Repaint frmMenu"), 1);
  AllServersAnswer();

  Connection(WebByName()).Send("x");
  Run();

  EXPECT_EQ(Rules(), std::vector<bool>(8, true));
  EXPECT_EQ(desktop.CountOf("Repaint frmMenu"), 8);
  for (std::size_t rule = 0; rule < 8; ++rule) {
    const forms::Geometry place = page.surf_picLine[rule].Position;
    EXPECT_EQ(place.top, static_cast<int>(rule) * 255 + 885);
    EXPECT_EQ(place.width, 8650);
    EXPECT_EQ(place.height, 15);
  }
}

TEST_F(SurfChecksTest, The_list_is_drawn_at_once_when_a_row_is_added) {
  WebByName();

  OpenPage();

  EXPECT_EQ(desktop.CountOf("Repaint surf_ListView1"), 1);
}

TEST_F(SurfChecksTest, No_message_is_handled_from_the_fifth_step_to_the_end) {
  AllServersAnswer();
  OutgoingMail().Slowly();
  OpenPage();
  ASSERT_EQ(checks.Step(), 4);
  int stepSeen = 0;
  desktop.OnYield = [&] { stepSeen = checks.Step(); };
  const int yields = desktop.YieldCount;

  machine.sockets.Step();
  desktop.RunUntilIdle();

  EXPECT_EQ(checks.Step(), 9);
  EXPECT_EQ(desktop.YieldCount, yields);
  EXPECT_EQ(stepSeen, 0);
}

TEST_F(SurfChecksTest, The_window_lives_while_a_step_waits) {
  WebByName();
  OpenPage();

  EXPECT_TRUE(desktop.Click(page.frmSurf_cmdAdvanced));
  EXPECT_TRUE(page.advanced.frmSurf_frameAdvanced.Visible());
  EXPECT_TRUE(desktop.Click(menu.lblCaption[2]));

  EXPECT_EQ(checks.Sockets(), nullptr);
  EXPECT_TRUE(program.firstConnectionPage.frameFirstConnection.Visible());
}

TEST_F(SurfChecksTest, The_back_link_closes_the_advanced_panel_first_and_then_the_page) {
  WebByName();
  OpenPage();
  desktop.Click(page.frmSurf_cmdAdvanced);

  desktop.Click(page.surf_lblBack);
  EXPECT_FALSE(page.advanced.frmSurf_frameAdvanced.Visible());
  EXPECT_TRUE(page.frameSurfProb.Visible());
  EXPECT_NE(checks.Sockets(), nullptr);
  desktop.Click(page.surf_lblBack);

  EXPECT_FALSE(page.frameSurfProb.Visible());
  EXPECT_EQ(checks.Sockets(), nullptr);
}

TEST_F(SurfChecksTest, Choosing_the_page_that_is_open_starts_the_checks_anew) {
  AllServersAnswer();
  WebByName().Refuse();
  OpenPage();
  EXPECT_EQ(checks.FailCount(), 1);
  WebByName() = platform::simulated::SimulatedServer();

  ClickSurf();

  EXPECT_EQ(checks.FailCount(), 0);
  EXPECT_EQ(checks.Step(), 1);
  EXPECT_EQ(RowCount(), 1);
}

TEST_F(SurfChecksTest, The_start_clears_the_flag_of_the_windows_activation) {
  ComeHome();
  menu.InBackground = kTrue16;

  ClickSurf();

  EXPECT_EQ(menu.InBackground, kFalse16);
}

TEST_F(SurfChecksTest, The_timer_and_the_text_of_waiting_play_no_part) {
  AllServersAnswer();
  OpenPage();

  desktop.Advance(60'000);

  EXPECT_FALSE(page.surf_Timer1.Enabled());
  EXPECT_FALSE(page.surf_Label3.Visible());
  EXPECT_EQ(page.surf_Label3.Caption(), u"המתן...");
}

TEST_F(SurfChecksTest, Closing_the_window_while_a_step_waits_ends_the_program_without_a_word) {
  WebByName();
  OpenPage();

  desktop.CloseBox(menu);

  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 0);
  EXPECT_TRUE(desktop.Boxes.empty());
}

} // namespace
} // namespace quendra::diagnostics
