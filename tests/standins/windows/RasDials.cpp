#include "standins/windows/RasDials.h"

#include "platform/remote_access/RemoteAccessNumbers.h"

#include <algorithm>
#include <sstream>

namespace quendra::standins {

namespace {

constexpr std::uint32_t kFirstError = 600;
constexpr std::uint32_t kFirstLateState = 4096;
constexpr const char* kUsual = "0 1 2 3 4 5 14 8192";

class Locked {
 public:
  explicit Locked(CRITICAL_SECTION& section) : section_(section) { ::EnterCriticalSection(&section_); }
  ~Locked() { ::LeaveCriticalSection(&section_); }
  Locked(const Locked&) = delete;
  Locked& operator=(const Locked&) = delete;

 private:
  CRITICAL_SECTION& section_;
};

std::string Variable(const char* name) {
  std::string value(32768, '\0');
  value.resize(::GetEnvironmentVariableA(name, value.data(), static_cast<DWORD>(value.size())));
  return value;
}

std::string ContentOf(const std::string& path) {
  const HANDLE file = ::CreateFileA(path.c_str(), GENERIC_READ, FILE_SHARE_READ | FILE_SHARE_WRITE, nullptr,
                                    OPEN_EXISTING, 0, nullptr);
  if (file == INVALID_HANDLE_VALUE) return {};
  std::string content(65536, '\0');
  DWORD length = 0;
  ::ReadFile(file, content.data(), static_cast<DWORD>(content.size()), &length, nullptr);
  ::CloseHandle(file);
  content.resize(length);
  return content;
}

std::string Trimmed(const std::string& text) {
  const auto begin = text.find_first_not_of(" \t\r");
  return begin == std::string::npos ? "" : text.substr(begin, text.find_last_not_of(" \t\r") + 1 - begin);
}

/// What stands behind the name of that entry; what "*" has where it isn't named.
std::string LineOf(const std::string& entryName) {
  std::string scripts = Variable("QUENDRA_DIALS");
  if (scripts.empty()) scripts = ContentOf(Variable("QUENDRA_DIALS_FILE"));
  std::ranges::replace(scripts, ';', '\n');
  std::string found = kUsual;
  std::istringstream lines(scripts);
  for (std::string line; std::getline(lines, line);) {
    const auto colon = line.find(':');
    if (colon == std::string::npos) continue;
    const std::string name = Trimmed(line.substr(0, colon));
    if (::lstrcmpiA(name.c_str(), entryName.c_str()) == 0) return line.substr(colon + 1);
    if (name == "*") found = line.substr(colon + 1);
  }
  return found;
}

struct Told {
  std::vector<RasDials::Step> steps;
  RasDials::Shared connection;
  HWND window;
};

/// The error that ends the dial.
std::uint32_t Run(const Told& told) {
  for (const RasDials::Step& step : told.steps) {
    if (::WaitForSingleObject(told.connection->hungUp, step.milliseconds) == WAIT_OBJECT_0)
      return platform::kRasUserDisconnection;
    if (step.milliseconds != 0) continue;
    if (told.window) {
      const UINT message = ::RegisterWindowMessageA(platform::kRasDialEventName);
      ::PostMessageW(told.window, message ? message : platform::kRasDialEvent, step.state,
                     static_cast<LPARAM>(step.error));
    }
    if (step.error != 0) return step.error;
  }
  return platform::kRasSuccess;
}

HMODULE ThisLibrary(DWORD flags) {
  HMODULE module = nullptr;
  ::GetModuleHandleExW(flags | GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS,
                       reinterpret_cast<LPCWSTR>(&ThisLibrary), &module);
  return module;
}

DWORD WINAPI RunInThread(void* argument) {
  {
    const std::unique_ptr<Told> told(static_cast<Told*>(argument));
    Run(*told);
  }
  // Whoever loaded the library may have let it go meanwhile.
  ::FreeLibraryAndExitThread(ThisLibrary(GET_MODULE_HANDLE_EX_FLAG_UNCHANGED_REFCOUNT), 0);
}

} // namespace

RasDials::Connection::~Connection() {
  if (hungUp) ::CloseHandle(hungUp);
}

RasDials::RasDials() { ::InitializeCriticalSection(&lock_); }
RasDials::~RasDials() { ::DeleteCriticalSection(&lock_); }

std::vector<RasDials::Step> RasDials::ScriptOf(const std::string& entryName) {
  std::vector<Step> steps;
  std::uint32_t state = 0;
  std::istringstream words(LineOf(entryName));
  for (std::string word; words >> word;) {
    const auto number = static_cast<std::uint32_t>(std::strtoul(word.c_str(), nullptr, 10));
    const bool isError = number >= kFirstError && number < kFirstLateState;
    if (word.ends_with("ms")) {
      steps.push_back({.milliseconds = number});
      continue;
    }
    if (!isError) state = number;
    steps.push_back({.state = state, .error = isError ? number : 0});
  }
  return steps;
}

std::uint32_t RasDials::Start(const Shared& connection, HWND window, std::uint32_t& handle) {
  connection->hungUp = ::CreateEventW(nullptr, TRUE, FALSE, nullptr);
  {
    const Locked locked(lock_);
    handle = ++lastHandle_;
    connections_[handle] = connection;
  }
  auto told = std::make_unique<Told>(Told{ScriptOf(connection->entryName), connection, window});
  if (!window) return Run(*told);
  ThisLibrary(0); // which stays while its thread runs
  const HANDLE thread = ::CreateThread(nullptr, 0, &RunInThread, told.release(), 0, nullptr);
  if (thread) ::CloseHandle(thread);
  return platform::kRasSuccess;
}

bool RasDials::HangUp(std::uint32_t handle) {
  const Locked locked(lock_);
  const auto found = connections_.find(handle);
  if (found == connections_.end()) return false;
  ::SetEvent(found->second->hungUp);
  connections_.erase(found);
  ending_[handle] = 3;
  return true;
}

bool RasDials::HasHandle(std::uint32_t handle) {
  const Locked locked(lock_);
  if (connections_.contains(handle)) return true;
  const auto found = ending_.find(handle);
  if (found == ending_.end()) return false;
  if (--found->second == 0) ending_.erase(found);
  return true;
}

std::map<std::uint32_t, RasDials::Shared> RasDials::All() {
  const Locked locked(lock_);
  return connections_;
}

} // namespace quendra::standins
