#include "app/windows/StartedProgram.h"

#include "app/windows/TestFolder.h"
#include "winapi/SystemLibrary.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <memory>
#include <span>

// Libraries that lie beside the program and in the folder that it works in, under the names of the system's
// own.

namespace quendra::app::windows {
namespace {

constexpr const char16_t* kNames[] = {
    u"apphelp.dll", u"comctl32.dll", u"dhcpcsvc.dll", u"dnsapi.dll", u"iphlpapi.dll", u"mprapi.dll",
    u"msctf.dll",   u"msi.dll",      u"oleacc.dll",   u"psapi.dll",  u"rasapi32.dll", u"userenv.dll",
    u"uxtheme.dll", u"version.dll",  u"wininet.dll",  u"wpcap.dll",  u"ws2_32.dll"};

/// How libraries are looked for as long as it lives.
class OrderOfLibraries {
 public:
  OrderOfLibraries() {
    // As XP does without a service pack: the working folder comes before the system's own.
    SetNumber(HKEY_LOCAL_MACHINE, kSession, L"SafeDllSearchMode", 0);
    // As Windows does: what is found is run, and not what Wine has of that name.
    for (const char16_t* name : kNames) SetText(HKEY_CURRENT_USER, kOfWine, StemOf(name), u"native,builtin");
  }
  ~OrderOfLibraries() {
    SetNumber(HKEY_LOCAL_MACHINE, kSession, L"SafeDllSearchMode", 1);
    for (const char16_t* name : kNames) SetText(HKEY_CURRENT_USER, kOfWine, StemOf(name), u"builtin,native");
  }
  OrderOfLibraries(const OrderOfLibraries&) = delete;

 private:
  static constexpr const wchar_t* kSession = L"System\\CurrentControlSet\\Control\\Session Manager";
  static constexpr const wchar_t* kOfWine = L"Software\\Wine\\DllOverrides";

  static Text StemOf(const Text& name) { return name.substr(0, name.find(u'.')); }
  void SetNumber(HKEY root, const wchar_t* key, const wchar_t* name, DWORD number) const {
    Set(root, key, name, REG_DWORD, {reinterpret_cast<const BYTE*>(&number), sizeof number});
  }
  void SetText(HKEY root, const wchar_t* key, const Text& name, const Text& text) const {
    Set(root, key, winapi::Wide(name), REG_SZ,
        {reinterpret_cast<const BYTE*>(text.c_str()), (text.size() + 1) * sizeof(char16_t)});
  }
  void Set(HKEY root, const wchar_t* key, const wchar_t* name, DWORD kind,
           std::span<const BYTE> value) const {
    HKEY opened = nullptr;
    create_(root, key, 0, nullptr, 0, KEY_SET_VALUE, nullptr, &opened, nullptr);
    set_(opened, name, 0, kind, value.data(), static_cast<DWORD>(value.size()));
    close_(opened);
  }

  winapi::SystemLibrary advapi32_{L"advapi32.dll"};
  decltype(::RegCreateKeyExW)* create_ = advapi32_.Find<decltype(::RegCreateKeyExW)>("RegCreateKeyExW");
  decltype(::RegSetValueExW)* set_ = advapi32_.Find<decltype(::RegSetValueExW)>("RegSetValueExW");
  decltype(::RegCloseKey)* close_ = advapi32_.Find<decltype(::RegCloseKey)>("RegCloseKey");
};

/// A folder with a program and one that it works in, and all of the libraries in each.
class PlantedFolders {
 public:
  explicit PlantedFolders(const Text& program) : program_(beside_.Take(FolderOfBuild() + program)) {
    for (const TestFolder* folder : {&beside_, &working_})
      for (const char16_t* name : kNames)
        folder->Take(FolderOfBuild() + u"\\standins\\standin_planted.dll", name);
  }

  const Text& Program() const { return program_; }
  const Text& Working() const { return working_.Path(); }
  bool WasLoadedBeside(const Text& name) const { return beside_.Has(name + u".loaded"); }
  bool WasLoadedFromWorking(const Text& name) const { return working_.Has(name + u".loaded"); }
  void RemoveBeside() const {
    for (const char16_t* name : kNames) beside_.Remove(name);
  }

 private:
  TestFolder beside_;
  TestFolder working_;
  Text program_;
};

/// One run of the program through everything that asks a library for something.
class PlantedLibraries : public testing::TestWithParam<const char16_t*> {
 protected:
  static void SetUpTestSuite() {
    const OrderOfLibraries order;
    run_ = std::make_unique<Run>();
  }
  static void TearDownTestSuite() { run_.reset(); }

  struct Run {
    PlantedFolders folders{u"\\quendra.exe"};
    StartedProgram program{folders.Program(), folders.Working()};
    Text missed = Walk();

    /// Start, capture, the process table, sockets, mail programs, phone book, and the checks up to the
    /// browser's cache. Gives what didn't come; empty for none.
    Text Walk() const {
      for (const char16_t* step : {u"המשך", u"ניטור תהליכים", u"שלח דוח", u"התחברות ראשונה",
                                   u"שלב 2: הגדרת תוכנת הדואר", u"בעית חיבור", u"OK", u"בעיות גלישה"})
        if (!program.Click(step)) return step;
      return Until([&] { return !program.Loaded(u"wininet.dll").empty(); }) ? Text() : u"wininet.dll";
    }
  };
  static inline std::unique_ptr<Run> run_;
};

TEST_P(PlantedLibraries, Are_not_loaded_by_the_program) {
  ASSERT_EQ(ToUtf8(run_->missed), "");
  for (const Text& path : run_->program.Loaded(GetParam()))
    EXPECT_TRUE(path.starts_with(u"c:\\windows\\")) << ToUtf8(path);
  EXPECT_FALSE(run_->folders.WasLoadedBeside(GetParam()));
  EXPECT_FALSE(run_->folders.WasLoadedFromWorking(GetParam()));
}

TEST_P(PlantedLibraries, Find_those_of_the_system_loaded_in_their_place) {
  ASSERT_EQ(ToUtf8(run_->missed), "");
  EXPECT_FALSE(run_->program.Loaded(GetParam()).empty());
}

TEST_P(PlantedLibraries, Are_loaded_by_a_program_that_asks_for_them_by_name) {
  const OrderOfLibraries order;
  const PlantedFolders folders(u"\\standins\\standin_careless.exe");

  ASSERT_TRUE(StartedProgram(folders.Program(), folders.Working(), GetParam()).Ends());
  folders.RemoveBeside();
  ASSERT_TRUE(StartedProgram(folders.Program(), folders.Working(), GetParam()).Ends());

  EXPECT_TRUE(folders.WasLoadedBeside(GetParam()));
  EXPECT_TRUE(folders.WasLoadedFromWorking(GetParam()));
}

INSTANTIATE_TEST_SUITE_P(Names, PlantedLibraries, testing::ValuesIn(kNames), [](const auto& name) {
  const std::string file = ToUtf8(name.param);
  return file.substr(0, file.find('.'));
});

} // namespace
} // namespace quendra::app::windows
