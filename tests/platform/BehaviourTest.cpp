#include "platform/BehaviourFixture.h"

namespace quendra::platform {

// Processes.

TEST_P(BehaviourTest, A_snapshot_holds_the_own_process_once_with_its_name_and_parent) {
  const auto entries = Snapshot();

  const auto isOwn = [&](const Processes::Entry& entry) { return entry.processId == backend->OwnId(); };
  ASSERT_EQ(std::count_if(entries.begin(), entries.end(), isOwn), 1);
  const auto own = *std::find_if(entries.begin(), entries.end(), isOwn);
  EXPECT_EQ(std::string(own.exeFile.data()), backend->OwnName());
  EXPECT_EQ(own.parentProcessId, backend->OwnParent());
}

TEST_P(BehaviourTest, Every_name_in_a_snapshot_ends_in_a_NUL) {
  for (const auto& entry : Snapshot())
    EXPECT_NE(std::find(entry.exeFile.begin(), entry.exeFile.end(), '\0'), entry.exeFile.end())
        << entry.processId;
}

TEST_P(BehaviourTest, A_snapshot_can_be_walked_again_from_its_first_entry) {
  const Handle snapshot = machine.processes.CreateToolhelp32Snapshot(Processes::kSnapProcess, 0);
  Processes::Entry first;
  Processes::Entry other;
  ASSERT_TRUE(machine.processes.Process32First(snapshot, first));
  ASSERT_TRUE(machine.processes.Process32Next(snapshot, other));
  EXPECT_NE(first.processId, other.processId);

  EXPECT_TRUE(machine.processes.Process32First(snapshot, other));

  EXPECT_EQ(first.processId, other.processId);
  machine.processes.CloseHandle(snapshot);
}

TEST_P(BehaviourTest, A_snapshot_of_nothing_fails_with_the_invalid_handle) {
  EXPECT_EQ(machine.processes.CreateToolhelp32Snapshot(0, 0), kInvalidHandle);
}

TEST_P(BehaviourTest, Handles_that_are_none_or_closed_have_no_entries) {
  const Handle snapshot = machine.processes.CreateToolhelp32Snapshot(Processes::kSnapProcess, 0);
  EXPECT_TRUE(machine.processes.CloseHandle(snapshot));
  Processes::Entry entry;

  for (const Handle handle : {snapshot, kNoHandle, kInvalidHandle}) {
    EXPECT_FALSE(machine.processes.Process32First(handle, entry)) << handle;
    EXPECT_FALSE(machine.processes.Process32Next(handle, entry)) << handle;
  }
}

TEST_P(BehaviourTest, A_handle_is_closed_once) {
  const Handle process = machine.processes.OpenProcess(1040, false, backend->OwnId());
  ASSERT_NE(process, kNoHandle);

  EXPECT_TRUE(machine.processes.CloseHandle(process));
  EXPECT_FALSE(machine.processes.CloseHandle(process));
  EXPECT_FALSE(machine.processes.CloseHandle(kNoHandle));
}

TEST_P(BehaviourTest, Opening_a_missing_process_fails_and_leaves_an_error) {
  EXPECT_EQ(machine.processes.OpenProcess(1040, false, backend->MissingId()), kNoHandle);
  EXPECT_NE(machine.processes.GetLastError(), 0U);
}

TEST_P(BehaviourTest, The_idle_process_cannot_be_opened) {
  EXPECT_EQ(machine.processes.OpenProcess(1040, false, 0), kNoHandle);
}

TEST_P(BehaviourTest, The_first_module_of_the_own_process_is_its_executable) {
  const Handle process = machine.processes.OpenProcess(1040, false, backend->OwnId());
  std::array<ModuleHandle, 50> modules{};
  ASSERT_TRUE(machine.processes.EnumProcessModules(process, modules));

  std::string path(260, ' ');
  const auto length = machine.processes.GetModuleFileNameExA(process, modules[0], path, 500);

  EXPECT_EQ(path.size(), 260U);
  EXPECT_EQ(path.substr(0, length), backend->OwnPath());
  machine.processes.CloseHandle(process);
}

TEST_P(BehaviourTest, A_module_path_is_never_written_beyond_the_text_or_the_stated_size) {
  const Handle process = machine.processes.OpenProcess(1040, false, backend->OwnId());
  std::array<ModuleHandle, 50> modules{};
  ASSERT_TRUE(machine.processes.EnumProcessModules(process, modules));
  std::string shortText(4, ' ');
  std::string longText(100, ' ');

  EXPECT_EQ(machine.processes.GetModuleFileNameExA(process, modules[0], shortText, 500), 4U);
  EXPECT_EQ(machine.processes.GetModuleFileNameExA(process, modules[0], longText, 3), 3U);

  EXPECT_EQ(shortText, backend->OwnPath().substr(0, 4));
  EXPECT_EQ(longText, backend->OwnPath().substr(0, 3) + std::string(97, ' '));
  machine.processes.CloseHandle(process);
}

TEST_P(BehaviourTest, A_process_that_was_not_opened_has_no_modules) {
  std::array<ModuleHandle, 50> modules{};
  std::string path(10, ' ');

  EXPECT_FALSE(machine.processes.EnumProcessModules(kNoHandle, modules));
  EXPECT_EQ(machine.processes.GetModuleFileNameExA(kNoHandle, ModuleHandle(1), path, 10), 0U);
  EXPECT_NE(machine.processes.GetLastError(), 0U);
}

TEST_P(BehaviourTest, A_process_that_is_opened_to_be_ended_ends_and_no_error_is_left) {
  const std::uint32_t id = backend->StartWaiting();
  Snapshot();
  const Handle process = machine.processes.OpenProcess(Processes::kTerminate, false, id);
  ASSERT_NE(process, kNoHandle);

  EXPECT_TRUE(machine.processes.TerminateProcess(process, 0));

  EXPECT_EQ(machine.processes.GetLastError(), 0U);
  EXPECT_TRUE(backend->HasEnded(id));
  EXPECT_TRUE(machine.processes.CloseHandle(process));
}

TEST_P(BehaviourTest, A_process_is_not_ended_through_a_handle_that_is_none_or_closed) {
  const std::uint32_t id = backend->StartWaiting();
  const Handle process = machine.processes.OpenProcess(Processes::kTerminate, false, id);
  machine.processes.CloseHandle(process);

  for (const Handle handle : {process, kNoHandle}) {
    EXPECT_FALSE(machine.processes.TerminateProcess(handle, 0)) << handle;
    EXPECT_NE(machine.processes.GetLastError(), 0U) << handle;
  }
  EXPECT_NE(machine.processes.OpenProcess(1040, false, id), kNoHandle);
}

TEST_P(BehaviourTest, Neither_a_missing_process_nor_the_idle_one_can_be_opened_to_be_ended) {
  for (const std::uint32_t id : {backend->MissingId(), 0U}) {
    EXPECT_EQ(machine.processes.OpenProcess(Processes::kTerminate, false, id), kNoHandle) << id;
    EXPECT_NE(machine.processes.GetLastError(), 0U) << id;
  }
}

// Tokens.

TEST_P(BehaviourTest, The_debug_privilege_is_enabled_and_no_step_leaves_an_error) {
  Handle token = kNoHandle;
  std::uint64_t luid = 0;
  std::array<std::uint8_t, 16> previous{};

  EXPECT_TRUE(machine.tokens.OpenProcessToken(machine.processes.GetCurrentProcess(), 40, token));
  EXPECT_EQ(machine.processes.GetLastError(), 0U);
  EXPECT_TRUE(machine.tokens.LookupPrivilegeValueA("", std::string("SeDebugPrivilege\0", 17), luid));
  EXPECT_EQ(machine.processes.GetLastError(), 0U);
  EXPECT_TRUE(machine.tokens.AdjustTokenPrivileges(token, false, luid, 2, previous));
  EXPECT_EQ(machine.processes.GetLastError(), 0U);
  EXPECT_TRUE(machine.processes.CloseHandle(token));
}

TEST_P(BehaviourTest, A_token_that_is_none_cannot_be_adjusted) {
  std::array<std::uint8_t, 16> previous{};
  Handle token = kNoHandle;

  EXPECT_FALSE(machine.tokens.AdjustTokenPrivileges(kNoHandle, false, 1, 2, previous));
  EXPECT_NE(machine.processes.GetLastError(), 0U);
  EXPECT_FALSE(machine.tokens.OpenProcessToken(kNoHandle, 40, token));
}

// Files.

TEST_P(BehaviourTest, A_file_that_is_not_there_has_neither_icon_nor_version_block) {
  std::array<std::uint8_t, 64> block{};

  EXPECT_EQ(machine.icons.ExtractIconExA("/no/such/file", 0), kNoHandle);
  EXPECT_EQ(machine.icons.ExtractIconExA("", 0), kNoHandle);
  EXPECT_EQ(machine.versionInfo.GetFileVersionInfoSizeA("/no/such/file"), 0U);
  EXPECT_EQ(machine.versionInfo.GetFileVersionInfoSizeA(""), 0U);
  EXPECT_FALSE(machine.versionInfo.GetFileVersionInfoA("/no/such/file", block));
}

TEST_P(BehaviourTest, Bytes_that_are_no_version_block_hold_no_values) {
  const std::vector<std::uint8_t> zeros(64, 0);
  const std::vector<std::uint8_t> noise(64, 0xA5);

  for (const char* query :
       {"\\VarFileInfo\\Translation", "\\StringFileInfo\\040D04E7\\ProductName", "", "\\"}) {
    EXPECT_FALSE(machine.versionInfo.VerQueryValueA(zeros, query)) << query;
    EXPECT_FALSE(machine.versionInfo.VerQueryValueA(noise, query)) << query;
    EXPECT_FALSE(machine.versionInfo.VerQueryValueA({}, query)) << query;
  }
}

TEST_P(BehaviourTest, An_icon_that_is_none_has_no_image_and_cannot_be_destroyed) {
  EXPECT_TRUE(machine.icons.ImageOf(kNoHandle).empty());
  EXPECT_TRUE(machine.icons.ImageOf(kInvalidHandle).empty());
  EXPECT_FALSE(machine.icons.DestroyIcon(kNoHandle));
}

// The native interface.

TEST_P(BehaviourTest, The_handle_table_says_that_the_buffer_is_too_small_or_that_it_is_not_there) {
  std::vector<std::uint8_t> none;
  std::uint32_t returned = 0;

  const auto status = machine.handles.NtQuerySystemInformation(16, none, returned);

  EXPECT_TRUE(status == Handles::kStatusInfoLengthMismatch || status == Handles::kStatusNotImplemented)
      << status;
  EXPECT_NE(machine.handles.NtQuerySystemInformation(999, none, returned), 0U);
}

TEST_P(BehaviourTest, Handles_that_are_none_have_no_duplicate_no_name_and_no_port) {
  std::array<std::uint8_t, 32> name{};
  std::array<std::uint8_t, 24> input{};
  std::array<std::uint8_t, 52> output{};
  std::uint32_t returned = 0;
  Handle duplicate = kNoHandle;

  EXPECT_FALSE(
      machine.handles.DuplicateHandle(kNoHandle, Handle(8), kInvalidHandle, duplicate, 0x101F0000, false, 0));
  EXPECT_EQ(duplicate, kNoHandle);
  EXPECT_NE(machine.handles.NtQueryObject(kNoHandle, 1, name, returned), 0U);
  EXPECT_NE(
      machine.handles.NtDeviceIoControlFile(kNoHandle, kNoHandle, Handles::kQueryInformation, input, output),
      0U);
}

INSTANTIATE_TEST_SUITE_P(, BehaviourTest, kEveryBackend, NameOfBackend);

} // namespace quendra::platform
