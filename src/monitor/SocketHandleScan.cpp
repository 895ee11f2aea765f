#include "monitor/SocketHandleScan.h"

#include "monitor/OwnedHandle.h"
#include "runtime/ByteFields.h"
#include "runtime/Integers.h"

namespace quendra::monitor {

namespace {

using platform::Handles;

constexpr std::size_t kFirstRoom = 20;
constexpr std::uint32_t kMayDuplicate = 0x40;
constexpr std::uint32_t kDuplicateAccess = 0x101F0000;
constexpr std::size_t kNameRoom = 32;
constexpr std::uint16_t kDeviceNameBytes = 22;

Text Capitals(TextView text) {
  Text capitals(text);
  for (char16_t& unit : capitals)
    if (unit >= u'a' && unit <= u'z') unit = static_cast<char16_t>(unit - 32);
  return capitals;
}

} // namespace

void SocketHandleScan::Run(std::vector<PortOwner>& owners) {
  for (const HandleEntry& entry : AllHandles()) Examine(entry, owners);
}

std::vector<SocketHandleScan::HandleEntry> SocketHandleScan::AllHandles() {
  std::vector<HandleEntry> entries;
  std::uint32_t status = 0;
  do {
    std::uint32_t returned = 0;
    std::vector<std::uint8_t> buffer(kFirstRoom);
    // The first buffer has room for one handle, so what fits there is ignored; a longer list tells its
    // length.
    if (handles_.NtQuerySystemInformation(Handles::kHandleTable, buffer, returned) == 0) break;
    const auto count = Little32(buffer, 0);
    const std::int32_t room = ToInt32(std::int64_t{count} * std::int64_t{Handles::kRecordBytes} +
                                      std::int64_t{Handles::kCountBytes});
    buffer.assign(static_cast<std::size_t>(room), 0);
    status = handles_.NtQuerySystemInformation(Handles::kHandleTable, buffer, returned);
    entries.resize(count);
    std::size_t at = Handles::kCountBytes;
    for (HandleEntry& entry : entries) {
      entry = {Little32(buffer, at + Handles::kProcessIdOffset),
               Little16(buffer, at + Handles::kHandleOffset)};
      at += Handles::kRecordBytes;
    }
  } while (status == Handles::kStatusInfoLengthMismatch);
  return entries;
}

void SocketHandleScan::Examine(const HandleEntry& entry, std::vector<PortOwner>& owners) {
  if (entry.processId == 0) return;
  const platform::Handle opened = processes_.OpenProcess(kMayDuplicate, false, entry.processId);
  if (opened == platform::kInvalidHandle) return;
  const OwnedHandle process(processes_, opened);
  platform::Handle copy = platform::kNoHandle;
  if (!handles_.DuplicateHandle(process.Get(), platform::Handle(entry.handle), platform::kOwnProcess, copy,
                                kDuplicateAccess, false, 0))
    return;
  const OwnedHandle duplicate(processes_, copy);
  const std::optional<Text> name = DeviceName(duplicate.Get());
  if (!name) return;
  const std::int32_t port = QueryHandlePort(duplicate.Get());
  if (port == 0) return;
  PortOwner& owner = owners[static_cast<std::size_t>(port)];
  const bool tcp = name->find(u"TCP") != Text::npos;
  (tcp ? owner.tcpOwner : owner.udpOwner) = static_cast<std::int32_t>(entry.processId);
}

std::optional<Text> SocketHandleScan::DeviceName(platform::Handle handle) {
  std::array<std::uint8_t, kNameRoom> buffer{};
  std::uint32_t returned = 0;
  const std::uint32_t status = handles_.NtQueryObject(handle, Handles::kObjectName, buffer, returned);
  if (status != 0 || Little16(buffer, 0) != kDeviceNameBytes) return std::nullopt;
  Text name(kDeviceNameBytes / sizeof(char16_t), u'\0');
  for (std::size_t i = 0; i < name.size(); ++i) name[i] = Little16(buffer, Handles::kNameOffset + 2 * i);
  return Capitals(CutAtNul(TextView(name)));
}

std::int32_t SocketHandleScan::QueryHandlePort(platform::Handle handle) {
  std::array<std::uint8_t, Handles::kQueryBytes> input{};
  std::array<std::uint8_t, Handles::kAnswerBytes> output{};
  input[Handles::kQueryTypeOffset] = Handles::kQueryAddressInfo;
  const OwnedHandle event(processes_, handles_.CreateEventW(true, false, u"0"));
  const std::uint32_t status =
      handles_.NtDeviceIoControlFile(handle, event.Get(), Handles::kQueryInformation, input, output);
  if (status != 0) return 0;
  return Big16(output, Handles::kPortOffset);
}

} // namespace quendra::monitor
