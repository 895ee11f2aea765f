#include "app/Program.h"
#include "forms/headless/posix/PolledDesktop.h"
#include "integration/LinkedNamespaces.h"
#include "integration/Worker.h"
#include "monitor/ProcessRow.h"
#include "platform/linux/LinuxMachine.h"

#include <gtest/gtest.h>

namespace quendra::integration {

namespace {

/// This host with its program on the monitor page and a client that talks to another host.
class LostLink : public testing::Test {
 protected:
  void SetUp() override {
    if (!NetworkNamespace::Possible()) GTEST_SKIP() << NetworkNamespace::kSkipReason;
    hosts.emplace();
    server.emplace(Worker::Server(hosts->Far(), LinkedNamespaces::kFarAddress, 7000));
    StartProgram();
  }
  void TearDown() override {
    client.reset();
    program.reset();
    machine.reset();
    server.reset();
    hosts.reset();
  }

  /// Up to the monitor page.
  void StartProgram() {
    program.reset();
    machine.reset();
    machine.emplace(desktop, desktop);
    program.emplace(machine->Operations(), desktop);
    program->Start();
    ASSERT_TRUE(desktop.Click(program->frmSplash.Label2));
    ASSERT_TRUE(desktop.Click(program->frmMenu.lblCaption[0]));
  }
  /// Leaves the page and opens it again.
  void ReopenPage() {
    ASSERT_TRUE(desktop.Click(program->frmMenu.lblCaption[2]));
    ASSERT_TRUE(desktop.Click(program->frmMenu.lblCaption[0]));
  }

  const Text& StateLine() { return program->monitorPage.adapters.main_lblCaptureState.Caption(); }
  bool SaysGone() { return StateLine().find(u"ההתקן נותק בשעה ") != Text::npos; }
  void Await(const std::function<bool()>& condition, const char* what) {
    ASSERT_TRUE(desktop.WaitFor(condition, 20000)) << what;
  }

  /// A connection of a process here, whose traffic goes on until some of it is charged in both directions.
  void ConnectAndAwaitCharges() {
    client.reset();
    client.emplace(Worker::Client(hosts->Near(), LinkedNamespaces::kFarAddress, 7000));
    client->Tell({Order::Kind::Connect, 1});
    Answer answer;
    Await([&] { return client->HasAnswered(answer); }, "the connection");
    client->Tell({Order::Kind::Exchange, 1, 500, 500});
    Await(
        [&] {
          if (client->HasAnswered(answer)) client->Tell({Order::Kind::Exchange, 1, 500, 500});
          return IsCharged(monitor::kUploadCell) && IsCharged(monitor::kDownloadCell);
        },
        "traffic in the table");
  }
  bool IsCharged(int cell) {
    const auto* row = program->monitorPage.table.main_ListView1.Find(
        monitor::KeyOfProcess(static_cast<std::uint32_t>(client->Process())));
    return row != nullptr && !row->CellTag(cell).IsEmpty() && row->CellTag(cell).Number() > 0;
  }

  std::optional<LinkedNamespaces> hosts;
  std::optional<Worker> server;
  std::optional<Worker> client;
  forms::headless::PolledDesktop desktop;
  std::optional<platform::linux_::LinuxMachine> machine;
  std::optional<app::Program> program;
};

} // namespace

TEST_F(LostLink, A_link_that_is_taken_away_and_made_again_is_told_of_and_measured_again) {
  ConnectAndAwaitCharges();
  EXPECT_EQ(StateLine(), u"");
  RunCommand("ip link del qnear");
  Await([&] { return SaysGone(); }, "the line that says so");
  hosts->MakeLink();
  Await([&] { return StateLine().empty(); }, "the end of the line");
  ConnectAndAwaitCharges();
}

TEST_F(LostLink, A_link_that_is_renamed_is_not_followed_by_another_one_without_a_word) {
  RunCommand("ip link set qnear down && ip link set qnear name qaway");
  Await([&] { return SaysGone(); }, "the line that says so");
  EXPECT_EQ(program->monitorPage.adapters.main_cmbAdapters.SelectedText(), u"Virtual Ethernet (qnear)");
}

TEST_F(LostLink, The_page_may_be_left_and_opened_again_while_the_link_is_gone) {
  RunCommand("ip link del qnear");
  Await([&] { return SaysGone(); }, "the line that says so");
  ReopenPage();
  EXPECT_EQ(program->monitorPage.adapters.main_cmbAdapters.SelectedText(), u"Loopback (lo)");
  EXPECT_EQ(StateLine(), u"");
  hosts->MakeLink();
  ReopenPage();
  EXPECT_EQ(program->monitorPage.adapters.main_cmbAdapters.SelectedText(), u"Virtual Ethernet (qnear)");
  EXPECT_EQ(program->monitorPage.adapters.main_cmbAdapters.ListCount(), 2);
  ConnectAndAwaitCharges();
}

TEST_F(LostLink, A_network_that_comes_after_the_start_is_found_when_the_page_opens_again) {
  RunCommand("ip link del qnear && ip link set lo down");
  StartProgram();
  EXPECT_EQ(StateLine(), u"התעבורה אינה נמדדת: לא נמצא מתאם רשת");
  EXPECT_EQ(program->monitorPage.adapters.main_cmbAdapters.SelectedText(), u"Loopback (lo)");
  hosts->MakeLink();
  ReopenPage();
  EXPECT_EQ(StateLine(), u"");
  EXPECT_EQ(program->monitorPage.adapters.main_cmbAdapters.SelectedText(), u"Virtual Ethernet (qnear)");
  ConnectAndAwaitCharges();
}

} // namespace quendra::integration
