#include "shell/ProgramFixture.h"

#include "capture/TestFrames.h"

namespace quendra::shell {
namespace {

/// A subscriber's evening: a browser with two connections and a mail program with one.
class Scenario : public ProgramTest {
 protected:
  Scenario() {
    machine.AddProcess({0, 0, "[System Process]", ""});
    machine.AddProcess({100, 1, "browser.exe", "C:\\browser.exe"});
    machine.AddProcess({200, 1, "mail.exe", "C:\\mail.exe"});
    machine.AddConnection({5, "10.0.0.5", 1025, "192.0.2.80", 80, 100});
    machine.AddConnection({5, "10.0.0.5", 1026, "192.0.2.80", 443, 100});
    machine.AddConnection({5, "10.0.0.5", 1110, "192.0.2.25", 110, 200});
  }

  void OpenMonitor() {
    ComeHome();
    ClickEntry(0);
  }
  /// `count` packets of `length` bytes that the machine sends from, or gets at, one of its ports.
  void Upload(unsigned port, unsigned length, int count = 1) {
    for (int i = 0; i < count; ++i) {
      capture::TestFrame frame;
      frame.source = "10.0.0.5";
      frame.sourcePort = port;
      frame.totalLength = length;
      machine.Deliver(frame.Build());
    }
  }
  void Download(unsigned port, unsigned length, int count = 1) {
    for (int i = 0; i < count; ++i) {
      capture::TestFrame frame;
      frame.source = "192.0.2.80";
      frame.sourcePort = 80;
      frame.destination = "10.0.0.5";
      frame.destinationPort = port;
      frame.totalLength = length;
      machine.Deliver(frame.Build());
    }
  }
  void Signal() {
    desktop.Dispatch([this] { machine.capture.SignalWhileFramesAreTaken(); });
  }
  const forms::ListRow& RowOf(std::uint32_t id) {
    forms::ListRow* row = program.monitorPage.table.main_ListView1.Find(u"p" + DecimalText(id));
    if (!row) throw std::runtime_error("no row of process " + std::to_string(id));
    return *row;
  }

  frmMenu& menu = program.frmMenu;
};

TEST_F(Scenario, The_monitor_page_opens_with_the_processes_and_their_ports) {
  OpenMonitor();
  EXPECT_EQ(program.monitorPage.table.main_ListView1.Count(), 3);
  EXPECT_EQ(RowOf(100).CellText(1), u"browser.exe");
  EXPECT_EQ(RowOf(100).CellText(3), u".1025.1026.");
  EXPECT_EQ(RowOf(200).CellText(3), u".1110.");
  EXPECT_EQ(RowOf(0).CellText(0), u"");
  EXPECT_EQ(RowOf(0).SmallIcon(), 1);
  EXPECT_EQ(program.monitorPage.table.main_lblUpload.Caption(), u"0.0");
  EXPECT_EQ(program.monitorPage.table.main_lblDownload.Caption(), u"0.0");
  EXPECT_EQ(program.monitorPage.adapters.main_cmbAdapters.SelectedText(), u"Network card");
}

TEST_F(Scenario, The_first_packet_after_the_opening_refreshes_at_once) {
  OpenMonitor();
  const int passes = machine.processes.SnapshotsTaken;
  Upload(1025, 1024);
  Signal();
  EXPECT_EQ(machine.processes.SnapshotsTaken, passes + 1);
  EXPECT_EQ(program.processTable.LastRefreshTick, static_cast<std::int32_t>(machine.system.GetTickCount()));
}

TEST_F(Scenario, Traffic_becomes_rates_in_the_rows_and_in_the_meters) {
  OpenMonitor();
  Upload(1025, 40);
  Signal();
  machine.AdvanceTick(400);
  Upload(1025, 1024, 5);
  Download(1026, 1024, 30);
  Download(1110, 1024, 2);
  Signal();
  machine.AdvanceTick(600);
  Download(1026, 1024, 1);
  Signal();
  EXPECT_EQ(RowOf(100).CellText(4), u"05.00");
  EXPECT_EQ(RowOf(100).CellText(5), u"031.00");
  EXPECT_EQ(RowOf(100).CellText(6), u"36.00");
  EXPECT_EQ(RowOf(200).CellText(4), u"");
  EXPECT_EQ(RowOf(200).CellText(5), u"002.00");
  EXPECT_EQ(program.monitorPage.table.main_lblUpload.Caption(), u"05.00");
  EXPECT_EQ(program.monitorPage.table.main_lblDownload.Caption(), u"33.00");
  EXPECT_EQ(program.monitorPage.table.main_ListView1.Row(1).Key(), u"p100");
  EXPECT_EQ(program.monitorPage.table.main_ListView1.Row(2).Key(), u"p200");
}

TEST_F(Scenario, The_table_refreshes_at_most_once_a_second) {
  OpenMonitor();
  Upload(1025, 40);
  Signal();
  const int passes = machine.processes.SnapshotsTaken;
  for (int i = 0; i < 9; ++i) {
    machine.AdvanceTick(111);
    Upload(1025, 40, 20);
    Signal();
  }
  EXPECT_EQ(machine.processes.SnapshotsTaken, passes);
  machine.AdvanceTick(1);
  Upload(1025, 40, 20);
  Signal();
  EXPECT_EQ(machine.processes.SnapshotsTaken, passes + 1);
}

TEST_F(Scenario, Without_traffic_the_table_stands_still_whatever_the_time) {
  OpenMonitor();
  const int passes = machine.processes.SnapshotsTaken;
  machine.AddProcess({300, 1, "late.exe", ""});
  machine.AdvanceTick(60000);
  desktop.Advance(60000);
  EXPECT_EQ(machine.processes.SnapshotsTaken, passes);
  EXPECT_EQ(program.monitorPage.table.main_ListView1.Count(), 3);
  Upload(1025, 40);
  Signal();
  EXPECT_EQ(program.monitorPage.table.main_ListView1.Count(), 4);
}

TEST_F(Scenario, No_packet_is_looked_at_on_other_pages) {
  OpenMonitor();
  ClickEntry(1);
  const int passes = machine.processes.SnapshotsTaken;
  machine.AdvanceTick(5000);
  Upload(1025, 1024, 10);
  Signal();
  EXPECT_EQ(machine.processes.SnapshotsTaken, passes);
  EXPECT_EQ(machine.capture.WaitingFrames(), 10);
}

TEST_F(Scenario, Leaving_the_page_and_returning_begins_all_totals_again) {
  OpenMonitor();
  Upload(1025, 1024, 7);
  Signal();
  EXPECT_EQ(RowOf(100).CellTag(4).Number(), 7.0);
  ClickEntry(2);
  desktop.Click(program.firstConnectionPage.frsCon_lblBack);
  ClickEntry(0);
  EXPECT_EQ(RowOf(100).CellTag(4).Number(), 0.0);
  EXPECT_EQ(RowOf(100).CellText(4), u"0");
}

TEST_F(Scenario, Returning_to_the_page_forgets_the_adapter_that_the_user_chose) {
  machine.AddCaptureAdapter({"wlan0", "Radio card", ""});
  OpenMonitor();
  desktop.ChooseItem(program.monitorPage.adapters.main_cmbAdapters, 1);
  EXPECT_EQ(program.captureSession.CurrentAdapter, 1);
  ClickEntry(1);
  ClickEntry(0);
  EXPECT_EQ(program.captureSession.CurrentAdapter, 0);
  EXPECT_EQ(program.monitorPage.adapters.main_cmbAdapters.ListIndex(), 0);
  EXPECT_EQ(program.monitorPage.adapters.main_cmbAdapters.ListCount(), 2);
}

TEST_F(Scenario, Without_the_capture_library_the_page_opens_filled_once_and_nothing_moves) {
  machine.capture.InitResult = -1;
  machine.capture.Adapters.clear();
  OpenMonitor();
  EXPECT_TRUE(program.monitorPage.frameMain.Visible());
  EXPECT_EQ(program.monitorPage.table.main_ListView1.Count(), 3);
  EXPECT_EQ(program.monitorPage.adapters.main_cmbAdapters.ListCount(), 0);
  EXPECT_TRUE(WasCalled("VBPcapTerminate"));
  EXPECT_FALSE(WasCalled("vpBegin 1000"));
  EXPECT_FALSE(program.monitorPage.adapters.main_lblCaptureState.Caption().empty());
  EXPECT_TRUE(desktop.Boxes.empty());
  const int passes = machine.processes.SnapshotsTaken;
  machine.AdvanceTick(10000);
  Upload(1025, 1024);
  Signal();
  desktop.Advance(10000);
  EXPECT_EQ(machine.processes.SnapshotsTaken, passes);
}

TEST_F(Scenario, Without_the_capture_library_each_opening_ends_it_again) {
  machine.capture.InitResult = -1;
  OpenMonitor();
  ClickEntry(1);
  ClickEntry(0);
  EXPECT_EQ(std::count(machine.Calls.begin(), machine.Calls.end(), "VBPcapTerminate"), 2);
}

TEST_F(Scenario, The_capture_state_is_silent_while_all_is_well) {
  OpenMonitor();
  EXPECT_EQ(program.monitorPage.adapters.main_lblCaptureState.Caption(), u"");
}

TEST_F(Scenario, A_window_without_a_capture_control_ends_the_program_when_the_monitor_is_opened) {
  machine.capture.CreateFault = 7;
  ComeHome();
  desktop.Click(menu.lblCaption[0]);
  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 1);
}

TEST_F(Scenario, A_page_change_while_packets_are_drained_stops_the_capture_in_between) {
  OpenMonitor();
  Upload(1025, 1024, 50);
  int yields = 0;
  desktop.OnYield = [&] {
    if (++yields == 10) menu.lblCaption[1].Click();
  };
  Signal();
  EXPECT_TRUE(program.surfPage.frameSurfProb.Visible());
  EXPECT_FALSE(program.monitorPage.frameMain.Visible());
  EXPECT_FALSE(program.captureSession.CaptureRunning);
  EXPECT_FALSE(desktop.Ended);
}

TEST_F(Scenario, Closing_the_window_while_packets_are_drained_ends_the_program) {
  OpenMonitor();
  Upload(1025, 1024, 50);
  int yields = 0;
  desktop.OnYield = [&] {
    if (++yields == 10) desktop.CloseBox(menu);
  };
  Signal();
  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 0);
}

} // namespace
} // namespace quendra::shell
