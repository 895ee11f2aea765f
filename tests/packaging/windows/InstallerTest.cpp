#include "app/windows/StartedProgram.h"
#include "app/windows/TestFolder.h"
#include "winapi/SystemLibrary.h"

#include <gtest/gtest.h>

#include <shellapi.h>
#include <shlobj.h>
#include <tlhelp32.h>

#include <algorithm>
#include <optional>
#include <set>
#include <vector>

// The installer as a subscriber, or whoever looks after many machines, runs it.

namespace quendra::packaging {
namespace {

using app::windows::FolderOfBuild;
using app::windows::StartedProgram;
using app::windows::Until;

constexpr const wchar_t* kRemoval = L"Software\\Microsoft\\Windows\\CurrentVersion\\Uninstall\\Quendra";
constexpr const wchar_t* kOwnKey = L"Software\\Quendra";

Text Installer() { return FolderOfBuild() + u"\\" + FromCodePage(QUENDRA_INSTALLER); }

bool IsThere(const Text& file) { return ::GetFileAttributesW(winapi::Wide(file)) != INVALID_FILE_ATTRIBUTES; }

std::set<Text> FilesIn(const Text& folder) {
  std::set<Text> names;
  WIN32_FIND_DATAW found{};
  const Text all = folder + u"\\*";
  const HANDLE search = ::FindFirstFileW(winapi::Wide(all), &found);
  if (search == INVALID_HANDLE_VALUE) return names;
  do names.insert(winapi::TextOf(found.cFileName));
  while (::FindNextFileW(search, &found));
  ::FindClose(search);
  names.erase(u".");
  names.erase(u"..");
  return names;
}

/// A value of the machine's registry; none where it isn't there.
std::optional<Text> Registered(const wchar_t* key, const wchar_t* name) {
  const winapi::SystemLibrary advapi32(L"advapi32.dll");
  HKEY opened = nullptr;
  if (advapi32.Find<decltype(::RegOpenKeyExW)>("RegOpenKeyExW")(HKEY_LOCAL_MACHINE, key, 0, KEY_READ,
                                                                &opened))
    return std::nullopt;
  wchar_t value[512] = {};
  DWORD bytes = sizeof value - sizeof *value;
  const LSTATUS status = advapi32.Find<decltype(::RegQueryValueExW)>("RegQueryValueExW")(
      opened, name, nullptr, nullptr, reinterpret_cast<BYTE*>(value), &bytes);
  advapi32.Find<decltype(::RegCloseKey)>("RegCloseKey")(opened);
  return status == ERROR_SUCCESS ? std::optional<Text>(winapi::TextOf(value)) : std::nullopt;
}

/// A folder that the system has a number for.
Text SystemsFolder(int number) {
  const winapi::SystemLibrary shell32(L"shell32.dll");
  wchar_t path[MAX_PATH] = {};
  shell32.Find<decltype(::SHGetFolderPathW)>("SHGetFolderPathW")(nullptr, number, nullptr, 0, path);
  return winapi::TextOf(path);
}

DWORD StatusOf(const Text& program, const Text& arguments) {
  const StartedProgram run(program, {}, arguments);
  return run.Ends() ? run.Status() : STILL_ACTIVE;
}

class InstallerTest : public testing::Test {
 protected:
  ~InstallerTest() override { EXPECT_TRUE(!IsThere(folder + u"\\remove.exe") || Remove()); }

  static DWORD Install() { return StatusOf(Installer(), u"/S"); }
  /// The remover goes on as a copy of itself elsewhere, so that it can remove itself, too.
  bool Remove() const {
    const StartedProgram remover(folder + u"\\remove.exe", {}, u"/S");
    return Until([&] { return !IsThere(folder + u"\\remove.exe") && !Registered(kOwnKey, L"Folder"); });
  }
  /// Without such a copy, whose status nobody learns.
  DWORD StatusOfRemoval() const { return StatusOf(folder + u"\\remove.exe", u"/S _?=" + folder); }

  const Text folder = SystemsFolder(CSIDL_PROGRAM_FILES) + u"\\Quendra";
  const Text shortcut = SystemsFolder(CSIDL_COMMON_PROGRAMS) + u"\\Quendra.lnk";
};

TEST_F(InstallerTest, Silently_installs_the_program_its_remover_and_nothing_else) {
  ASSERT_EQ(Install(), 0U);

  EXPECT_EQ(FilesIn(folder), (std::set<Text>{u"quendra.exe", u"remove.exe"}));
  EXPECT_TRUE(IsThere(shortcut));
  EXPECT_EQ(Registered(kOwnKey, L"Folder"), folder);
  EXPECT_EQ(Registered(kRemoval, L"DisplayName"), u"Quendra");
  EXPECT_EQ(Registered(kRemoval, L"Publisher"), u"זלמר");
  EXPECT_EQ(Registered(kRemoval, L"DisplayIcon"), folder + u"\\quendra.exe");
  EXPECT_EQ(Registered(kRemoval, L"QuietUninstallString"), u"\"" + folder + u"\\remove.exe\" /S");
}

TEST_F(InstallerTest, Leaves_the_systems_folder_as_it_is) {
  const Text system = winapi::SystemFolder();
  const std::set<Text> before = FilesIn(system);
  ASSERT_EQ(Install(), 0U);
  EXPECT_EQ(FilesIn(system), before);
}

TEST_F(InstallerTest, What_is_installed_runs) {
  ASSERT_EQ(Install(), 0U);
  const StartedProgram program(folder + u"\\quendra.exe");
  EXPECT_TRUE(program.Shows(u"המשך"));
}

TEST_F(InstallerTest, Installs_over_itself) {
  ASSERT_EQ(Install(), 0U);
  EXPECT_EQ(Install(), 0U);
  EXPECT_TRUE(IsThere(folder + u"\\quendra.exe"));
}

TEST_F(InstallerTest, Removes_all_of_it) {
  ASSERT_EQ(Install(), 0U);

  ASSERT_TRUE(Remove());

  EXPECT_FALSE(IsThere(folder));
  EXPECT_FALSE(IsThere(shortcut));
  EXPECT_EQ(Registered(kRemoval, L"DisplayName"), std::nullopt);
  EXPECT_EQ(Registered(kOwnKey, L"Folder"), std::nullopt);
}

TEST_F(InstallerTest, Leaves_what_somebody_else_laid_into_its_folder) {
  ASSERT_EQ(Install(), 0U);
  const Text notes = folder + u"\\notes.txt";
  ::CloseHandle(::CreateFileW(winapi::Wide(notes), GENERIC_WRITE, 0, nullptr, CREATE_ALWAYS, 0, nullptr));

  ASSERT_TRUE(Remove());

  EXPECT_EQ(FilesIn(folder), std::set<Text>{u"notes.txt"});
  ::DeleteFileW(winapi::Wide(notes));
  ::RemoveDirectoryW(winapi::Wide(folder));
}

TEST_F(InstallerTest, Tells_by_its_status_that_the_program_runs_and_touches_nothing) {
  ASSERT_EQ(Install(), 0U);
  const StartedProgram program(folder + u"\\quendra.exe");
  ASSERT_TRUE(program.Shows(u"המשך"));

  EXPECT_EQ(Install(), 2U);
  EXPECT_EQ(StatusOfRemoval(), 2U);

  EXPECT_TRUE(IsThere(folder + u"\\quendra.exe"));
  EXPECT_EQ(Registered(kRemoval, L"DisplayName"), u"Quendra");
}

TEST_F(InstallerTest, Tells_by_its_status_that_it_cannot_write) {
  // A file where its folder would be.
  ::CloseHandle(::CreateFileW(winapi::Wide(folder), GENERIC_WRITE, 0, nullptr, CREATE_ALWAYS, 0, nullptr));
  EXPECT_EQ(Install(), 3U);
  ::DeleteFileW(winapi::Wide(folder));
  EXPECT_EQ(Registered(kRemoval, L"DisplayName"), std::nullopt);
}

/// Looks for a window of a process by a part of its text.
struct TextSearch {
  DWORD process;
  Text part;
  bool found = false;
};

BOOL CALLBACK HasPart(HWND window, LPARAM place) {
  auto& search = *reinterpret_cast<TextSearch*>(place);
  DWORD process = 0;
  ::GetWindowThreadProcessId(window, &process);
  if (process != search.process) return TRUE;
  wchar_t text[2048] = {};
  ::SendMessageW(window, WM_GETTEXT, 2048, reinterpret_cast<LPARAM>(text));
  search.found |= ::IsWindowVisible(window) && winapi::TextOf(text).find(search.part) != Text::npos;
  ::EnumChildWindows(window, HasPart, place);
  return !search.found;
}

bool Tells(const StartedProgram& program, const Text& part) {
  return Until([&] {
    TextSearch search{program.Id(), part};
    ::EnumWindows(HasPart, reinterpret_cast<LPARAM>(&search));
    return search.found;
  });
}

TEST_F(InstallerTest, Is_mirrored_and_tells_on_its_last_page_where_the_capture_library_comes_from) {
  const StartedProgram setup(Installer());
  ASSERT_TRUE(Tells(setup, u"Quendra"));
  const auto window = [&] { return ::FindWindowW(L"#32770", nullptr); };
  ASSERT_TRUE(Until([&] { return window() != nullptr; }));
  EXPECT_TRUE(::GetWindowLongW(window(), GWL_EXSTYLE) & (WS_EX_LAYOUTRTL | WS_EX_RTLREADING));
  ASSERT_TRUE(Until([&] { return ::IsWindowEnabled(::GetDlgItem(window(), IDOK)); }));

  ::PostMessageW(window(), WM_COMMAND, IDOK, 0);

  EXPECT_TRUE(Tells(setup, u"npcap.com"));
  EXPECT_TRUE(Tells(setup, u"www.winpcap.org"));
}

/// All that run, with their names in small letters.
std::vector<PROCESSENTRY32W> Processes() {
  std::vector<PROCESSENTRY32W> found;
  const HANDLE all = ::CreateToolhelp32Snapshot(TH32CS_SNAPPROCESS, 0);
  PROCESSENTRY32W entry{};
  entry.dwSize = sizeof entry;
  for (BOOL more = ::Process32FirstW(all, &entry); more; more = ::Process32NextW(all, &entry)) {
    ::CharLowerW(entry.szExeFile);
    found.push_back(entry);
  }
  ::CloseHandle(all);
  return found;
}

/// The names of those that a process has started and that still run.
std::set<Text> ChildrenOf(DWORD process) {
  std::set<Text> names;
  for (const PROCESSENTRY32W& entry : Processes())
    if (entry.th32ParentProcessID == process) names.insert(winapi::TextOf(entry.szExeFile));
  return names;
}

/// Ends the program that somebody else has started; false when none runs.
bool EndTheProgram() {
  for (const PROCESSENTRY32W& entry : Processes()) {
    if (winapi::TextOf(entry.szExeFile) != u"quendra.exe") continue;
    const HANDLE program = ::OpenProcess(PROCESS_TERMINATE | SYNCHRONIZE, FALSE, entry.th32ProcessID);
    ::TerminateProcess(program, 0);
    const bool hasEnded = ::WaitForSingleObject(program, 10'000) == WAIT_OBJECT_0;
    ::CloseHandle(program);
    return hasEnded;
  }
  return false;
}

TEST_F(InstallerTest, Has_the_desktop_start_the_program_and_does_not_start_it_with_its_own_rights) {
  const StartedProgram setup(Installer());
  const auto window = [] { return ::FindWindowW(L"#32770", nullptr); };
  ASSERT_TRUE(Until([&] { return ::IsWindowEnabled(::GetDlgItem(window(), IDOK)); }));
  ::PostMessageW(window(), WM_COMMAND, IDOK, 0);
  ASSERT_TRUE(Tells(setup, u"npcap.com"));

  ::PostMessageW(window(), WM_COMMAND, IDOK, 0);

  std::set<Text> started;
  EXPECT_TRUE(Until([&] {
    started.merge(ChildrenOf(setup.Id()));
    return !setup.Runs();
  }));
  started.erase(u""); // one that is just being made has no name yet
  EXPECT_EQ(started, std::set<Text>{u"explorer.exe"});
  EXPECT_TRUE(Until(EndTheProgram));
}

} // namespace
} // namespace quendra::packaging
