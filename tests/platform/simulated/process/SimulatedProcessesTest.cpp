#include "platform/simulated/SimulatedMachineFixture.h"

namespace quendra::platform::simulated {

// Processes.

TEST_F(SimulatedMachineTest, A_snapshot_stands_still_while_processes_come_and_go) {
  machine.AddProcess({.id = 4, .name = "System"});
  machine.AddProcess({.id = 8, .parent = 4, .name = "smss.exe"});
  const Handle snapshot = operations.processes.CreateToolhelp32Snapshot(2, 0);

  machine.EndProcess(4);
  machine.AddProcess({.id = 12, .name = "late.exe"});

  Processes::Entry entry;
  ASSERT_TRUE(operations.processes.Process32First(snapshot, entry));
  EXPECT_EQ(entry.processId, 4U);
  ASSERT_TRUE(operations.processes.Process32Next(snapshot, entry));
  EXPECT_EQ(entry.parentProcessId, 4U);
  EXPECT_FALSE(operations.processes.Process32Next(snapshot, entry));
}

TEST_F(SimulatedMachineTest, Snapshots_fail_when_told_to) {
  machine.processes.FailSnapshots = true;

  EXPECT_EQ(operations.processes.CreateToolhelp32Snapshot(2, 0), kInvalidHandle);
}

TEST_F(SimulatedMachineTest, Handles_that_were_not_closed_are_counted) {
  machine.AddProcess({.id = 4, .name = "System"});
  const Handle snapshot = operations.processes.CreateToolhelp32Snapshot(2, 0);
  const Handle process = operations.processes.OpenProcess(1040, false, 4);
  EXPECT_EQ(machine.processes.OpenHandles(), 2);

  operations.processes.CloseHandle(snapshot);
  operations.processes.CloseHandle(process);
  operations.processes.CloseHandle(process);

  EXPECT_EQ(machine.processes.OpenHandles(), 0);
  EXPECT_EQ(machine.processes.VainCloses, 1);
}

TEST_F(SimulatedMachineTest, Opening_a_chosen_process_fails_with_the_scripted_answer) {
  machine.AddProcess({.id = 4, .name = "System"});
  machine.processes.FailOpen(4, kInvalidHandle);

  EXPECT_EQ(operations.processes.OpenProcess(0x40, false, 4), kInvalidHandle);
  EXPECT_EQ(operations.processes.GetLastError(), 5U);
  EXPECT_EQ(machine.processes.OpenHandles(), 0);
}

TEST_F(SimulatedMachineTest, A_process_without_a_path_has_no_modules) {
  machine.AddProcess({.id = 4, .name = "System"});
  const Handle process = operations.processes.OpenProcess(1040, false, 4);
  std::array<ModuleHandle, 50> modules{};

  EXPECT_FALSE(operations.processes.EnumProcessModules(process, modules));
}

TEST_F(SimulatedMachineTest, A_name_longer_than_its_field_is_cut) {
  machine.AddProcess({.id = 4, .name = std::string(400, 'n')});
  Processes::Entry entry;

  operations.processes.Process32First(operations.processes.CreateToolhelp32Snapshot(2, 0), entry);

  EXPECT_EQ(std::string(entry.exeFile.data()).size(), 259U);
}

// Tokens.

TEST_F(SimulatedMachineTest, Each_step_of_a_privilege_fails_with_its_scripted_error) {
  Handle token = kNoHandle;
  std::uint64_t luid = 0;
  std::array<std::uint8_t, 16> previous{};
  machine.tokens.OpenProcessTokenError = 5;
  EXPECT_FALSE(operations.tokens.OpenProcessToken(kInvalidHandle, 40, token));
  EXPECT_EQ(operations.processes.GetLastError(), 5U);

  machine.tokens.OpenProcessTokenError = 0;
  EXPECT_TRUE(operations.tokens.OpenProcessToken(kInvalidHandle, 40, token));
  machine.tokens.LookupPrivilegeValueError = 1313;
  EXPECT_FALSE(operations.tokens.LookupPrivilegeValueA("", "SeDebugPrivilege", luid));
  EXPECT_EQ(operations.processes.GetLastError(), 1313U);

  machine.tokens.LookupPrivilegeValueError = 0;
  EXPECT_TRUE(operations.tokens.LookupPrivilegeValueA("", "SeDebugPrivilege", luid));
  machine.tokens.AdjustTokenPrivilegesError = 1300;
  EXPECT_TRUE(operations.tokens.AdjustTokenPrivileges(token, false, luid, 2, previous));
  EXPECT_EQ(operations.processes.GetLastError(), 1300U);
  EXPECT_TRUE(machine.tokens.Adjusted.empty());

  machine.tokens.AdjustTokenPrivilegesError = 0;
  EXPECT_TRUE(operations.tokens.AdjustTokenPrivileges(token, false, luid, 2, previous));
  EXPECT_EQ(machine.tokens.Adjusted, Lines{"SeDebugPrivilege 2"});
}

// Version blocks.

TEST_F(SimulatedMachineTest, A_version_block_has_its_texts_under_language_and_code_page) {
  machine.AddVersionBlock("C:\\a.exe", {0x0D, 0x04, 0xE7, 0x04}, {{"ProductName", "Product"}});
  Bytes block(operations.versionInfo.GetFileVersionInfoSizeA("C:\\a.exe"));
  ASSERT_TRUE(operations.versionInfo.GetFileVersionInfoA("C:\\a.exe", block));

  const auto product =
      operations.versionInfo.VerQueryValueA(block, "\\StringFileInfo\\040D04E7\\ProductName");

  ASSERT_TRUE(product);
  EXPECT_EQ(std::string(product->begin(), product->end()), std::string("Product\0", 8));
  EXPECT_FALSE(operations.versionInfo.VerQueryValueA(block, "\\StringFileInfo\\040904B0\\ProductName"));
  EXPECT_FALSE(operations.versionInfo.VerQueryValueA(block, "\\StringFileInfo\\040D04E7\\CompanyName"));
  EXPECT_EQ(machine.versionInfo.Queries.size(), 3U);
}

TEST_F(SimulatedMachineTest, A_short_translation_names_a_table_with_zeros_in_place_of_what_it_lacks) {
  machine.AddVersionBlock("C:\\a.exe", {0x0D, 0x04}, {{"ProductName", "Product"}});
  Bytes block(operations.versionInfo.GetFileVersionInfoSizeA("C:\\a.exe"));
  ASSERT_TRUE(operations.versionInfo.GetFileVersionInfoA("C:\\a.exe", block));

  EXPECT_EQ(operations.versionInfo.VerQueryValueA(block, "\\VarFileInfo\\Translation"), (Bytes{0x0D, 0x04}));
  EXPECT_TRUE(operations.versionInfo.VerQueryValueA(block, "\\StringFileInfo\\040D0000\\ProductName"));
}

TEST_F(SimulatedMachineTest, A_block_that_cannot_be_read_has_a_size_all_the_same) {
  machine.AddVersionBlock("C:\\a.exe", {}, {});
  machine.versionInfo.FailReading("C:\\a.exe");
  Bytes block(operations.versionInfo.GetFileVersionInfoSizeA("C:\\a.exe"));

  EXPECT_GT(block.size(), 0U);
  EXPECT_FALSE(operations.versionInfo.GetFileVersionInfoA("C:\\a.exe", block));
}

// Icons.

TEST_F(SimulatedMachineTest, Icons_that_were_not_destroyed_are_counted) {
  machine.SetIcon("C:\\a.exe", {1, 2, 3});

  const Handle icon = operations.icons.ExtractIconExA("C:\\a.exe", 0);
  EXPECT_EQ(operations.icons.ImageOf(icon), (Bytes{1, 2, 3}));
  EXPECT_EQ(operations.icons.ExtractIconExA("C:\\a.exe", 1), kNoHandle);
  EXPECT_EQ(machine.icons.Live(), 1);
  EXPECT_TRUE(operations.icons.DestroyIcon(icon));

  EXPECT_EQ(machine.icons.Live(), 0);
  EXPECT_EQ(machine.icons.Destroyed, 1);
}

} // namespace quendra::platform::simulated
