#include "report/ReportFixture.h"

namespace quendra::report {
namespace {

/// The button is there for a press that can be taken: a press while socket 2 or 3 is in use would end the
/// program.
class ReportButton : public ReportTest {
 protected:
  bool CanBePressed() const { return program.monitorPage.reporting.main_cmdRpt.Enabled(); }
  /// What the button says while the next box stands.
  void WatchNextBox() {
    desktop.WhileBoxStands.push_back([this] {
      Run();
      behindBoxes.push_back(CanBePressed());
    });
  }

  std::vector<bool> behindBoxes;
};

TEST_F(ReportButton, Can_be_pressed_when_the_page_opens) {
  OpenPage();

  EXPECT_TRUE(CanBePressed());
}

TEST_F(ReportButton, Takes_no_second_press_while_the_number_is_fetched) {
  Server();
  OpenPage();

  ClickReport();
  EXPECT_FALSE(CanBePressed());
  Run();

  EXPECT_FALSE(CanBePressed());
  EXPECT_FALSE(desktop.Click(program.monitorPage.reporting.main_cmdRpt));
  EXPECT_FALSE(desktop.Ended);
}

TEST_F(ReportButton, Takes_no_press_while_the_name_is_looked_up) {
  machine.sockets.NeverAnswer(host);
  OpenPage();

  ClickReport();
  Run();

  EXPECT_FALSE(CanBePressed());
}

TEST_F(ReportButton, Takes_no_press_while_a_silent_server_is_waited_for) {
  Server();
  OpenPage();
  ClickReport();
  Run();

  desktop.Advance(24 * 3'600'000);

  EXPECT_FALSE(CanBePressed());
}

TEST_F(ReportButton, Takes_no_press_behind_the_number_although_its_connection_has_ended) {
  Server();
  OpenPage();
  desktop.WhileBoxStands.push_back([this] {
    Connection(0).Close();
    Run();
    EXPECT_EQ(StateOf(2), foundation::sckClosed);
    behindBoxes.push_back(CanBePressed());
  });

  GetNumber();

  EXPECT_EQ(behindBoxes, std::vector<bool>{false});
}

TEST_F(ReportButton, Takes_no_press_while_the_report_is_posted) {
  Server();
  OpenPage();
  GetNumber();

  Connection(0).Close();
  Run();

  EXPECT_EQ(StateOf(2), foundation::sckClosed);
  EXPECT_FALSE(CanBePressed());
}

TEST_F(ReportButton, Takes_no_press_behind_the_result_and_one_again_once_that_is_closed) {
  Server();
  OpenPage();
  GetNumber();
  Connection(0).Close();
  WatchNextBox();

  AnswerReport({"~OK"});

  EXPECT_EQ(behindBoxes, std::vector<bool>{false});
  EXPECT_TRUE(CanBePressed());
}

TEST_F(ReportButton, Can_be_pressed_again_when_the_server_ends_without_a_number) {
  Server();
  OpenPage();
  ClickReport();
  Run();

  Connection(0).Close();
  Run();

  EXPECT_TRUE(CanBePressed());
}

TEST_F(ReportButton, Waits_for_the_first_connection_to_end_when_the_post_ends_before_it) {
  Server();
  OpenPage();
  GetNumber();
  AnswerReport({"~OK"});
  EXPECT_FALSE(CanBePressed());

  Connection(0).Close();
  Run();

  EXPECT_TRUE(CanBePressed());
}

TEST_F(ReportButton, Takes_no_press_behind_a_refusal_nor_after_its_box) {
  Server().Refuse();
  OpenPage();
  WatchNextBox();

  ClickReport();
  Run();

  EXPECT_EQ(behindBoxes, std::vector<bool>{false});
  EXPECT_EQ(StateOf(2), foundation::sckError);
  EXPECT_FALSE(CanBePressed());
  EXPECT_FALSE(desktop.Click(program.monitorPage.reporting.main_cmdRpt));
  EXPECT_FALSE(desktop.Ended);
}

TEST_F(ReportButton, Takes_no_press_behind_the_error_of_a_socket_that_cannot_be_made) {
  OpenPage();
  machine.sockets.Fail("socket", 10024);
  WatchNextBox();

  ClickReport();

  EXPECT_EQ(behindBoxes, std::vector<bool>{false});
  EXPECT_FALSE(CanBePressed());
}

TEST_F(ReportButton, Takes_no_press_after_a_refused_post) {
  Server();
  OpenPage();
  desktop.WhileBoxStands.push_back([&] { Server().Refuse(); });
  GetNumber();

  Connection(0).Close();
  Run();

  EXPECT_EQ(StateOf(2), foundation::sckClosed);
  EXPECT_EQ(StateOf(3), foundation::sckError);
  EXPECT_FALSE(CanBePressed());
}

TEST_F(ReportButton, Can_be_pressed_again_when_the_page_is_opened_anew) {
  Server().Refuse();
  OpenPage();
  ClickReport();
  Run();
  LeavePage();

  ASSERT_TRUE(desktop.Click(menu.lblCaption[0]));

  EXPECT_TRUE(CanBePressed());
}

TEST_F(ReportButton, Lets_the_page_be_left_behind_the_box_of_a_connection_that_failed_at_once) {
  OpenPage();
  machine.sockets.Fail("socket", 10024);
  desktop.WhileBoxStands.push_back([&] { LeavePage(); });

  ClickReport();

  EXPECT_FALSE(desktop.Ended);
  EXPECT_EQ(program.supportExchange.Sockets(), nullptr);
}

TEST_F(ReportButton, Takes_no_part_in_the_load) {
  LoadServer();
  OpenPage();

  ASSERT_TRUE(desktop.DoubleClick(program.monitorPage.table.main_Label3));
  Run();

  EXPECT_TRUE(CanBePressed());
}

} // namespace
} // namespace quendra::report
