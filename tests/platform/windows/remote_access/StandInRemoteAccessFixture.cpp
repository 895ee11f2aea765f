#include "platform/windows/remote_access/StandInRemoteAccess.h"

#include <stdexcept>

namespace quendra::platform::windows {

namespace {

constexpr DWORD kPatience = 10'000;
constexpr DWORD kRound = 10;

std::string NewFile() {
  char folder[MAX_PATH] = {};
  char file[MAX_PATH] = {};
  if (::GetTempPathA(MAX_PATH, folder) == 0 || ::GetTempFileNameA(folder, "ras", 0, file) == 0)
    throw std::runtime_error("there is no place for a phone book");
  return file;
}

void HandleMessages() {
  for (MSG message; ::PeekMessageW(&message, nullptr, 0, 0, PM_REMOVE);) ::DispatchMessageW(&message);
}

} // namespace

winapi::SystemLibrary StandInRasLibrary() {
  wchar_t program[MAX_PATH] = {};
  const Text path = winapi::TextOf(program, ::GetModuleFileNameW(nullptr, program, MAX_PATH));
  auto library = winapi::SystemLibrary::At(path.substr(0, path.rfind(u'\\')) + u"\\standins\\rasapi32.dll");
  if (!library.IsThere()) throw std::runtime_error("the stand-in library isn't there");
  return library;
}

StandInRemoteAccess::StandInRemoteAccess(const std::string& dials) : file_(NewFile()) {
  ::SetEnvironmentVariableA("QUENDRA_PHONE_BOOK", file_.c_str());
  Script(dials);
}

StandInRemoteAccess::~StandInRemoteAccess() {
  for (const char* name : {"QUENDRA_PHONE_BOOK", "QUENDRA_DIALS"}) ::SetEnvironmentVariableA(name, nullptr);
  ::DeleteFileA(file_.c_str());
}

void StandInRemoteAccess::Script(const std::string& dials) {
  ::SetEnvironmentVariableA("QUENDRA_DIALS", dials.c_str());
}

bool StandInRemoteAccess::Until(const std::function<bool()>& condition) {
  for (const DWORD begin = ::GetTickCount(); ::GetTickCount() - begin < kPatience;) {
    HandleMessages();
    Desktop.PumpOnce();
    if (condition()) return true;
    ::MsgWaitForMultipleObjects(0, nullptr, FALSE, kRound, QS_ALLINPUT);
  }
  return false;
}

} // namespace quendra::platform::windows
