#include "provisioning/remote_access/RasConnectionImage.h"

#include "platform/remote_access/RemoteAccessNumbers.h"
#include "provisioning/remote_access/RecordFields.h"

namespace quendra::provisioning {

using Record = platform::RasConnectionRecord;

const std::array<std::uint32_t, 4> kRasConnectionSizes{
    Record::kBytes, Record::kBytesWithoutGuid, Record::kBytesWithoutPhoneBook, Record::kBytesOfShortNames};

namespace {

using Fields = RasConnectionFields;
using ConnectionField = RecordField<Fields>;

constexpr ConnectionField kConnectionFields[] = {
    {&Fields::handle, Record::kHandle},
    {&Fields::entryName, Record::kEntryName, Record::kEntryNameBytes},
    {&Fields::deviceType, Record::kDeviceType, Record::kDeviceTypeBytes},
    {&Fields::deviceName, Record::kDeviceName, Record::kDeviceNameBytes},
    {&Fields::phoneBook, Record::kPhoneBook, Record::kPhoneBookBytes},
    {&Fields::subEntry, Record::kSubEntry},
    {&Fields::guid, Record::kGuid},
};

ConnectionField ConnectionFieldIn(std::uint32_t bytes, ConnectionField field) {
  if (bytes == Record::kBytesOfShortNames && field.at == Record::kEntryName)
    field.width = Record::kShortEntryNameBytes;
  return field;
}

} // namespace

RasConnectionFields RasConnectionOf(std::span<const std::uint8_t> record) {
  const auto bytes = static_cast<std::uint32_t>(record.size());
  RasConnectionFields connection;
  for (const ConnectionField& listed : kConnectionFields)
    if (const ConnectionField field = ConnectionFieldIn(bytes, listed); field.IsIn(bytes))
      TakeField(connection, field, record);
  return connection;
}

} // namespace quendra::provisioning
