#include "platform/windows/files/WindowsFiles.h"

#include "runtime/Fault.h"
#include "winapi/Winapi.h"

#include <gtest/gtest.h>

#include <array>
#include <set>

namespace quendra::platform::windows {
namespace {

Text WindowsFolder() {
  std::array<wchar_t, MAX_PATH> folder{};
  return winapi::TextOf(folder.data(), ::GetWindowsDirectoryW(folder.data(), MAX_PATH));
}

/// A folder of its own on drive C:.
struct WindowsFilesTest : testing::Test {
  static constexpr const wchar_t* kFolder = L"C:\\QuendraTest";

  WindowsFilesTest() { ::CreateDirectoryW(kFolder, nullptr); }
  ~WindowsFilesTest() override {
    for (const Text& name : Names()) {
      const Text path = u"C:\\QuendraTest\\" + name;
      ::SetFileAttributesW(winapi::Wide(path), FILE_ATTRIBUTE_NORMAL);
      ::DeleteFileW(winapi::Wide(path));
    }
    ::RemoveDirectoryW(kFolder);
  }

  static std::set<Text> Names() {
    std::set<Text> names;
    WIN32_FIND_DATAW found{};
    const HANDLE walk = ::FindFirstFileW(L"C:\\QuendraTest\\*", &found);
    do {
      const Text name = winapi::TextOf(found.cFileName);
      if (name != u"." && name != u"..") names.insert(name);
    } while (::FindNextFileW(walk, &found));
    ::FindClose(walk);
    return names;
  }
  int FaultOf(const std::string& path) {
    try {
      files.Output(path, "text");
    } catch (const Fault& fault) {
      return fault.number;
    }
    return 0;
  }

  WindowsFiles files;
};

TEST_F(WindowsFilesTest, The_directory_is_the_systems_own) {
  std::string buffer(250, ' ');
  const std::uint32_t length = files.GetWindowsDirectoryA(buffer);
  EXPECT_EQ(buffer.substr(0, length), ToCodePage(WindowsFolder()));
  EXPECT_EQ(buffer[length], '\0');
}

TEST_F(WindowsFilesTest, A_file_with_a_Hebrew_name_stands_under_it_and_nothing_else_is_left) {
  files.Output("C:\\QuendraTest\\\xF9\xEC\xE5\xED.txt", "text");
  files.Output("C:\\QuendraTest\\\xF9\xEC\xE5\xED.txt", "again");
  EXPECT_EQ(Names(), std::set<Text>{u"שלום.txt"});
}

TEST_F(WindowsFilesTest, A_file_that_may_not_be_written_over_stays_which_is_fault_70) {
  files.Output("C:\\QuendraTest\\kept", "first");
  ::SetFileAttributesW(L"C:\\QuendraTest\\kept", FILE_ATTRIBUTE_READONLY);

  EXPECT_EQ(FaultOf("C:\\QuendraTest\\kept"), 70);

  EXPECT_EQ(Names(), std::set<Text>{u"kept"});
}

TEST_F(WindowsFilesTest, A_file_that_another_has_open_alone_stays_which_is_fault_70) {
  files.Output("C:\\QuendraTest\\open", "first");
  const HANDLE open =
      ::CreateFileW(L"C:\\QuendraTest\\open", GENERIC_READ, 0, nullptr, OPEN_EXISTING, 0, nullptr);

  EXPECT_EQ(FaultOf("C:\\QuendraTest\\open"), 70);

  ::CloseHandle(open);
  EXPECT_EQ(Names(), std::set<Text>{u"open"});
}

} // namespace
} // namespace quendra::platform::windows
