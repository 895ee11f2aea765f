#include "shell/MonitorPage.h"

#include "forms/view/Accessible.h"
#include "platform/PassedOnSystem.h"
#include "platform/ReplacedFamilies.h"
#include "shell/ProgramFixture.h"

namespace quendra::shell {
namespace {

/// Writes what the page's start asks of the machine and does to the table into one list.
class Recorder : public forms::ListViewObserver, public platform::HostNames, public platform::PassedOnSystem {
 public:
  explicit Recorder(platform::simulated::SimulatedMachine& machine)
      : PassedOnSystem(machine.system), machine_(machine) {}

  std::vector<std::string>& Lines() { return machine_.Calls; }
  void StartOver() {
    Lines().clear();
    socketsStarted_ = machine_.sockets.Count("WSAStartup");
  }

  void RowAdded(int) override { Note("row added"); }
  void RowRemoved(int) override {}
  void RowChanged(int, int) override {}
  void RowsMoved() override {}
  void RowsCleared() override { Note("rows cleared"); }
  void ColumnsChanged() override { Note("columns"); }

  std::optional<std::string> gethostname() override {
    Note("addresses");
    return machine_.hostNames.gethostname();
  }
  std::optional<std::vector<platform::Ipv4Address>> gethostbyname(const std::string& name) override {
    return machine_.hostNames.gethostbyname(name);
  }
  std::int32_t LastError() override { return machine_.hostNames.LastError(); }

  std::int32_t DayNumber() override {
    Note("day number");
    return PassedOnSystem::DayNumber();
  }

 private:
  /// Columns come one by one; told once.
  void Note(const std::string& line) {
    const int started = machine_.sockets.Count("WSAStartup");
    if (std::exchange(socketsStarted_, started) < started) Lines().push_back("sockets");
    if (Lines().empty() || Lines().back() != line) Lines().push_back(line);
  }

  platform::simulated::SimulatedMachine& machine_;
  int socketsStarted_ = 0;
};

class MonitorPageSwitchTest : public ProgramTest {
 protected:
  frmMenu& menu = program.frmMenu;
};

TEST_F(MonitorPageSwitchTest,
       The_start_sets_up_table_and_sockets_reads_the_addresses_seeds_the_tick_makes_a_pass_and_captures) {
  machine.AddProcess({100, 1, "one.exe", ""});
  Recorder recorder(machine);
  app::Program other(
      platform::WithReplaced(machine.Operations(), {.hostNames = &recorder, .system = &recorder}), desktop);
  other.Start();
  desktop.Click(other.frmSplash.Label2);
  desktop.Click(other.frmMenu.lblCaption[0]);
  desktop.Click(other.frmMenu.lblCaption[2]);
  other.monitorPage.table.main_ListView1.Observe(&recorder);
  recorder.StartOver();
  desktop.Click(other.frmMenu.lblCaption[0]);
  EXPECT_EQ(machine.Calls,
            (std::vector<std::string>{"rows cleared", "columns", "sockets", "addresses", "day number",
                                      "row added", "vpGetAdapterInfo 0", "AdapterAddress eth0",
                                      "vpSetCurrentAdapter 0", "vpBegin 1000", "vpGetAdapterInfo 0",
                                      "BindAdapter eth0", "SetValueA 32", "SetValueB 1000", "OpenChannel",
                                      "SetChannelSize 15000", "SetValueC 15000", "StartEvents"}));
}

TEST_F(MonitorPageSwitchTest, The_start_seeds_the_last_refresh_with_the_day_number_and_not_with_a_tick) {
  machine.AddProcess({100, 1, "one.exe", ""});
  ComeHome();
  ClickEntry(0);
  EXPECT_EQ(program.processTable.LastRefreshTick, machine.system.Day);
  EXPECT_EQ(machine.processes.SnapshotsTaken, 1);
}

TEST_F(MonitorPageSwitchTest, The_table_has_a_name_for_assistive_technology) {
  ComeHome();
  EXPECT_EQ(forms::AccessibleOf(program.monitorPage.table.main_ListView1).name, u"תהליכים פעילים");
}

TEST_F(MonitorPageSwitchTest, The_start_clears_the_pinned_sort) {
  ComeHome();
  program.processTable.SortPinned = kTrue16;
  ClickEntry(0);
  EXPECT_EQ(program.processTable.SortPinned, 0);
}

TEST_F(MonitorPageSwitchTest, The_stop_tears_the_dormant_sniffer_down_when_its_flag_is_set) {
  ComeHome();
  ClickEntry(0);
  machine.Calls.clear();
  program.monitorWork.main_StopPage();
  EXPECT_EQ(std::count(machine.Calls.begin(), machine.Calls.end(), "WSAIsBlocking"), 0);

  ClickEntry(0);
  program.sniffer.Active = true;
  program.monitorWork.main_StopPage();

  EXPECT_FALSE(program.sniffer.Active);
  EXPECT_EQ(std::count(machine.Calls.begin(), machine.Calls.end(), "WSAIsBlocking"), 1);
}

TEST_F(MonitorPageSwitchTest, The_sniffer_goes_after_the_pages_sockets_and_before_the_session) {
  ComeHome();
  ClickEntry(0);
  program.sniffer.Active = true;
  machine.Calls.clear();

  program.monitorWork.main_StopPage();

  const std::vector<std::string> calls{"WSACleanup", "WSAIsBlocking", "WSACleanup", "vpEnd"};
  std::vector<std::string> seen;
  for (const auto& call : machine.Calls)
    if (std::find(calls.begin(), calls.end(), call) != calls.end()) seen.push_back(call);
  EXPECT_EQ(seen, calls);
}

TEST_F(MonitorPageSwitchTest, The_stop_releases_the_sockets_ends_the_session_pauses_and_stops_the_control) {
  ComeHome();
  ClickEntry(0);
  machine.Calls.clear();
  program.monitorWork.main_StopPage();
  EXPECT_EQ(machine.Calls, (std::vector<std::string>{"WSACleanup", "vpEnd", "Sleep 300", "StopEvents",
                                                     "ReleaseChannel", "CloseChannel"}));
  EXPECT_FALSE(program.captureSession.CaptureRunning);
}

TEST_F(MonitorPageSwitchTest, Timer_1_stamps_the_time_and_makes_no_pass) {
  ComeHome();
  ClickEntry(0);
  const int passes = machine.processes.SnapshotsTaken;
  program.monitorPage.main_Timer1.Enabled = true;
  machine.SetTick(5'000'000);
  desktop.Advance(1000);
  EXPECT_EQ(program.processTable.LastRefreshTick, 5'000'000);
  EXPECT_EQ(machine.processes.SnapshotsTaken, passes);
}

TEST_F(MonitorPageSwitchTest, Timer_1_makes_a_pass_behind_its_gate) {
  ComeHome();
  ClickEntry(0);
  const int passes = machine.processes.SnapshotsTaken;
  EXPECT_EQ(program.monitorWork.TimerRefreshGate, 0);
  program.monitorWork.TimerRefreshGate = kTrue16;
  program.monitorPage.main_Timer1.Enabled = true;
  desktop.Advance(1000);
  EXPECT_EQ(machine.processes.SnapshotsTaken, passes + 1);
}

TEST_F(MonitorPageSwitchTest, Timer_1_makes_no_pass_while_the_sort_is_pinned) {
  ComeHome();
  ClickEntry(0);
  const int passes = machine.processes.SnapshotsTaken;
  program.monitorWork.TimerRefreshGate = kTrue16;
  program.processTable.SortPinned = kTrue16;
  program.monitorPage.main_Timer1.Enabled = true;
  desktop.Advance(1000);
  EXPECT_EQ(machine.processes.SnapshotsTaken, passes);
}

TEST_F(MonitorPageSwitchTest, A_tick_beyond_31_bits_is_stored_as_it_wraps) {
  ComeHome();
  machine.SetTick(0xFFFFFFFE);
  program.monitorWork.main_Timer1_Timer();
  EXPECT_EQ(program.processTable.LastRefreshTick, -2);
}

TEST_F(MonitorPageSwitchTest, A_header_click_sorts_by_its_column) {
  machine.AddProcess({100, 1, "zebra.exe", ""});
  machine.AddProcess({101, 1, "ant.exe", ""});
  ComeHome();
  ClickEntry(0);
  EXPECT_TRUE(desktop.ClickHeader(program.monitorPage.table.main_ListView1, 2));
  EXPECT_EQ(program.monitorPage.table.main_ListView1.Row(1).CellText(1), u"ant.exe");
  EXPECT_TRUE(desktop.ClickHeader(program.monitorPage.table.main_ListView1, 2));
  EXPECT_EQ(program.monitorPage.table.main_ListView1.Row(1).CellText(1), u"zebra.exe");
}

TEST_F(MonitorPageSwitchTest, Choosing_another_adapter_follows_it) {
  machine.AddCaptureAdapter({"wlan0", "Radio card", ""});
  ComeHome();
  ClickEntry(0);
  EXPECT_TRUE(desktop.ChooseItem(program.monitorPage.adapters.main_cmbAdapters, 1));
  EXPECT_EQ(program.captureSession.CurrentAdapter, 1);
  EXPECT_EQ(machine.capture.ControlsMade, 2);
}

TEST_F(MonitorPageSwitchTest, Every_action_is_enabled) {
  ComeHome();
  ClickEntry(0);
  MonitorPage& page = program.monitorPage;
  for (forms::Label* label : {&page.main_lblEndProcess, &page.main_lblJumpToPath, &page.main_cmdAddRemove,
                              &page.main_cmdChecks, &page.main_cmdMemInfo, &page.reporting.main_cmdRpt})
    EXPECT_TRUE(label->Enabled()) << ToUtf8(label->Name());
}

TEST_F(MonitorPageSwitchTest, An_action_is_enabled_by_the_design_once_it_has_a_handler) {
  program.monitorPage.main_cmdChecks.Click = [] {};

  menu.Design();

  EXPECT_TRUE(program.monitorPage.main_cmdChecks.Enabled());
}

} // namespace
} // namespace quendra::shell
