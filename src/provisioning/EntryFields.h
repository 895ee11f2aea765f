#pragma once

#include "provisioning/ModemTable.h"
#include "provisioning/remote_access/RasEntryRecord.h"

namespace quendra::provisioning {

/// By which devices connections of this kind are dialled.
const char16_t* DeviceTypeOf(ConnectionKind kind);

/// Writes what entries of this kind have, save their device. Other fields stay as they are.
void FillEntry(RasEntryRecord& record, ConnectionKind kind);

/// The options of the entry that is made by way of another.
inline constexpr std::uint32_t kOptionsOfCopiedEntry = 0x051C0310;

} // namespace quendra::provisioning
