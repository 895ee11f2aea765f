#include "report/ReportFixture.h"

namespace quendra::report {
namespace {

/// Nothing in the program connects the first socket; what it would do is kept in order all the same.
class ProcsPage : public ReportTest {
 protected:
  foundation::CSocketPlus& Sockets() { return *program.supportExchange.Sockets(); }
  void ConnectFirstSocket() {
    Server();
    OpenPage();
    desktop.Dispatch([&] { Sockets().Connect(std::int16_t{1}, settings::SupportServerHost + Text(), 80); });
    Run();
    ASSERT_EQ(ConnectionCount(), 1u);
  }
};

TEST_F(ProcsPage, No_action_of_the_user_connects_it) {
  Server();
  LoadServer();
  OpenPage();
  GetNumber();
  desktop.DoubleClick(program.monitorPage.table.main_Label3);
  Run();

  EXPECT_EQ(StateOf(1), foundation::sckClosed);
  EXPECT_FALSE(program.monitorPage.main_Timer1.Enabled());
}

TEST_F(ProcsPage, A_report_and_a_load_leave_the_timer_off) {
  Server();
  LoadServer();
  OpenPage();
  GetNumber();
  Connection(0).Close();
  AnswerReport({"~OK"});
  desktop.DoubleClick(program.monitorPage.table.main_Label3);
  Run();
  LoadServer().Connections.back()->Close();
  Run();

  EXPECT_FALSE(program.monitorPage.main_Timer1.Enabled());
}

TEST_F(ProcsPage, Its_connection_sends_the_request_byte_for_byte) {
  ConnectFirstSocket();

  EXPECT_EQ(Connection(0).Received,
            "GET http://" + host + "/procs.htm HTTP/1.1 \r\nHost: " + ToUtf8(settings::RequestHostHeader) +
                "\r\nConnection: Close\r\nAccept: */*\r\n\r\n");
}

TEST_F(ProcsPage, Its_reply_is_gathered) {
  ConnectFirstSocket();

  Connection(0).Send("one ");
  Run();
  Connection(0).Send("two");
  Run();

  EXPECT_EQ(program.supportExchange.ProcsPageText, u"one two");
  EXPECT_EQ(Sockets().BytesReceived(std::int16_t{1}), 0);
}

TEST_F(ProcsPage, Its_end_closes_the_socket_makes_a_pass_and_enables_the_timer) {
  machine.AddProcess({100, 1, "one.exe", ""});
  ConnectFirstSocket();
  const int passes = machine.processes.SnapshotsTaken;

  Connection(0).Close();
  Run();

  EXPECT_EQ(StateOf(1), foundation::sckClosed);
  EXPECT_EQ(machine.processes.SnapshotsTaken, passes + 1);
  EXPECT_EQ(program.monitorPage.table.main_ListView1.Count(), 1);
  EXPECT_TRUE(program.monitorPage.main_Timer1.Enabled());
  EXPECT_TRUE(desktop.Boxes.empty());
}

/// Asks a question whenever a pass adds a row.
class RowWatcher : public forms::ListViewObserver {
 public:
  explicit RowWatcher(std::function<void()> added) : added_(std::move(added)) {}
  void RowAdded(int) override { added_(); }
  void RowRemoved(int) override {}
  void RowChanged(int, int) override {}
  void RowsMoved() override {}
  void RowsCleared() override {}
  void ColumnsChanged() override {}

 private:
  std::function<void()> added_;
};

TEST_F(ProcsPage, Its_socket_is_closed_before_the_pass_and_the_timer_enabled_after_it) {
  machine.AddProcess({100, 1, "one.exe", ""});
  ConnectFirstSocket();
  std::vector<std::pair<foundation::SocketState, bool>> duringThePass;
  RowWatcher watcher(
      [&] { duringThePass.emplace_back(StateOf(1), program.monitorPage.main_Timer1.Enabled()); });
  program.monitorPage.table.main_ListView1.Observe(&watcher);

  Connection(0).Close();
  Run();

  EXPECT_EQ(duringThePass,
            (std::vector<std::pair<foundation::SocketState, bool>>{{foundation::sckClosed, false}}));
  EXPECT_TRUE(program.monitorPage.main_Timer1.Enabled());
}

TEST_F(ProcsPage, The_timer_that_it_enables_stamps_the_time) {
  ConnectFirstSocket();
  Connection(0).Close();
  Run();
  machine.SetTick(7'000'000);

  desktop.Advance(1000);

  EXPECT_EQ(program.processTable.LastRefreshTick, 7'000'000);
}

TEST_F(ProcsPage, Its_error_is_shown_under_the_providers_title) {
  Server().Refuse();
  OpenPage();

  desktop.Dispatch([&] { Sockets().Connect(std::int16_t{1}, settings::SupportServerHost + Text(), 80); });
  Run();

  EXPECT_EQ(desktop.Boxes, (Boxes{{u"winsock error: 10061 - Connection refused.", kOkOnly, kTitle}}));
}

/// Sockets that the page never makes.
class OtherIndexes : public ReportTest, public testing::WithParamInterface<Variant> {};

TEST_P(OtherIndexes, Are_ignored_by_each_handler) {
  Server();
  OpenPage();
  foundation::CSocketPlus& sockets = *program.supportExchange.Sockets();
  sockets.ArrayAdd(GetParam());
  desktop.Dispatch([&] { sockets.Connect(GetParam(), Text(settings::SupportServerHost), 80); });
  Run();
  ASSERT_EQ(ConnectionCount(), 1u);
  EXPECT_EQ(Connection(0).Received, "");

  Connection(0).Send("~~~~~~~~\r\n1");
  Run();
  EXPECT_EQ(sockets.BytesReceived(GetParam()), 11);
  Connection(0).Close();
  Run();

  EXPECT_EQ(sockets.State(GetParam()), foundation::sckClosing);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_P(OtherIndexes, Have_errors_that_nobody_shows) {
  Server().Refuse();
  OpenPage();
  foundation::CSocketPlus& sockets = *program.supportExchange.Sockets();
  sockets.ArrayAdd(GetParam());

  desktop.Dispatch([&] { sockets.Connect(GetParam(), Text(settings::SupportServerHost), 80); });
  Run();

  EXPECT_EQ(sockets.State(GetParam()), foundation::sckError);
  EXPECT_TRUE(desktop.Boxes.empty());
}

INSTANTIATE_TEST_SUITE_P(OutsideOneToFour, OtherIndexes,
                         testing::Values(Variant(std::int16_t{0}), Variant(std::int16_t{5}),
                                         Variant(std::int16_t{-1}), Variant(Text(u"2"))));

} // namespace
} // namespace quendra::report
