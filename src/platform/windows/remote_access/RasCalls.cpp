#include "platform/windows/remote_access/RasCalls.h"

namespace quendra::platform::windows {

RasCalls::RasCalls(Load load) : load_(std::move(load)) {}

const RasCalls::Table& RasCalls::Calls() {
  if (library_) return table_;
  const winapi::SystemLibrary& library = library_.emplace(load_());
  Find(library, "RasEnumEntriesW", table_.EnumEntries);
  Find(library, "RasDeleteEntryW", table_.DeleteEntry);
  Find(library, "RasGetEntryPropertiesW", table_.GetEntryProperties);
  Find(library, "RasSetEntryPropertiesW", table_.SetEntryProperties);
  Find(library, "RasGetEntryDialParamsW", table_.GetEntryDialParams);
  Find(library, "RasSetEntryDialParamsW", table_.SetEntryDialParams);
  Find(library, "RasEnumDevicesW", table_.EnumDevices);
  Find(library, "RasDialW", table_.Dial);
  Find(library, "RasHangUpW", table_.HangUp);
  Find(library, "RasGetConnectStatusW", table_.GetConnectStatus);
  Find(library, "RasEnumConnectionsW", table_.EnumConnections);
  Find(library, "RasGetErrorStringW", table_.GetErrorString);
  return table_;
}

} // namespace quendra::platform::windows
