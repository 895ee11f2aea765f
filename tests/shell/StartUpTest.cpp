#include "platform/PassedOnSystem.h"
#include "platform/ReplacedFamilies.h"
#include "shell/ProgramFixture.h"

namespace quendra::shell {
namespace {

class StartUp : public ProgramTest {
 protected:
  /// The registration of the capture control is missing.
  void Unregister() { machine.capture.CreateFault = 429; }
};

/// Writes down when the load asks for what, in one order with the desktop's calls.
class RecordingSystem : public platform::PassedOnSystem {
 public:
  RecordingSystem(platform::System& system, forms::headless::HeadlessDesktop& desktop)
      : PassedOnSystem(system), desktop_(desktop) {}
  bool GetVersionExA(platform::OsVersion& version) override {
    desktop_.Calls.push_back("GetVersionExA");
    return PassedOnSystem::GetVersionExA(version);
  }

 private:
  forms::headless::HeadlessDesktop& desktop_;
};

TEST_F(StartUp, The_main_window_comes_up_without_a_page) {
  ComeHome();
  EXPECT_FALSE(program.monitorPage.frameMain.Visible());
  EXPECT_FALSE(program.surfPage.frameSurfProb.Visible());
  EXPECT_FALSE(program.firstConnectionPage.frameFirstConnection.Visible());
  EXPECT_FALSE(program.frmMenu.PageChosen());
  EXPECT_EQ(program.frmMenu.Caption(), u"זלמר בינלאומי@נט");
}

TEST_F(StartUp, The_load_opens_the_capture_library_and_makes_the_control_and_does_nothing_else) {
  ComeHome();
  EXPECT_EQ(machine.Calls, (std::vector<std::string>{"VBPcapInit", "create control"}));
  EXPECT_EQ(program.captureSession.CaptureInitResult, 0);
  EXPECT_EQ(machine.capture.ControlsMade, 1);
  EXPECT_EQ(machine.processes.SnapshotsTaken, 0);
  EXPECT_EQ(machine.ipHelper.TablesFetched, 0);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(StartUp, The_load_reads_the_version_before_it_stores_the_cursor_and_starts_no_timer) {
  RecordingSystem system(machine.system, desktop);
  app::Program other(platform::WithReplaced(machine.Operations(), {.system = &system}), desktop);
  other.Start();
  desktop.Calls.clear();
  desktop.Click(other.frmSplash.Label2);
  EXPECT_EQ(desktop.Calls, (std::vector<std::string>{"GetVersionExA", "LoadCursor 32649", "Show frmMenu"}));
  EXPECT_FALSE(other.monitorPage.main_Timer1.Enabled());
  EXPECT_FALSE(other.monitorPage.main_Timer2.Enabled());
  EXPECT_FALSE(other.surfPage.surf_Timer1.Enabled());
}

TEST_F(StartUp, The_background_takes_its_colour_at_the_load) {
  ComeHome();
  EXPECT_EQ(program.frmMenu.picOut.BackColour(), forms::Rgb(162, 233, 93));
}

TEST_F(StartUp, The_result_of_the_capture_library_is_kept_also_when_it_is_minus_1) {
  machine.capture.InitResult = -1;
  ComeHome();
  EXPECT_EQ(program.captureSession.CaptureInitResult, -1);
  EXPECT_EQ(machine.capture.ControlsMade, 1);
}

TEST_F(StartUp, The_version_of_the_system_is_kept_for_the_monitor) {
  machine.system.Version = {2, 5, 0};
  ComeHome();
  EXPECT_EQ(program.systemVersion.OsVersionCode, 2000);
}

TEST_F(StartUp, An_unlisted_version_stays_0_and_leaves_the_ports_of_every_row_empty) {
  machine.system.Version = {2, 6, 1};
  machine.AddProcess({100, 1, "server.exe", "C:\\server.exe"});
  machine.AddConnection({2, "0.0.0.0", 80, "0.0.0.0", 0, 100});
  ComeHome();
  EXPECT_EQ(program.systemVersion.OsVersionCode, 0);
  ClickEntry(0);
  ASSERT_EQ(program.monitorPage.table.main_ListView1.Count(), 1);
  EXPECT_EQ(program.monitorPage.table.main_ListView1.Row(1).CellText(3), u"");
}

TEST_F(StartUp, A_version_that_cannot_be_read_is_told_in_a_box_and_the_load_goes_on) {
  machine.system.FailVersion = true;
  ComeHome();
  ASSERT_EQ(desktop.Boxes.size(), 1U);
  EXPECT_EQ(desktop.Boxes[0].text, u"An error occured while trying to get the OS version and information.\r"
                                   u"Click OK to continue.");
  EXPECT_EQ(desktop.Boxes[0].title, u"  Error Getting OS Information");
  EXPECT_EQ(desktop.Boxes[0].flags, 0x30);
  EXPECT_EQ(program.systemVersion.OsVersionCode, 0);
  EXPECT_TRUE(WasCalled("VBPcapInit"));
}

TEST_F(StartUp, An_unregistered_control_starts_its_registration_in_a_normal_window) {
  Unregister();
  program.Start();
  desktop.Click(program.frmSplash.Label2);
  EXPECT_TRUE(WasCalled("Shell 1 regsvr32.exe -s \"packetvb.dll\""));
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(StartUp, An_unregistered_control_lets_the_main_window_flash_and_keeps_the_splash) {
  Unregister();
  program.Start();
  desktop.Calls.clear();
  desktop.Click(program.frmSplash.Label2);
  EXPECT_EQ(desktop.CountOf("Show frmMenu"), 1);
  EXPECT_FALSE(program.frmMenu.IsLoaded());
  EXPECT_TRUE(program.frmSplash.Visible());
  EXPECT_EQ(program.frmSplash.Tag(), u"not unload");
  EXPECT_FALSE(desktop.Ended);
}

TEST_F(StartUp, A_second_click_after_the_registration_brings_the_main_window_up) {
  Unregister();
  program.Start();
  desktop.Click(program.frmSplash.Label2);
  machine.capture.CreateFault = 0;
  EXPECT_TRUE(desktop.Click(program.frmSplash.Label2));
  EXPECT_TRUE(program.frmMenu.Visible());
  EXPECT_EQ(program.frmMenu.Tag(), u"");
  EXPECT_FALSE(program.frmSplash.IsLoaded());
  EXPECT_FALSE(desktop.Ended);
}

TEST_F(StartUp, A_registration_that_cannot_be_started_is_passed_over) {
  Unregister();
  machine.shellStart.Fail = true;
  program.Start();
  desktop.Click(program.frmSplash.Label2);
  EXPECT_TRUE(program.frmSplash.Visible());
  EXPECT_FALSE(desktop.Ended);
}

TEST_F(StartUp, Closing_the_splash_after_a_failed_start_ends_the_program) {
  Unregister();
  program.Start();
  desktop.Click(program.frmSplash.Label2);
  desktop.Click(program.frmSplash.Label3);
  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 0);
}

TEST_F(StartUp, Any_other_fault_ends_the_load_quietly_with_the_window_up_and_no_control) {
  machine.capture.CreateFault = 7;
  ComeHome();
  EXPECT_FALSE(program.frmSplash.IsLoaded());
  EXPECT_EQ(program.frmMenu.Tag(), u"");
  EXPECT_EQ(machine.capture.LiveControls(), 0);
  EXPECT_EQ(machine.Calls, (std::vector<std::string>{"VBPcapInit", "create control"}));
  EXPECT_TRUE(desktop.Boxes.empty());
  EXPECT_FALSE(desktop.Ended);
}

TEST_F(StartUp, A_main_window_tagged_not_close_unloads_and_leaves_the_program_alive) {
  ComeHome();
  desktop.Show(program.frmSplash);
  program.frmMenu.Tag = Text(u"not close");
  EXPECT_TRUE(desktop.CloseBox(program.frmMenu));
  EXPECT_FALSE(program.frmMenu.IsLoaded());
  EXPECT_FALSE(desktop.Ended);
  EXPECT_TRUE(desktop.Click(program.frmSplash.Label2));
  EXPECT_TRUE(program.frmMenu.Visible());
}

TEST_F(StartUp, The_close_box_of_the_main_window_ends_the_program_at_once) {
  ComeHome();
  desktop.Click(program.frmMenu.Label1);
  EXPECT_TRUE(desktop.CloseBox(program.frmMenu));
  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 0);
  // The about box is not unloaded on this way.
  EXPECT_TRUE(program.frmAbout.IsLoaded());
  EXPECT_FALSE(WasCalled("vpEnd"));
}

TEST_F(StartUp, The_close_box_stops_the_monitor_page_before_the_program_ends) {
  ComeHome();
  ClickEntry(0);
  machine.Calls.clear();
  desktop.CloseBox(program.frmMenu);
  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(machine.Calls, (std::vector<std::string>{"WSACleanup", "vpEnd", "Sleep 300", "StopEvents",
                                                     "ReleaseChannel", "CloseChannel"}));
}

TEST_F(StartUp, A_main_window_tagged_not_close_stops_its_monitor_page_all_the_same) {
  ComeHome();
  ClickEntry(0);
  desktop.Show(program.frmSplash);
  program.frmMenu.Tag = Text(u"not close");
  machine.Calls.clear();
  desktop.CloseBox(program.frmMenu);
  EXPECT_TRUE(WasCalled("vpEnd"));
  EXPECT_FALSE(desktop.Ended);
}

TEST_F(StartUp, Two_programs_live_side_by_side) {
  platform::simulated::SimulatedMachine otherMachine;
  otherMachine.system.Version = {1, 4, 10};
  forms::headless::HeadlessDesktop otherDesktop;
  app::Program other(otherMachine.Operations(), otherDesktop);
  ComeHome();
  other.Start();
  otherDesktop.Click(other.frmSplash.Label2);
  EXPECT_EQ(program.systemVersion.OsVersionCode, 2002);
  EXPECT_EQ(other.systemVersion.OsVersionCode, 98);
  otherDesktop.CloseBox(other.frmMenu);
  EXPECT_TRUE(otherDesktop.Ended);
  EXPECT_FALSE(desktop.Ended);
}

} // namespace
} // namespace quendra::shell
