#include "platform/simulated/net/SimulatedNetwork.h"

#include <algorithm>

namespace quendra::platform::simulated {

namespace {

constexpr std::uint32_t kStatusInvalidHandle = 0xC0000008;
constexpr std::uint32_t kStatusInvalidParameter = 0xC000000D;
constexpr std::uint32_t kStatusInvalidInfoClass = 0xC0000003;
constexpr std::uint32_t kHandleTable = 16;
constexpr std::uint32_t kEntrySize = 16;
constexpr std::uint32_t kObjectName = 1;
constexpr std::uint32_t kQueryInformation = 0x210012;
constexpr std::uint32_t kQueryAddressInfo = 3;

} // namespace

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
  const std::size_t needed = 4 + kEntrySize * handles.size();
  returnedLength = static_cast<std::uint32_t>(needed);
  if (buffer.size() >= 4) PutLittle32(buffer, 0, static_cast<std::uint32_t>(handles.size()));
  if (buffer.size() < needed) return kStatusInfoLengthMismatch;
  for (std::size_t i = 0; i < handles.size(); ++i) {
    const auto entry = buffer.subspan(4 + kEntrySize * i, kEntrySize);
    std::fill(entry.begin(), entry.end(), std::uint8_t{0});
    PutLittle32(entry, 0, handles[i].pid);
    entry[4] = 28; // a file object
    PutLittle16(entry, 6, handles[i].handle);
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
    return entry.pid == source->number && entry.handle == handle;
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
  const std::size_t needed = entry->deviceName.empty() ? 8 : 8 + bytes + 2;
  returnedLength = static_cast<std::uint32_t>(needed);
  if (buffer.size() < needed) return kStatusInfoLengthMismatch;
  std::fill(buffer.begin(), buffer.end(), std::uint8_t{0});
  PutLittle16(buffer, 0, static_cast<std::uint16_t>(bytes));
  PutLittle16(buffer, 2, static_cast<std::uint16_t>(needed - 8));
  PutLittle32(buffer, 4, entry->deviceName.empty() ? 0 : 8);
  for (std::size_t i = 0; i < entry->deviceName.size(); ++i)
    PutLittle16(buffer, 8 + 2 * i, entry->deviceName[i]);
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
  if (input.size() != 24 || output.size() != 52 || Little32(input, 16) != kQueryAddressInfo)
    return kStatusInvalidParameter;
  if (entry->driverStatus != 0) return entry->driverStatus;
  PutBig16(output, 12, entry->port);
  return 0;
}

} // namespace quendra::platform::simulated
