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

TEST_F(SurfChecksTest, What_a_server_said_stays_in_its_socket) {
  AllServersAnswer();

  OpenPage();

  EXPECT_EQ(checks.Sockets()->BytesReceived(std::int16_t{3}), 5);
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
