#include "platform/simulated/process/SimulatedHandles.h"

#include <algorithm>

namespace quendra::platform::simulated {

std::uint32_t SimulatedHandles::NtQuerySystemInformation(std::uint32_t informationClass,
                                                         std::span<std::uint8_t> buffer,
                                                         std::uint32_t& returnedLength) {
  if (informationClass != kHandleTable) return kStatusInvalidInfoClass;
  TableQueries.push_back(buffer.size());
  const auto handles = handles_;
  if (!appearing_.empty()) {
    for (auto& handle : appearing_.front()) handles_.push_back(std::move(handle));
    appearing_.pop_front();
  }
  const std::size_t needed = kCountBytes + kRecordBytes * handles.size();
  returnedLength = static_cast<std::uint32_t>(needed);
  if (buffer.size() >= kCountBytes) PutLittle32(buffer, 0, static_cast<std::uint32_t>(handles.size()));
  if (buffer.size() < needed) return kStatusInfoLengthMismatch;
  for (std::size_t i = 0; i < handles.size(); ++i) {
    const auto entry = buffer.subspan(kCountBytes + kRecordBytes * i, kRecordBytes);
    std::fill(entry.begin(), entry.end(), std::uint8_t{0});
    PutLittle32(entry, kProcessIdOffset, handles[i].pid);
    entry[kTypeOffset] = 28; // a file object
    PutLittle16(entry, kHandleOffset, handles[i].handle);
    PutLittle32(entry, 8, 0x81000000U + static_cast<std::uint32_t>(i) * 0x40U);
    PutLittle32(entry, 12, 0x0012019F);
  }
  return 0;
}

bool SimulatedHandles::DuplicateHandle(Handle sourceProcess, Handle handle, Handle, Handle& duplicate,
                                       std::uint32_t, bool, std::uint32_t) {
  const Core::Opened* source = core_.Find(sourceProcess, Core::Kind::Process);
  if (!source) return false;
  const auto found = std::find_if(handles_.begin(), handles_.end(), [&](const SystemHandle& entry) {
    return entry.pid == source->number && Handle(entry.handle) == handle;
  });
  if (found == handles_.end() || !found->duplicable) return false;
  duplicate = core_.Open(Core::Kind::Duplicate, static_cast<std::uint32_t>(found - handles_.begin()));
  return true;
}

const SystemHandle* SimulatedHandles::Duplicated(Handle handle) const {
  const Core::Opened* opened = core_.Find(handle, Core::Kind::Duplicate);
  return opened ? &handles_[opened->number] : nullptr;
}

std::uint32_t SimulatedHandles::NtQueryObject(Handle handle, std::uint32_t informationClass,
                                              std::span<std::uint8_t> buffer, std::uint32_t& returnedLength) {
  ++NameQueries;
  const SystemHandle* entry = Duplicated(handle);
  if (!entry) return kStatusInvalidHandle;
  if (informationClass != kObjectName) return kStatusInvalidInfoClass;
  const std::size_t bytes = entry->deviceName.size() * 2;
  const std::size_t needed = entry->deviceName.empty() ? kNameOffset : kNameOffset + bytes + 2;
  returnedLength = static_cast<std::uint32_t>(needed);
  if (buffer.size() < needed) return kStatusInfoLengthMismatch;
  std::fill(buffer.begin(), buffer.end(), std::uint8_t{0});
  PutLittle16(buffer, 0, static_cast<std::uint16_t>(bytes));
  PutLittle16(buffer, 2, static_cast<std::uint16_t>(needed - kNameOffset));
  PutLittle32(buffer, 4, entry->deviceName.empty() ? 0 : kNameOffset);
  for (std::size_t i = 0; i < entry->deviceName.size(); ++i)
    PutLittle16(buffer, kNameOffset + 2 * i, entry->deviceName[i]);
  return 0;
}

Handle SimulatedHandles::CreateEventW(bool, bool, const std::u16string&) {
  return core_.Open(Core::Kind::Event);
}

std::uint32_t SimulatedHandles::NtDeviceIoControlFile(Handle handle, Handle, std::uint32_t controlCode,
                                                      std::span<const std::uint8_t> input,
                                                      std::span<std::uint8_t> output) {
  ++DriverQueries;
  const SystemHandle* entry = Duplicated(handle);
  if (!entry) return kStatusInvalidHandle;
  if (controlCode != kQueryInformation) return kStatusNotImplemented;
  if (input.size() != kQueryBytes || output.size() != kAnswerBytes ||
      Little32(input, kQueryTypeOffset) != kQueryAddressInfo)
    return kStatusInvalidParameter;
  if (entry->driverStatus != 0) return entry->driverStatus;
  PutBig16(output, kPortOffset, entry->port);
  return 0;
}

} // namespace quendra::platform::simulated
