#include "platform/simulated/remote_access/SimulatedConnection.h"

#include "platform/simulated/remote_access/RecordText.h"
#include "runtime/ByteFields.h"

namespace quendra::platform::simulated {

void PutConnection(const SimulatedConnection& connection, std::span<std::uint8_t> record) {
  using Record = RasConnectionRecord;
  const bool hasShortName = record.size() == Record::kBytesOfShortNames;
  PutLittle32(record, Record::kHandle, connection.handle.Value());
  PutTextAt(record, Record::kEntryName, hasShortName ? Record::kShortEntryNameBytes : Record::kEntryNameBytes,
            connection.entryName);
  if (hasShortName) return;
  PutTextAt(record, Record::kDeviceType, Record::kDeviceTypeBytes, connection.deviceType);
  PutTextAt(record, Record::kDeviceName, Record::kDeviceNameBytes, connection.deviceName);
  if (record.size() < Record::kBytesWithoutGuid) return;
  PutTextAt(record, Record::kPhoneBook, Record::kPhoneBookBytes, connection.phoneBook);
  PutLittle32(record, Record::kSubEntry, connection.subEntry);
  if (record.size() >= Record::kBytes) std::ranges::copy(connection.guid, record.begin() + Record::kGuid);
}

} // namespace quendra::platform::simulated
