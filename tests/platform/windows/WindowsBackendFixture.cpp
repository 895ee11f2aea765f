#include "platform/BackendFixture.h"
#include "platform/registry/FreshKeys.h"
#include "platform/windows/WindowsLoopFixture.h"
#include "platform/windows/WindowsMachine.h"
#include "platform/windows/WineDeviations.h"
#include "platform/windows/net/NetworkEndsFixture.h"
#include "winapi/SystemLibrary.h"

#include <wininet.h>

#include <algorithm>
#include <array>
#include <stdexcept>
#include <vector>

namespace quendra::platform {

namespace windows {

namespace {

void Check(bool succeeded, const char* what) {
  if (!succeeded) throw std::runtime_error(what);
}

Text OwnFile() {
  std::array<wchar_t, MAX_PATH> path{};
  return winapi::TextOf(path.data(), ::GetModuleFileNameW(nullptr, path.data(), MAX_PATH));
}

/// A program that has been loaded and doesn't begin.
class Waiting {
 public:
  Waiting() {
    STARTUPINFOW how{};
    how.cb = sizeof how;
    Check(::CreateProcessW(winapi::Wide(OwnFile()), nullptr, nullptr, nullptr, FALSE, CREATE_SUSPENDED,
                           nullptr, nullptr, &how, &started_) != FALSE,
          "no process can be started");
  }
  ~Waiting() {
    ::TerminateProcess(started_.hProcess, 0);
    ::CloseHandle(started_.hThread);
    ::CloseHandle(started_.hProcess);
  }
  Waiting(const Waiting&) = delete;

  std::uint32_t Id() const { return started_.dwProcessId; }
  bool Ends() const { return ::WaitForSingleObject(started_.hProcess, 10'000) == WAIT_OBJECT_0; }

 private:
  PROCESS_INFORMATION started_{};
};

/// The user's own part of the registry as on a system that nobody has used, in place of what is there; it
/// goes with this object.
class FreshUser {
 public:
  FreshUser() {
    Delete(HKEY_CURRENT_USER, kPlace);
    HKEY key = nullptr;
    Check(create_(HKEY_CURRENT_USER, kPlace, 0, nullptr, REG_OPTION_NON_VOLATILE, KEY_ALL_ACCESS, nullptr,
                  &key, nullptr) == ERROR_SUCCESS,
          "no registry for the test");
    for (const FreshKey& fresh : FreshKeys()) {
      if (fresh.root == kCurrentUser) Create(key, fresh.path);
      if (fresh.root == kLocalMachine && std::string_view(fresh.path).starts_with("SYSTEM\\Current"))
        Create(HKEY_LOCAL_MACHINE, fresh.path);
    }
    override_(HKEY_CURRENT_USER, key);
    close_(key);
  }
  ~FreshUser() {
    override_(HKEY_CURRENT_USER, nullptr);
    Delete(HKEY_CURRENT_USER, kPlace);
    Delete(HKEY_LOCAL_MACHINE, L"Software\\Mine");
  }
  FreshUser(const FreshUser&) = delete;

 private:
  static constexpr const wchar_t* kPlace = L"QuendraTest";

  void Create(HKEY root, const char* path) {
    HKEY key = nullptr;
    const Text name = FromCodePage(path);
    create_(root, winapi::Wide(name), 0, nullptr, REG_OPTION_NON_VOLATILE, KEY_ALL_ACCESS, nullptr, &key,
            nullptr);
    close_(key);
  }
  /// With all below it.
  void Delete(HKEY parent, const wchar_t* name) {
    HKEY key = nullptr;
    if (open_(parent, name, 0, KEY_ALL_ACCESS, &key) != ERROR_SUCCESS) return;
    std::array<wchar_t, 256> child{};
    while (true) {
      DWORD length = 256;
      if (enumerate_(key, 0, child.data(), &length, nullptr, nullptr, nullptr, nullptr) != ERROR_SUCCESS)
        break;
      Delete(key, child.data());
    }
    close_(key);
    delete_(parent, name);
  }

  winapi::SystemLibrary advapi32_{L"advapi32.dll"};
  decltype(::RegCreateKeyExW)* create_ = advapi32_.Find<decltype(::RegCreateKeyExW)>("RegCreateKeyExW");
  decltype(::RegOpenKeyExW)* open_ = advapi32_.Find<decltype(::RegOpenKeyExW)>("RegOpenKeyExW");
  decltype(::RegEnumKeyExW)* enumerate_ = advapi32_.Find<decltype(::RegEnumKeyExW)>("RegEnumKeyExW");
  decltype(::RegDeleteKeyW)* delete_ = advapi32_.Find<decltype(::RegDeleteKeyW)>("RegDeleteKeyW");
  decltype(::RegCloseKey)* close_ = advapi32_.Find<decltype(::RegCloseKey)>("RegCloseKey");
  decltype(::RegOverridePredefKey)* override_ =
      advapi32_.Find<decltype(::RegOverridePredefKey)>("RegOverridePredefKey");
};

/// What a browser keeps in the system's cache, until this object goes.
class Browser {
 public:
  ~Browser() {
    const auto erase = wininet_.Find<decltype(::DeleteUrlCacheEntryW)>("DeleteUrlCacheEntryW");
    for (const Text& url : kept_) erase(winapi::Wide(url));
  }

  void Keep(const std::string& address) {
    const Text url = FromCodePage(address);
    std::array<wchar_t, MAX_PATH> path{};
    const auto create = wininet_.Find<decltype(::CreateUrlCacheEntryW)>("CreateUrlCacheEntryW");
    const auto commit = wininet_.Find<decltype(::CommitUrlCacheEntryW)>("CommitUrlCacheEntryW");
    Check(create(winapi::Wide(url), 0, L"txt", path.data(), 0) != FALSE, "no file for the cache");
    const HANDLE file = ::CreateFileW(path.data(), GENERIC_WRITE, 0, nullptr, CREATE_ALWAYS, 0, nullptr);
    ::CloseHandle(file);
    Check(commit(winapi::Wide(url), path.data(), {}, {}, NORMAL_CACHE_ENTRY, nullptr, 0, nullptr, nullptr) !=
              FALSE,
          "no entry of the cache");
    kept_.push_back(url);
  }

 private:
  winapi::SystemLibrary wininet_{L"wininet.dll"};
  std::vector<Text> kept_;
};

class WindowsBackend : public Backend {
 public:
  ~WindowsBackend() override {
    for (const wchar_t* file : {L"C:\\name.txt", L"C:\\WINDOWS\\name.txt", L"C:\\WINDOWS\\name"})
      ::DeleteFileW(file);
  }

  Machine Operations() override { return machine_.Operations(); }
  std::string WhyNot(const std::string& test) const override { return WineDeviationIn(test); }

  std::uint32_t OwnId() const override { return ::GetCurrentProcessId(); }
  std::uint32_t OwnParent() const override {
    // The kernel's basic information, whose sixth field it is.
    using Query = LONG NTAPI(HANDLE, ULONG, void*, ULONG, ULONG*);
    std::array<std::uint32_t, 6> told{};
    const winapi::SystemLibrary ntdll(L"ntdll.dll");
    Check(ntdll.Find<Query>("NtQueryInformationProcess")(::GetCurrentProcess(), 0, told.data(), sizeof told,
                                                         nullptr) == 0,
          "the parent isn't known");
    return told[5];
  }
  std::string OwnName() const override { return OwnPath().substr(OwnPath().rfind('\\') + 1); }
  std::string OwnPath() const override { return ToCodePage(OwnFile()); }
  std::uint32_t MissingId() const override { return 0x7FFFFFFC; }
  std::uint32_t StartWaiting() override {
    started_.push_back(std::make_unique<Waiting>());
    return started_.back()->Id();
  }
  bool HasEnded(std::uint32_t processId) override {
    const auto found = std::ranges::find(started_, processId, &Waiting::Id);
    return found != started_.end() && (*found)->Ends();
  }
  void KeepInCache(const std::string& url) override { browser_.Keep(url); }
  std::optional<std::string> ContentOf(const std::string& path) override {
    const Text name = FromCodePage(path);
    const HANDLE file =
        ::CreateFileW(winapi::Wide(name), GENERIC_READ, FILE_SHARE_READ, nullptr, OPEN_EXISTING, 0, nullptr);
    if (file == INVALID_HANDLE_VALUE) return {};
    std::string bytes(::GetFileSize(file, nullptr), '\0');
    DWORD count = 0;
    const bool isRead =
        ::ReadFile(file, bytes.data(), static_cast<DWORD>(bytes.size()), &count, nullptr) != FALSE;
    ::CloseHandle(file);
    if (!isRead || count != bytes.size()) return {};
    return bytes;
  }
  std::optional<std::string> Layout() const override {
    const auto language =
        static_cast<std::uint16_t>(reinterpret_cast<std::uintptr_t>(::GetKeyboardLayout(0)));
    return ToCodePage(PaddedLeft(HexText(language), 8, u'0'));
  }

  std::uint16_t Listen() override { return network_.Listen(); }
  std::uint16_t Connect(std::uint16_t port) override { return network_.Connect(port); }
  SocketAddress Outside() override { return network_.Outside(); }
  std::unique_ptr<FarEnd> TakeConnection() override { return network_.TakeConnection(); }

  forms::headless::HeadlessDesktop& Desktop() override { return loop_; }
  bool Until(const std::function<bool()>& condition) override { return loop_.WaitFor(condition, 10'000); }
  void Settle() override {
    loop_.WaitFor([] { return false; }, 30);
  }

 private:
  FreshUser user_;
  Browser browser_;
  NetworkEnds network_;
  WindowsLoop loop_;
  WindowsMachine machine_{loop_};
  std::vector<std::unique_ptr<Waiting>> started_;
};

} // namespace

} // namespace windows

Kind KindOfThisSystem() {
  return {"Windows",
          []() -> std::unique_ptr<Backend> { return std::make_unique<windows::WindowsBackend>(); }};
}

} // namespace quendra::platform
