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
    decltype(::RasEnumEntriesA)* EnumEntries = nullptr;
    decltype(::RasDeleteEntryA)* DeleteEntry = nullptr;
    decltype(::RasGetEntryPropertiesA)* GetEntryProperties = nullptr;
    decltype(::RasSetEntryPropertiesA)* SetEntryProperties = nullptr;
    decltype(::RasGetEntryDialParamsA)* GetEntryDialParams = nullptr;
    decltype(::RasSetEntryDialParamsA)* SetEntryDialParams = nullptr;
    decltype(::RasEnumDevicesA)* EnumDevices = nullptr;
    decltype(::RasDialA)* Dial = nullptr;
    decltype(::RasHangUpA)* HangUp = nullptr;
    decltype(::RasEnumConnectionsA)* EnumConnections = nullptr;
    decltype(::RasGetErrorStringA)* GetErrorString = nullptr;
  };
  const Table& Calls();

 private:
  Load load_;
  std::optional<winapi::SystemLibrary> library_;
  Table table_;
};

} // namespace quendra::platform::windows
