#include "platform/windows/remote_access/StandInRemoteAccess.h"

#include <ras.h>

#include <array>
#include <stdexcept>

namespace quendra::platform::windows {

namespace {

std::string NewFile() {
  char folder[MAX_PATH] = {};
  char file[MAX_PATH] = {};
  if (::GetTempPathA(MAX_PATH, folder) == 0 || ::GetTempFileNameA(folder, "ras", 0, file) == 0)
    throw std::runtime_error("there is no place for a phone book");
  return file;
}

/// The lines are the library's, which stays, and would be the next test's.
void HangUpAll(const winapi::SystemLibrary& library) {
  std::array<RASCONNW, 64> lines{};
  lines[0].dwSize = sizeof lines[0];
  DWORD bytes = sizeof lines;
  DWORD count = 0;
  library.Find<decltype(::RasEnumConnectionsW)>("RasEnumConnectionsW")(lines.data(), &bytes, &count);
  for (DWORD i = 0; i < count; ++i) library.Find<decltype(::RasHangUpW)>("RasHangUpW")(lines[i].hrasconn);
}

} // namespace

winapi::SystemLibrary StandInRasLibrary() {
  wchar_t program[MAX_PATH] = {};
  const Text path = winapi::TextOf(program, ::GetModuleFileNameW(nullptr, program, MAX_PATH));
  auto library =
      winapi::SystemLibrary::At(path.substr(0, path.rfind(u'\\')) + u"\\standins\\standin_rasapi32.dll");
  if (!library.IsThere()) throw std::runtime_error("the stand-in library isn't there");
  return library;
}

StandInRemoteAccess::StandInRemoteAccess(const std::string& dials) : file_(NewFile()) {
  ::SetEnvironmentVariableA("QUENDRA_PHONE_BOOK", file_.c_str());
  Script(dials);
}

StandInRemoteAccess::~StandInRemoteAccess() {
  HangUpAll(StandInRasLibrary());
  for (const char* name : {"QUENDRA_PHONE_BOOK", "QUENDRA_DIALS"}) ::SetEnvironmentVariableA(name, nullptr);
  ::DeleteFileA(file_.c_str());
}

void StandInRemoteAccess::Script(const std::string& dials) {
  ::SetEnvironmentVariableA("QUENDRA_DIALS", dials.c_str());
}

} // namespace quendra::platform::windows
