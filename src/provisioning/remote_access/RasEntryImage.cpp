#include "provisioning/remote_access/RasEntryImage.h"

#include "platform/remote_access/RemoteAccessNumbers.h"
#include "provisioning/remote_access/RecordFields.h"

namespace quendra::provisioning {

namespace {

using platform::RasEntry;
using Entry = RasEntryRecord;
using EntryField = RecordField<Entry>;

constexpr std::size_t kPadType = RasEntry::kDeviceName + RasEntry::kDeviceNameBytes;
constexpr std::size_t kX25Address = kPadType + RasEntry::kPadTypeBytes;
constexpr std::size_t kX25Facilities = kX25Address + RasEntry::kX25TextBytes;
constexpr std::size_t kX25UserData = kX25Facilities + RasEntry::kX25TextBytes;
constexpr std::size_t kChannels = kX25UserData + RasEntry::kChannelsFromUserData;

constexpr EntryField kEntryFields[] = {
    {&Entry::options, RasEntry::kOptions},
    {&Entry::countryId, RasEntry::kCountryId},
    {&Entry::countryCode, RasEntry::kCountryCode},
    {&Entry::areaCode, RasEntry::kAreaCode, RasEntry::kAreaCodeBytes},
    {&Entry::localPhoneNumber, RasEntry::kLocalPhoneNumber, RasEntry::kLocalPhoneNumberBytes},
    {&Entry::ipAddress, RasEntry::kAddresses},
    {&Entry::dnsAddress, RasEntry::kAddresses + 4},
    {&Entry::alternateDnsAddress, RasEntry::kAddresses + 8},
    {&Entry::winsAddress, RasEntry::kAddresses + 12},
    {&Entry::alternateWinsAddress, RasEntry::kAddresses + 16},
    {&Entry::frameSize, RasEntry::kFrameSize},
    {&Entry::netProtocols, RasEntry::kNetProtocols},
    {&Entry::framingProtocol, RasEntry::kFramingProtocol},
    {&Entry::script, RasEntry::kScript, RasEntry::kPathBytes},
    {&Entry::autodialLibrary, RasEntry::kAutodialLibrary, RasEntry::kPathBytes},
    {&Entry::autodialFunction, RasEntry::kAutodialFunction, RasEntry::kPathBytes},
    {&Entry::deviceType, RasEntry::kDeviceType, RasEntry::kDeviceTypeBytes},
    {&Entry::deviceName, RasEntry::kDeviceName, RasEntry::kDeviceNameBytes},
    {&Entry::x25PadType, kPadType, RasEntry::kPadTypeBytes},
    {&Entry::x25Address, kX25Address, RasEntry::kX25TextBytes},
    {&Entry::x25Facilities, kX25Facilities, RasEntry::kX25TextBytes},
    {&Entry::x25UserData, kX25UserData, RasEntry::kX25TextBytes},
    {&Entry::channels, kChannels},
    {&Entry::subEntries, RasEntry::kSubEntries},
    {&Entry::dialMode, RasEntry::kDialMode},
    {&Entry::dialExtraPercent, RasEntry::kDialExtraPercent},
    {&Entry::dialExtraSampleSeconds, RasEntry::kDialExtraSampleSeconds},
    {&Entry::hangUpExtraPercent, RasEntry::kHangUpExtraPercent},
    {&Entry::hangUpExtraSampleSeconds, RasEntry::kHangUpExtraSampleSeconds},
    {&Entry::idleDisconnectSeconds, RasEntry::kIdleDisconnectSeconds},
    {&Entry::entryType, RasEntry::kEntryType},
    {&Entry::encryptionType, RasEntry::kEncryptionType},
    {&Entry::customAuthenticationKey, RasEntry::kCustomAuthKey},
    {&Entry::guid, RasEntry::kGuid},
    {&Entry::customDialLibrary, RasEntry::kCustomDialLibrary, RasEntry::kPathBytes},
    {&Entry::vpnStrategy, RasEntry::kVpnStrategy},
};

/// The oldest record has a shorter device name, and all behind it comes so much earlier.
EntryField EntryFieldIn(std::uint32_t recordBytes, EntryField field) {
  constexpr std::size_t kShorter = RasEntry::kDeviceNameBytes - RasEntry::kShortDeviceNameBytes;
  if (recordBytes != RasEntry::kBytesOfShortDeviceNames) return field;
  if (field.at == RasEntry::kDeviceName) field.width -= kShorter;
  if (field.at > RasEntry::kDeviceName) field.at -= kShorter;
  return field;
}

/// What stands from the offset to the image's end; nothing for an offset outside.
Text AlternatesIn(std::span<const std::uint8_t> image) {
  constexpr std::size_t kEnd = RasEntry::kAlternateOffset + 4;
  if (image.size() < kEnd) return {};
  const std::uint32_t offset = Little32(image, RasEntry::kAlternateOffset);
  if (offset == 0 || offset >= image.size()) return {};
  return FromCodePage({reinterpret_cast<const char*>(image.data()) + offset, image.size() - offset});
}

} // namespace

std::vector<std::uint8_t> RasEntryImageOf(const RasEntryRecord& record, std::uint32_t recordBytes) {
  if (recordBytes < RasEntry::kAlternateOffset + 4) throw Fault(Fault::kSubscript);
  const std::string alternates = ToCodePage(record.alternateNumbers);
  auto image = RecordBlock(std::uint64_t{recordBytes} + alternates.size() + 1);
  PutLittle32(image, 0, recordBytes);
  for (const EntryField& listed : kEntryFields)
    if (const EntryField field = EntryFieldIn(recordBytes, listed); field.IsIn(recordBytes))
      PutField(record, field, image);
  if (alternates.empty()) return image;
  PutLittle32(image, RasEntry::kAlternateOffset, recordBytes);
  std::ranges::copy(alternates, image.begin() + recordBytes);
  return image;
}

void TakeRasEntryImage(RasEntryRecord& record, std::span<const std::uint8_t> image,
                       std::uint32_t recordBytes) {
  const std::size_t held = std::min<std::size_t>(recordBytes, image.size());
  for (const EntryField& listed : kEntryFields)
    if (const EntryField field = EntryFieldIn(recordBytes, listed); field.IsIn(held))
      TakeField(record, field, image);
  record.alternateNumbers = AlternatesIn(image);
}

} // namespace quendra::provisioning
