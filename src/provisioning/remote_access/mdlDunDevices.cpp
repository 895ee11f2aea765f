#include "platform/remote_access/PhoneBook.h"
#include "provisioning/remote_access/RecordFields.h"
#include "provisioning/remote_access/mdlDun.h"

namespace quendra::provisioning {

using platform::RasDeviceInfo;

namespace {

/// More devices than any machine has; one that tells more is answered as one without any.
constexpr std::uint32_t kMostBytes = 1U << 20;

} // namespace

Text mdlDun::FindDeviceName(const Text& search, Boolean16 matchByType) {
  std::uint32_t bytes = 0;
  std::uint32_t count = 0;
  phoneBook_.RasEnumDevicesA({}, bytes, count);
  if (bytes < RasDeviceInfo::kBytes || bytes > kMostBytes) return {};
  Bytes block(bytes);
  PutLittle32(block, 0, RasDeviceInfo::kBytes);
  if (phoneBook_.RasEnumDevicesA(block, bytes, count) != platform::kRasSuccess) return {};
  const std::string sought = ToCodePage(search);
  std::span<const std::uint8_t> devices(block);
  for (; count > 0 && devices.size() >= RasDeviceInfo::kBytes;
       devices = devices.subspan(RasDeviceInfo::kBytes), --count) {
    const auto type = FieldBytes(devices.subspan(RasDeviceInfo::kType, RasDeviceInfo::kTypeBytes));
    const auto name = FieldBytes(devices.subspan(RasDeviceInfo::kName, RasDeviceInfo::kNameBytes));
    if ((matchByType != kFalse16 ? type : name).find(sought) != std::string::npos) return FromCodePage(name);
  }
  return {};
}

} // namespace quendra::provisioning
