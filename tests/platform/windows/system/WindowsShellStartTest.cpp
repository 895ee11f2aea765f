#include "platform/windows/system/WindowsShellStart.h"

#include "winapi/Winapi.h"

#include <gtest/gtest.h>

#include <tlhelp32.h>

#include <array>

namespace quendra::platform::windows {
namespace {

/// A folder of its own, which is the working folder meanwhile.
struct WindowsShellStartTest : testing::Test {
  static constexpr const wchar_t* kFolder = L"C:\\Quendra Test";

  WindowsShellStartTest() {
    ::GetCurrentDirectoryW(MAX_PATH, before.data());
    ::CreateDirectoryW(kFolder, nullptr);
    ::SetCurrentDirectoryW(kFolder);
  }
  ~WindowsShellStartTest() override {
    ::SetCurrentDirectoryW(before.data());
    for (const wchar_t* file : {L"C:\\Quendra Test\\told.txt", L"C:\\Quendra Test\\planted.exe"})
      ::DeleteFileW(file);
    ::RemoveDirectoryW(kFolder);
  }

  /// Whether the file is there before long.
  static bool Appears(const wchar_t* file) {
    for (int round = 0; round < 500; ++round) {
      if (::GetFileAttributesW(file) != INVALID_FILE_ATTRIBUTES) return true;
      ::Sleep(20);
    }
    return false;
  }
  static bool CopyOfAProgram(const wchar_t* file) {
    return ::CopyFileW(L"C:\\WINDOWS\\system32\\cmd.exe", file, FALSE) != FALSE;
  }

  /// With its separator.
  static Text FolderOfThisProgram() {
    std::array<wchar_t, MAX_PATH> own{};
    ::GetModuleFileNameW(nullptr, own.data(), MAX_PATH);
    const Text program = winapi::TextOf(own.data());
    return program.substr(0, program.rfind(u'\\') + 1);
  }

  std::array<wchar_t, MAX_PATH> before{};
  WindowsShellStart shell;
};

TEST_F(WindowsShellStartTest, A_program_of_the_system_is_started_by_its_name_with_its_arguments) {
  EXPECT_TRUE(shell.Shell("CMD /c echo told> told.txt", ShellStart::kHiddenWindow));
  EXPECT_TRUE(Appears(L"C:\\Quendra Test\\told.txt"));
}

TEST_F(WindowsShellStartTest, A_program_with_a_path_in_quotes_is_started) {
  ASSERT_TRUE(CopyOfAProgram(L"C:\\Quendra Test\\planted.exe"));
  EXPECT_TRUE(
      shell.Shell("\"C:\\Quendra Test\\planted.exe\" /c echo told> told.txt", ShellStart::kHiddenWindow));
  EXPECT_TRUE(Appears(L"C:\\Quendra Test\\told.txt"));
}

TEST_F(WindowsShellStartTest, A_program_of_the_working_folder_or_beside_this_one_is_not_found_by_its_name) {
  ASSERT_TRUE(CopyOfAProgram(L"C:\\Quendra Test\\planted.exe"));
  const Text beside = FolderOfThisProgram() + u"quendra-planted.exe";
  ASSERT_TRUE(CopyOfAProgram(winapi::Wide(beside)));

  EXPECT_FALSE(shell.Shell("planted.exe /c exit", ShellStart::kHiddenWindow));
  EXPECT_FALSE(shell.Shell("planted /c exit", ShellStart::kHiddenWindow));
  EXPECT_FALSE(shell.Shell("quendra-planted.exe /c exit", ShellStart::kHiddenWindow));

  ::DeleteFileW(winapi::Wide(beside));
}

/// A process of this name that we started, as long as it runs; nullptr for none.
HANDLE OpenChild(const Text& name) {
  const HANDLE all = ::CreateToolhelp32Snapshot(TH32CS_SNAPPROCESS, 0);
  PROCESSENTRY32W entry{};
  entry.dwSize = sizeof entry;
  HANDLE child = nullptr;
  for (BOOL more = ::Process32FirstW(all, &entry); more && !child; more = ::Process32NextW(all, &entry))
    if (entry.th32ParentProcessID == ::GetCurrentProcessId() && winapi::TextOf(entry.szExeFile) == name)
      child = ::OpenProcess(PROCESS_ALL_ACCESS, FALSE, entry.th32ProcessID);
  ::CloseHandle(all);
  return child;
}

/// What a thread there is told when it sets the mode to none.
DWORD ErrorModeOf(HANDLE process) {
  const auto call = reinterpret_cast<LPTHREAD_START_ROUTINE>(reinterpret_cast<void*>(&::SetErrorMode));
  const HANDLE thread = ::CreateRemoteThread(process, nullptr, 0, call, nullptr, 0, nullptr);
  DWORD mode = 0xFFFFFFFF;
  if (::WaitForSingleObject(thread, 10'000) == WAIT_OBJECT_0) ::GetExitCodeThread(thread, &mode);
  ::CloseHandle(thread);
  return mode;
}

TEST_F(WindowsShellStartTest, A_started_program_has_the_systems_error_mode_and_not_ours) {
  const UINT before = ::SetErrorMode(SEM_FAILCRITICALERRORS | SEM_NOOPENFILEERRORBOX);
  const Text line = u"\"" + FolderOfThisProgram() + u"idle_program.exe\"";

  const bool hasStarted = shell.Shell(ToCodePage(line), ShellStart::kHiddenWindow);

  ::SetErrorMode(before);
  ASSERT_TRUE(hasStarted);
  const HANDLE child = OpenChild(u"idle_program.exe");
  ASSERT_TRUE(child);
  EXPECT_EQ(ErrorModeOf(child), 0U);
  ::TerminateProcess(child, 0);
  ::WaitForSingleObject(child, 10'000);
  ::CloseHandle(child);
}

TEST_F(WindowsShellStartTest, What_is_no_program_is_not_started) {
  for (const char* line : {"", " ", "\"\"", "no-such-program", "C:\\no such program.exe", "\0cmd"})
    EXPECT_FALSE(shell.Shell(line, ShellStart::kNormalWindow)) << line;
}

} // namespace
} // namespace quendra::platform::windows
