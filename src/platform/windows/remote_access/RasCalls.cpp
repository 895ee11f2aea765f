#include "platform/windows/remote_access/RasCalls.h"

namespace quendra::platform::windows {

RasCalls::RasCalls(Load load) : load_(std::move(load)) {}

const RasCalls::Table& RasCalls::Calls() {
  if (library_) return table_;
  const winapi::SystemLibrary& library = library_.emplace(load_());
  Find(library, "RasEnumEntriesA", table_.EnumEntries);
  Find(library, "RasDeleteEntryA", table_.DeleteEntry);
  Find(library, "RasGetEntryPropertiesA", table_.GetEntryProperties);
  Find(library, "RasSetEntryPropertiesA", table_.SetEntryProperties);
  Find(library, "RasGetEntryDialParamsA", table_.GetEntryDialParams);
  Find(library, "RasSetEntryDialParamsA", table_.SetEntryDialParams);
  Find(library, "RasEnumDevicesA", table_.EnumDevices);
  Find(library, "RasDialA", table_.Dial);
  Find(library, "RasHangUpA", table_.HangUp);
  Find(library, "RasEnumConnectionsA", table_.EnumConnections);
  Find(library, "RasGetErrorStringA", table_.GetErrorString);
  return table_;
}

} // namespace quendra::platform::windows
