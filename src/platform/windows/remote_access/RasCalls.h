#pragma once

#include "winapi/SystemLibrary.h"

#include <ras.h>

#include <functional>
#include <optional>

namespace quendra::platform::windows {

/// The calls of remote access, from a library that is loaded when the first of them is asked for.
class RasCalls {
 public:
  using Load = std::function<winapi::SystemLibrary()>;

  explicit RasCalls(Load load = [] { return winapi::SystemLibrary(L"rasapi32.dll"); });

  /// nullptr where the system has no remote access.
  struct Table {
    decltype(::RasEnumEntriesW)* EnumEntries = nullptr;
    decltype(::RasDeleteEntryW)* DeleteEntry = nullptr;
    decltype(::RasGetEntryPropertiesW)* GetEntryProperties = nullptr;
    decltype(::RasSetEntryPropertiesW)* SetEntryProperties = nullptr;
    decltype(::RasGetEntryDialParamsW)* GetEntryDialParams = nullptr;
    decltype(::RasSetEntryDialParamsW)* SetEntryDialParams = nullptr;
    decltype(::RasEnumDevicesW)* EnumDevices = nullptr;
    decltype(::RasDialW)* Dial = nullptr;
    decltype(::RasHangUpW)* HangUp = nullptr;
    decltype(::RasGetConnectStatusW)* GetConnectStatus = nullptr;
    decltype(::RasEnumConnectionsW)* EnumConnections = nullptr;
    decltype(::RasGetErrorStringW)* GetErrorString = nullptr;
  };
  const Table& Calls();

 private:
  Load load_;
  std::optional<winapi::SystemLibrary> library_;
  Table table_;
};

} // namespace quendra::platform::windows
