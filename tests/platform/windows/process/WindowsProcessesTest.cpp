#include "platform/windows/process/WindowsProcesses.h"

#include "platform/windows/process/PathInCodePage.h"

#include <gtest/gtest.h>

#include <array>

namespace quendra::platform::windows {
namespace {

struct WindowsProcessesTest : testing::Test {
  LastError lastError;
  WindowsProcesses processes{lastError};
};

TEST_F(WindowsProcessesTest, An_error_stays_until_the_next_question_whatever_the_system_is_asked_meanwhile) {
  ASSERT_EQ(processes.OpenProcess(1040, false, 0x7FFFFFFC), kNoHandle);
  ASSERT_EQ(processes.GetLastError(), kInvalidParameter);

  ::SetLastError(0);
  EXPECT_EQ(processes.GetCurrentProcess(), kOwnProcess);

  EXPECT_EQ(processes.GetLastError(), kInvalidParameter);
  const Handle own = processes.OpenProcess(1040, false, ::GetCurrentProcessId());
  EXPECT_EQ(processes.GetLastError(), kNoError);
  processes.CloseHandle(own);
}

TEST_F(WindowsProcessesTest, More_modules_than_there_is_room_for_fill_the_room) {
  std::array<ModuleHandle, 1> one{};
  EXPECT_TRUE(processes.EnumProcessModules(kOwnProcess, one));
  EXPECT_NE(one[0], ModuleHandle());
}

TEST_F(WindowsProcessesTest, The_path_of_a_program_is_told_without_its_modules) {
  std::array<wchar_t, MAX_PATH> own{};
  ::GetModuleFileNameW(nullptr, own.data(), MAX_PATH);
  std::string path(kPathRoom, ' ');
  const std::uint32_t length = processes.GetModuleFileNameExA(kOwnProcess, ModuleHandle(), path, 500);
  EXPECT_EQ(FromCodePage(path.substr(0, length)), winapi::TextOf(own.data()));
  EXPECT_EQ(processes.GetLastError(), kNoError);
}

TEST_F(WindowsProcessesTest, The_path_of_no_process_is_none_for_a_reason) {
  std::string path(kPathRoom, ' ');
  EXPECT_EQ(processes.GetModuleFileNameExA(kNoHandle, ModuleHandle(), path, 500), 0u);
  EXPECT_EQ(processes.GetLastError(), kErrorInvalidHandle);
}

TEST(PastRedirectionTest, A_file_of_the_systems_folder_goes_by_its_second_name) {
  const Text folder = u"C:\\Windows\\system32";
  EXPECT_EQ(PastRedirection(u"C:\\Windows\\System32\\svchost.exe", folder),
            u"C:\\Windows\\Sysnative\\svchost.exe");
  EXPECT_EQ(PastRedirection(u"c:\\windows\\SYSTEM32\\wbem\\a.exe", folder),
            u"C:\\Windows\\Sysnative\\wbem\\a.exe");
}

TEST(PastRedirectionTest, Files_elsewhere_keep_their_names) {
  const Text folder = u"C:\\Windows\\system32";
  for (const Text path : {u"C:\\Windows\\explorer.exe", u"C:\\Windows\\System32x\\a.exe",
                          u"C:\\Windows\\SysWOW64\\a.exe", u"C:\\Windows\\system32", u""}) {
    EXPECT_EQ(PastRedirection(path, folder), path);
    EXPECT_EQ(PastRedirection(path, u""), path);
  }
}

TEST(WithoutKernelsNamesTest, Programs_that_the_system_starts_first_lie_where_a_file_is_found) {
  const Text folder = u"C:\\WINDOWS\\system32";
  EXPECT_EQ(WithoutKernelsNames(u"\\SystemRoot\\System32\\smss.exe", folder),
            u"C:\\WINDOWS\\System32\\smss.exe");
  EXPECT_EQ(WithoutKernelsNames(u"\\??\\C:\\WINDOWS\\system32\\csrss.exe", folder),
            u"C:\\WINDOWS\\system32\\csrss.exe");
}

TEST(WithoutKernelsNamesTest, Other_paths_stay) {
  for (const Text path : {u"C:\\SystemRoot\\a.exe", u"\\\\server\\share\\a.exe", u"\\SystemRootx\\a.exe",
                          u"\\??\\UNC\\server\\a.exe", u"\\??\\", u""})
    EXPECT_EQ(WithoutKernelsNames(path, u"C:\\WINDOWS\\system32"), path);
  EXPECT_EQ(WithoutKernelsNames(u"\\SystemRoot\\a.exe", u""), u"\\SystemRoot\\a.exe");
}

struct PathInCodePageTest : testing::Test {
  ~PathInCodePageTest() override {
    ::DeleteFileW(winapi::Wide(path));
    ::RemoveDirectoryW(L"C:\\QuendraTest");
  }

  void Make(const Text& file) {
    path = file;
    ::CreateDirectoryW(L"C:\\QuendraTest", nullptr);
    ::CloseHandle(::CreateFileW(winapi::Wide(path), GENERIC_WRITE, 0, nullptr, CREATE_ALWAYS, 0, nullptr));
  }
  bool LeadsBack(const std::string& told) {
    const Text found = FromCodePage(told);
    return ::GetFileAttributesW(winapi::Wide(found)) != INVALID_FILE_ATTRIBUTES;
  }

  Text path;
};

TEST_F(PathInCodePageTest, A_path_that_the_page_can_hold_is_as_it_is) {
  Make(u"C:\\QuendraTest\\שלום עולם.exe");
  EXPECT_EQ(PathInCodePage(path), "C:\\QuendraTest\\\xF9\xEC\xE5\xED \xF2\xE5\xEC\xED.exe");
}

TEST_F(PathInCodePageTest, Another_still_leads_to_its_file) {
  Make(u"C:\\QuendraTest\\\u65E5\u672C.exe");
  const std::string told = PathInCodePage(path);
  EXPECT_EQ(told.find('?'), std::string::npos) << told;
  EXPECT_TRUE(LeadsBack(told)) << told;
}

TEST_F(PathInCodePageTest, A_file_that_is_not_there_has_question_marks) {
  EXPECT_EQ(PathInCodePage(u"C:\\QuendraTest\\\u65E5\u672C.exe"), "C:\\QuendraTest\\??.exe");
}

} // namespace
} // namespace quendra::platform::windows
