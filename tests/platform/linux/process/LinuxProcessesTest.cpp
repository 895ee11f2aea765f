#include "platform/linux/process/LinuxProcesses.h"
#include "platform/linux/LinuxFixture.h"
#include "platform/linux/process/LinuxTokens.h"
#include "runtime/Text.h"

#include <gtest/gtest.h>

#include <cstring>
#include <map>

namespace quendra::platform::linux_ {

namespace {

struct LinuxProcessesTest : testing::Test {
  FakeProc proc;
  TestClock clock;
  ProcFolder folder{proc.Path()};
  HandleTable handles;
  SystemPaths paths;
  LinuxProcesses processes{folder, handles, paths, clock.AsClock()};

  Handle Snapshot() { return processes.CreateToolhelp32Snapshot(Processes::kSnapProcess, 0); }
  TemporaryFolder files;
  std::uint32_t errorOfPath = 0; ///< that PathOf met, before it closed the process

  /// A process that runs a file of this name below a folder of the test's own; gives the file's path.
  std::string AddRunning(std::uint32_t processId, const std::string& name) {
    const std::string path = files.Write(name, "program", true);
    proc.Add(processId, {"x", 1, path});
    return path;
  }
  /// The path as the program asks for it: into 260 blanks, stating 500.
  std::string PathOf(std::uint32_t processId) {
    const Handle process = processes.OpenProcess(1040, false, processId);
    ModuleHandle modules[50] = {};
    std::string path(260, ' ');
    std::uint32_t length = 0;
    if (processes.EnumProcessModules(process, modules))
      length = processes.GetModuleFileNameExA(process, modules[0], path, 500);
    errorOfPath = processes.GetLastError();
    processes.CloseHandle(process);
    EXPECT_EQ(path.size(), 260u);
    return path.substr(0, length);
  }
};

TEST_F(LinuxProcessesTest, A_snapshot_is_walked_from_its_first_process_to_its_last) {
  proc.Add(1, {"init", 0});
  proc.Add(7, {"seven", 1, "/bin/seven"});
  const Handle snapshot = Snapshot();
  Processes::Entry entry;
  ASSERT_TRUE(processes.Process32First(snapshot, entry));
  EXPECT_EQ(entry.processId, 1u);
  EXPECT_EQ(entry.parentProcessId, 0xFFFFFFFFu);
  EXPECT_STREQ(entry.exeFile.data(), "services.exe");
  ASSERT_TRUE(processes.Process32Next(snapshot, entry));
  EXPECT_EQ(entry.processId, 7u);
  EXPECT_EQ(entry.parentProcessId, 1u);
  EXPECT_STREQ(entry.exeFile.data(), "seven");
  EXPECT_FALSE(processes.Process32Next(snapshot, entry));
  EXPECT_EQ(processes.GetLastError(), 18u);
  ASSERT_TRUE(processes.Process32First(snapshot, entry));
  EXPECT_EQ(entry.processId, 1u);
}

TEST_F(LinuxProcessesTest, A_snapshot_stays_as_it_was_when_processes_come_and_go) {
  proc.Add(7, {"seven"});
  const Handle snapshot = Snapshot();
  proc.Remove(7);
  proc.Add(8, {"eight"});
  Processes::Entry entry;
  ASSERT_TRUE(processes.Process32First(snapshot, entry));
  EXPECT_EQ(entry.processId, 7u);
  EXPECT_FALSE(processes.Process32Next(snapshot, entry));
}

TEST_F(LinuxProcessesTest, The_longest_name_leaves_its_field_a_NUL) {
  proc.Add(7, {"x", 1, "/" + std::string(300, 'n')});
  Processes::Entry entry;
  entry.exeFile.fill('!');
  ASSERT_TRUE(processes.Process32First(Snapshot(), entry));
  EXPECT_EQ(std::strlen(entry.exeFile.data()), 259u);
}

TEST_F(LinuxProcessesTest, Without_a_process_folder_there_is_no_snapshot) {
  const ProcFolder nowhere("/nowhere/at/all");
  LinuxProcesses without(nowhere, handles, paths);
  EXPECT_EQ(without.CreateToolhelp32Snapshot(Processes::kSnapProcess, 0), kInvalidHandle);
  EXPECT_EQ(without.OpenProcess(1040, false, 1), kNoHandle);
}

TEST_F(LinuxProcessesTest, A_snapshot_of_other_things_than_processes_fails) {
  EXPECT_EQ(processes.CreateToolhelp32Snapshot(4, 0), kInvalidHandle);
  EXPECT_EQ(processes.GetLastError(), 87u);
}

TEST_F(LinuxProcessesTest, A_closed_handle_is_none_any_more) {
  proc.Add(7, {"seven"});
  const Handle snapshot = Snapshot();
  EXPECT_TRUE(processes.CloseHandle(snapshot));
  Processes::Entry entry;
  EXPECT_FALSE(processes.Process32First(snapshot, entry));
  EXPECT_EQ(processes.GetLastError(), 6u);
  EXPECT_FALSE(processes.CloseHandle(snapshot));
  EXPECT_EQ(handles.Count(), 0u);
}

TEST_F(LinuxProcessesTest, A_thousand_opened_and_closed_processes_leave_no_handle) {
  const std::string file = AddRunning(7, "seven");
  for (int i = 0; i < 1000; ++i) ASSERT_EQ(PathOf(7), file);
  EXPECT_EQ(handles.Count(), 0u);
}

TEST_F(LinuxProcessesTest, A_process_that_does_not_run_cannot_be_opened) {
  for (const std::uint32_t id : {0u, 4711u, 0xFFFFFFFFu}) {
    EXPECT_EQ(processes.OpenProcess(1040, false, id), kNoHandle);
    EXPECT_EQ(processes.GetLastError(), 87u);
  }
}

TEST_F(LinuxProcessesTest, A_process_without_an_executable_has_no_module) {
  proc.Add(2, {"kthreadd", 0, "", 'S', true});
  const Handle process = processes.OpenProcess(1040, false, 2);
  ASSERT_NE(process, kNoHandle);
  ModuleHandle modules[50] = {};
  EXPECT_FALSE(processes.EnumProcessModules(process, modules));
  EXPECT_EQ(processes.GetLastError(), 299u);
}

TEST_F(LinuxProcessesTest, An_opened_process_is_not_mixed_up_with_one_that_takes_over_its_id) {
  proc.Add(7, {"seven", 1, "/bin/seven"});
  const Handle process = processes.OpenProcess(1040, false, 7);
  proc.TakeOver(7, {"other", 1, "/bin/other"});
  ModuleHandle modules[50] = {};
  EXPECT_FALSE(processes.EnumProcessModules(process, modules));
}

TEST_F(LinuxProcessesTest, A_process_that_runs_no_file_of_this_machine_has_no_module) {
  proc.Add(7, {"x", 1, "/nowhere/at/all"});
  EXPECT_EQ(PathOf(7), "");
  EXPECT_EQ(errorOfPath, 299u);
}

TEST_F(LinuxProcessesTest, A_path_is_written_over_the_start_of_the_text_and_its_length_given) {
  const std::string file = AddRunning(7, "seven");
  const Handle process = processes.OpenProcess(1040, false, 7);
  std::string path(file.size() + 6, ' ');
  EXPECT_EQ(processes.GetModuleFileNameExA(process, ModuleHandle(1), path, 500), file.size());
  EXPECT_EQ(path, file + "      ");
}

TEST_F(LinuxProcessesTest, A_path_is_cut_to_the_size_stated_and_to_the_text) {
  const std::string file = AddRunning(7, "seven");
  const Handle process = processes.OpenProcess(1040, false, 7);
  std::string path(20, ' ');
  EXPECT_EQ(processes.GetModuleFileNameExA(process, ModuleHandle(1), path, 4), 4u);
  EXPECT_EQ(path, file.substr(0, 4) + std::string(16, ' '));
  std::string shortText(8, ' ');
  EXPECT_EQ(processes.GetModuleFileNameExA(process, ModuleHandle(1), shortText, 500), 8u);
  EXPECT_EQ(shortText, file.substr(0, 8));
  std::string none;
  EXPECT_EQ(processes.GetModuleFileNameExA(process, ModuleHandle(1), none, 500), 0u);
}

TEST_F(LinuxProcessesTest, A_module_that_a_process_lacks_has_no_path) {
  AddRunning(7, "seven");
  const Handle process = processes.OpenProcess(1040, false, 7);
  std::string path(20, ' ');
  EXPECT_EQ(processes.GetModuleFileNameExA(process, ModuleHandle(5), path, 500), 0u);
}

TEST_F(LinuxProcessesTest, A_path_of_Hebrew_letters_stays_itself_and_leads_back_to_its_file) {
  const std::string raw = AddRunning(7, "תוכנה");
  const std::string path = PathOf(7);
  EXPECT_EQ(path, files / ToCodePage(u"תוכנה"));
  EXPECT_EQ(paths.ToRaw(path), raw);
}

TEST_F(LinuxProcessesTest, A_hostile_path_is_cleaned_and_leads_back_to_its_file) {
  const std::string raw = AddRunning(7, "a\nb\u202E\u0001");
  const std::string path = PathOf(7);
  EXPECT_TRUE(path.ends_with(files / "a?b??")) << path;
  EXPECT_EQ(paths.ToRaw(path), raw);
}

TEST_F(LinuxProcessesTest, A_path_cut_to_the_text_leads_back_to_its_file) {
  const std::string raw = AddRunning(7, std::string(200, 'a') + "/" + std::string(200, 'b'));
  const std::string path = PathOf(7);
  EXPECT_EQ(path.size(), 260u);
  EXPECT_EQ(paths.ToRaw(path), raw);
}

TEST_F(LinuxProcessesTest, Files_whose_names_are_equal_in_the_code_page_have_different_paths) {
  const std::vector<std::string> names = {"жук", "λόγ", "a\nb", "a\tb", "???", "a?b", "\xFF\xFE\xFD"};
  std::map<std::string, std::string> rawOf;
  for (std::uint32_t i = 0; i < names.size(); ++i) {
    const std::string raw = AddRunning(100 + i, names[i]);
    const std::string path = PathOf(100 + i);
    EXPECT_TRUE(rawOf.emplace(path, raw).second) << path;
    EXPECT_EQ(PathOf(100 + i), path);
  }
  for (const auto& [path, raw] : rawOf) EXPECT_EQ(paths.ToRaw(path), raw);
}

TEST_F(LinuxProcessesTest, Long_files_that_begin_alike_have_different_paths) {
  const std::string folder = std::string(200, 'a') + "/" + std::string(100, 'b');
  const std::string one = AddRunning(7, folder + "1"), other = AddRunning(8, folder + "2");
  EXPECT_NE(PathOf(7), PathOf(8));
  EXPECT_EQ(paths.ToRaw(PathOf(7)), one);
  EXPECT_EQ(paths.ToRaw(PathOf(8)), other);
}

TEST_F(LinuxProcessesTest, A_path_that_begins_like_a_number_is_no_number) {
  const std::string numbered = paths.ToSystem("/\n");
  EXPECT_NE(paths.ToSystem(numbered), numbered);
  EXPECT_EQ(paths.ToRaw(paths.ToSystem(numbered)), numbered);
  EXPECT_EQ(paths.ToRaw("//"), "");
  EXPECT_EQ(paths.ToRaw("//99/x"), "");
}

TEST_F(LinuxProcessesTest,
       Paths_that_lead_back_are_remembered_up_to_a_bound_and_never_given_to_another_file) {
  const std::string first = paths.ToSystem("/\n1");
  std::string last;
  for (int i = 2; i < 20'000; ++i) {
    last = paths.ToSystem("/\n" + std::to_string(i));
    ASSERT_NE(last, first);
  }
  EXPECT_EQ(paths.ToRaw(last), "/\n19999");
  EXPECT_EQ(paths.ToRaw(first), "");
  EXPECT_NE(paths.ToSystem("/\n1"), first);
}

TEST_F(LinuxProcessesTest, The_own_process_has_a_path) {
  const ProcFolder real;
  LinuxProcesses own(real, handles, paths);
  std::string path(260, ' ');
  const std::uint32_t length = own.GetModuleFileNameExA(own.GetCurrentProcess(), ModuleHandle(), path, 500);
  EXPECT_TRUE(path.substr(0, length).ends_with("platform_test")) << path;
  EXPECT_TRUE(own.CloseHandle(own.GetCurrentProcess()));
}

struct LinuxTokensTest : testing::Test {
  HandleTable handles;
  std::uint8_t previous[16] = {};
  Handle token = kNoHandle;
  std::uint64_t luid = 0;
  LinuxTokens tokens{handles};

  bool Adjust() {
    return tokens.OpenProcessToken(kOwnProcess, 40, token) &&
           tokens.LookupPrivilegeValueA("", "SeDebugPrivilege", luid) &&
           tokens.AdjustTokenPrivileges(token, false, luid, 2, previous);
  }
};

TEST_F(LinuxTokensTest, Everybody_gets_the_privilege_and_no_error_is_left) {
  handles.lastError = 5;
  EXPECT_TRUE(Adjust());
  EXPECT_EQ(handles.lastError, 0u);
  const Child user([this] {
    if (::geteuid() == 0 && ::setuid(65534) != 0) return std::string("not another user");
    handles.lastError = 5;
    const bool adjusted = Adjust();
    return std::to_string(adjusted) + " " + std::to_string(handles.lastError);
  });
  EXPECT_EQ(user.Answer(), "1 0");
}

TEST_F(LinuxTokensTest, A_privilege_that_there_is_none_of_is_a_success_with_error_1300) {
  ASSERT_TRUE(tokens.OpenProcessToken(kOwnProcess, 40, token));
  EXPECT_TRUE(tokens.AdjustTokenPrivileges(token, false, 21, 2, previous));
  EXPECT_EQ(handles.lastError, 1300u);
}

TEST_F(LinuxTokensTest, A_privilege_of_another_name_is_not_known) {
  EXPECT_FALSE(tokens.LookupPrivilegeValueA("", "SeShutdownPrivilege", luid));
  EXPECT_EQ(handles.lastError, 1313u);
}

TEST_F(LinuxTokensTest, A_handle_that_is_no_token_adjusts_nothing) {
  EXPECT_FALSE(tokens.AdjustTokenPrivileges(Handle(99), false, 20, 2, previous));
  EXPECT_EQ(handles.lastError, 6u);
  EXPECT_FALSE(tokens.OpenProcessToken(Handle(99), 40, token));
}

} // namespace

} // namespace quendra::platform::linux_
