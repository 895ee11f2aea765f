#include "monitor/MonitorFixture.h"

namespace quendra::monitor {

namespace {

using Box = forms::headless::HeadlessDesktop::Box;

struct Privilege : MonitorFixture {
  /// The one box that stood, which has neither flags nor a title.
  void ExpectOneBox(const char16_t* text) { EXPECT_EQ(desktop.Boxes, (std::vector<Box>{{text, 0, u""}})); }
};

/// A machine that gives one long path and keeps what it was asked for.
struct LongPathProcesses : platform::simulated::SimulatedProcesses {
  using SimulatedProcesses::SimulatedProcesses;

  bool EnumProcessModules(platform::Handle process, std::span<platform::ModuleHandle> modules) override {
    EnumeratedProcesses.push_back(process);
    tableBytes = modules.size_bytes();
    modules[0] = platform::ModuleHandle(77);
    return true;
  }
  std::uint32_t GetModuleFileNameExA(platform::Handle, platform::ModuleHandle askedModule, std::string& path,
                                     std::uint32_t size) override {
    module = askedModule;
    blanks = path;
    statedSize = size;
    path.replace(0, Path.size(), Path);
    return ReturnedLength;
  }

  std::string Path = "C:\\a.exe";
  std::uint32_t ReturnedLength = 8;
  std::vector<platform::Handle> EnumeratedProcesses;
  std::size_t tableBytes = 0;
  platform::ModuleHandle module;
  std::string blanks;
  std::uint32_t statedSize = 0;
};

struct ModulePath : MonitorFixture {
  platform::simulated::Core core;
  LongPathProcesses processes{core};
  mdlFileInfo asked{processes, machine.tokens, machine.versionInfo, desktop};
};

struct WellKnown : MonitorFixture {};

} // namespace

// EnablePrivilege.

TEST_F(Privilege, Is_enabled_when_no_step_leaves_an_error) {
  EXPECT_EQ(fileInfo.EnablePrivilege(u"SeDebugPrivilege", 4), kTrue16);
  EXPECT_EQ(machine.tokens.Adjusted, (std::vector<std::string>{"SeDebugPrivilege 4"}));
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(Privilege, Takes_attributes_of_2_when_none_are_given) {
  fileInfo.EnablePrivilege(u"SeDebugPrivilege");
  EXPECT_EQ(machine.tokens.Adjusted, (std::vector<std::string>{"SeDebugPrivilege 2"}));
}

TEST_F(Privilege, Fails_at_its_first_step_by_an_error_left_over_from_before) {
  machine.processes.LeaveError(6);
  EXPECT_EQ(fileInfo.EnablePrivilege(u"SeDebugPrivilege"), kFalse16);
  ExpectOneBox(u"GetCurrentProcess, Error: 6");
  EXPECT_TRUE(machine.tokens.Adjusted.empty());
}

TEST_F(Privilege, Says_that_the_token_could_not_be_opened) {
  machine.tokens.OpenProcessTokenError = 5;
  EXPECT_EQ(fileInfo.EnablePrivilege(u"SeDebugPrivilege"), kFalse16);
  ExpectOneBox(u"OpenProcessToken, Error: 5");
}

TEST_F(Privilege, Says_that_the_privilege_is_not_known) {
  machine.tokens.LookupPrivilegeValueError = 1313;
  EXPECT_EQ(fileInfo.EnablePrivilege(u"SeDebugPrivilege"), kFalse16);
  ExpectOneBox(u"LookupPrivilegeValue, Error: 1313");
}

TEST_F(Privilege, That_the_account_lacks_fails_by_1300_although_the_call_succeeds) {
  machine.tokens.AdjustTokenPrivilegesError = 1300;
  EXPECT_EQ(fileInfo.EnablePrivilege(u"SeDebugPrivilege"), kFalse16);
  ExpectOneBox(u"AdjustTokenPrivileges, Error: 1300");
}

TEST_F(Privilege, Speaks_again_at_each_new_attempt) {
  machine.tokens.AdjustTokenPrivilegesError = 1300;
  fileInfo.EnablePrivilege(u"SeDebugPrivilege");
  machine.processes.LeaveError(0);
  fileInfo.EnablePrivilege(u"SeDebugPrivilege");
  EXPECT_EQ(desktop.Boxes.size(), 2u);
  EXPECT_EQ(desktop.Boxes[1].text, u"AdjustTokenPrivileges, Error: 1300");
}

TEST_F(Privilege, Leaves_no_token_open) {
  fileInfo.EnablePrivilege(u"SeDebugPrivilege");
  machine.tokens.LookupPrivilegeValueError = 1313;
  fileInfo.EnablePrivilege(u"SeDebugPrivilege");
  EXPECT_EQ(machine.processes.OpenHandles(), 0);
}

// Module paths.

TEST_F(ModulePath, Is_that_of_the_first_module) {
  machine.AddProcess({10, 1, "a.exe", "C:\\dir\\a.exe"});
  EXPECT_EQ(fileInfo.ModulePathOf(10), u"C:\\dir\\a.exe");
  ASSERT_EQ(machine.processes.OpenCalls.size(), 1u);
  EXPECT_EQ(machine.processes.OpenCalls[0].access, 1040u);
  EXPECT_EQ(machine.processes.OpenHandles(), 0);
}

TEST_F(ModulePath, Is_asked_for_with_a_table_of_200_bytes_and_260_blanks_of_a_stated_500) {
  processes.Add({10, 1, "a.exe", "C:\\a.exe"});
  EXPECT_EQ(asked.ModulePathOf(10), u"C:\\a.exe");
  EXPECT_EQ(processes.tableBytes, 200u);
  EXPECT_EQ(processes.module, platform::ModuleHandle(77));
  EXPECT_EQ(processes.blanks, std::string(260, ' '));
  EXPECT_EQ(processes.statedSize, 500u);
}

TEST_F(ModulePath, Is_the_left_part_of_the_length_returned) {
  processes.Add({10, 1, "a.exe", "C:\\a.exe"});
  processes.ReturnedLength = 3;
  EXPECT_EQ(asked.ModulePathOf(10), u"C:\\");
}

TEST_F(ModulePath, Ends_where_the_text_ends_when_the_length_returned_is_longer) {
  processes.Add({10, 1, "a.exe", "C:\\a.exe"});
  processes.ReturnedLength = 500;
  EXPECT_EQ(asked.ModulePathOf(10).size(), 260u);
}

TEST_F(ModulePath, Of_a_process_without_modules_is_empty_and_its_handle_closed) {
  machine.AddProcess({4, 0, "System", ""});
  EXPECT_EQ(fileInfo.ModulePathOf(4), u"");
  EXPECT_EQ(machine.processes.OpenHandles(), 0);
}

TEST_F(ModulePath, Of_a_process_that_does_not_open_is_empty) { EXPECT_EQ(fileInfo.ModulePathOf(10), u""); }

TEST_F(ModulePath, Tries_the_module_table_though_the_process_did_not_open) {
  asked.ModulePathOf(10);
  EXPECT_EQ(processes.EnumeratedProcesses, (std::vector<platform::Handle>{platform::kNoHandle}));
  EXPECT_EQ(processes.VainCloses, 1);
}

TEST_F(ModulePath, Or_the_word_SYSTEM_does_not_try_the_module_table_of_what_did_not_open) {
  EXPECT_EQ(asked.ModulePathOrSystem(10), u"SYSTEM");
  EXPECT_TRUE(processes.EnumeratedProcesses.empty());
}

TEST_F(ModulePath, Or_the_word_SYSTEM_stands_for_a_process_without_modules) {
  machine.AddProcess({4, 0, "System", ""});
  EXPECT_EQ(fileInfo.ModulePathOrSystem(4), u"SYSTEM");
  EXPECT_EQ(machine.processes.OpenHandles(), 0);
}

TEST_F(ModulePath, Or_the_word_SYSTEM_is_the_path_where_there_is_one) {
  machine.AddProcess({10, 1, "a.exe", "C:\\a.exe"});
  EXPECT_EQ(fileInfo.ModulePathOrSystem(10), u"C:\\a.exe");
  EXPECT_EQ(machine.processes.OpenCalls[0].access, 1040u);
}

// Well-known ids.

TEST_F(WellKnown, Names_are_compared_without_regard_to_case) {
  fileInfo.RecordWellKnown(u"SERVICES.EXE", 1);
  fileInfo.RecordWellKnown(u"Explorer.exe", 2);
  fileInfo.RecordWellKnown(u"System", 3);
  fileInfo.RecordWellKnown(u"SMSS.exe", 4);
  fileInfo.RecordWellKnown(u"WinLogon.exe", 5);
  fileInfo.RecordWellKnown(u"csrss.EXE", 6);
  fileInfo.RecordWellKnown(u"LSASS.EXE", 7);
  EXPECT_EQ(fileInfo.ServicesPid, 1u);
  EXPECT_EQ(fileInfo.ExplorerPid, 2u);
  EXPECT_EQ(fileInfo.SystemPids, (std::array<std::uint32_t, 5>{3, 4, 5, 6, 7}));
}

TEST_F(WellKnown, Other_names_are_passed_over) {
  for (const char16_t* name : {u"services", u"explorer", u"system.exe", u"smss", u"", u" system"})
    fileInfo.RecordWellKnown(name, 9);
  EXPECT_EQ(fileInfo.ServicesPid, 0u);
  EXPECT_EQ(fileInfo.ExplorerPid, 0u);
  EXPECT_EQ(fileInfo.SystemPids, (std::array<std::uint32_t, 5>{}));
}

TEST_F(WellKnown, Ids_have_32_bits) {
  fileInfo.RecordWellKnown(u"services.exe", 0xFFFFFFF0);
  EXPECT_EQ(fileInfo.ServicesPid, 0xFFFFFFF0u);
  EXPECT_EQ(Text(fileInfo.ClassOfParent(0xFFFFFFF0)), u"Service");
}

TEST_F(WellKnown, The_order_of_comparison_is_services_then_explorer_then_the_five) {
  fileInfo.ServicesPid = fileInfo.ExplorerPid = fileInfo.SystemPids[0] = 5;
  EXPECT_EQ(Text(fileInfo.ClassOfParent(5)), u"Service");
  fileInfo.ServicesPid = 1;
  EXPECT_EQ(Text(fileInfo.ClassOfParent(5)), u"User");
  fileInfo.ExplorerPid = 1;
  EXPECT_EQ(Text(fileInfo.ClassOfParent(5)), u"System");
  EXPECT_EQ(fileInfo.ClassOfParent(6), nullptr);
}

TEST_F(WellKnown, Loading_walks_a_snapshot_of_its_own_and_closes_it) {
  machine.AddProcess({3, 0, "System", ""});
  machine.AddProcess({100, 3, "Services.exe", ""});
  machine.AddProcess({200, 3, "explorer.exe", ""});
  machine.AddProcess({300, 200, "quendra.exe", ""});
  fileInfo.LoadSystemPids(u"");
  EXPECT_EQ(fileInfo.SystemPids[0], 3u);
  EXPECT_EQ(fileInfo.ServicesPid, 100u);
  EXPECT_EQ(fileInfo.ExplorerPid, 200u);
  EXPECT_EQ(fileInfo.OwnPid, 300u);
  EXPECT_EQ(machine.processes.SnapshotsTaken, 1);
  EXPECT_EQ(machine.processes.OpenHandles(), 0);
}

TEST_F(WellKnown, The_own_name_is_compared_with_regard_to_case) {
  machine.AddProcess({300, 200, "Quendra.exe", ""});
  fileInfo.LoadSystemPids(u"");
  EXPECT_EQ(fileInfo.OwnPid, 0u);
}

TEST_F(WellKnown, A_copy_of_the_program_under_another_name_is_not_recognised_as_itself) {
  machine.AddProcess({300, 200, "quendra (2).exe", ""});
  fileInfo.LoadSystemPids(u"");
  EXPECT_EQ(fileInfo.OwnPid, 0u);
}

TEST_F(WellKnown, Names_are_cut_at_their_first_NUL) {
  machine.AddProcess({300, 200, std::string("quendra.exe\0x", 13), ""});
  fileInfo.LoadSystemPids(u"");
  EXPECT_EQ(fileInfo.OwnPid, 300u);
}

TEST_F(WellKnown, A_failed_snapshot_loads_nothing) {
  machine.AddProcess({100, 3, "services.exe", ""});
  machine.processes.FailSnapshots = true;
  fileInfo.LoadSystemPids(u"");
  EXPECT_EQ(fileInfo.ServicesPid, 0u);
}

} // namespace quendra::monitor
