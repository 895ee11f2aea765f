#include "platform/linux/remote_access/EntrySettings.h"

#include "platform/linux/network_manager/NetworkManagerNames.h"
#include "platform/linux/remote_access/EntryFields.h"
#include "platform/linux/system/Files.h"
#include "platform/remote_access/RemoteAccessNumbers.h"
#include "runtime/ByteFields.h"
#include "runtime/Text.h"

#include <algorithm>
#include <array>

namespace quendra::platform::linux_ {

namespace {

using Image = std::span<std::uint8_t>;
using ConstImage = std::span<const std::uint8_t>;

/// Marks user data as ours, also where every field of an entry is empty.
constexpr const char* kMark = "quendra.entry.version";
constexpr const char* kAlternates = "quendra.entry.alternate-numbers";
constexpr std::string_view kDigits = "0123456789abcdef";
constexpr std::size_t kMostAlternateBytes = 4000; ///< in hexadecimal below the 8 KB of a value of user data

/// Where NetworkManager keeps whom to call: the server of a VPN, the service that a PPPoE line asks for.
std::string NumberOf(const NetworkSettings& settings, LineKind kind) {
  if (kind == LineKind::Pppoe) return TextIn(settings, "pppoe", "service");
  const TextMap data = TextsIn(settings, "vpn", "data");
  const auto gateway = data.find("gateway");
  return gateway == data.end() ? std::string() : gateway->second;
}

void PutNumber(NetworkSettings& settings, LineKind kind, const std::string& number) {
  if (kind == LineKind::Pppoe) return PutText(settings, "pppoe", "service", number);
  TextMap data = TextsIn(settings, "vpn", "data");
  PutTextIn(data, "gateway", number);
  PutTexts(settings, "vpn", "data", data);
}

std::string HexOf(ConstImage bytes) {
  std::string text;
  for (const std::uint8_t byte : bytes) text.append({kDigits[byte >> 4], kDigits[byte & 15]});
  return text;
}

/// Up to the first that is no digit.
std::vector<std::uint8_t> BytesOf(std::string_view hex) {
  std::vector<std::uint8_t> bytes;
  for (std::size_t at = 0; at + 1 < hex.size(); at += 2) {
    const std::size_t high = kDigits.find(hex[at]), low = kDigits.find(hex[at + 1]);
    if (high == std::string_view::npos || low == std::string_view::npos) break;
    bytes.push_back(static_cast<std::uint8_t>(high << 4 | low));
  }
  return bytes;
}

std::string StoredField(ConstImage image, const EntryField& field) {
  switch (field.kind) {
  case EntryField::Kind::Number: {
    const std::uint32_t number = Little32(image, field.at);
    return number == 0 ? std::string() : std::to_string(number);
  }
  case EntryField::Kind::Text: return ToUtf8(FromCodePage(FieldText(image, field.at, field.bytes)));
  case EntryField::Kind::Bytes: break;
  }
  const auto bytes = image.subspan(field.at, field.bytes);
  return std::ranges::all_of(bytes, [](std::uint8_t byte) { return byte == 0; }) ? std::string()
                                                                                 : HexOf(bytes);
}

void ShowField(Image image, const EntryField& field, const std::string& stored) {
  switch (field.kind) {
  case EntryField::Kind::Number: PutLittle32(image, field.at, WholeNumber(stored).value_or(0)); break;
  case EntryField::Kind::Text:
    PutFieldText(image, field.at, field.bytes, CutAtNul(Shown(stored, field.bytes)));
    break;
  case EntryField::Kind::Bytes: {
    const auto bytes = BytesOf(stored);
    std::ranges::copy_n(bytes.begin(), static_cast<std::ptrdiff_t>(std::min(bytes.size(), field.bytes)),
                        image.begin() + static_cast<std::ptrdiff_t>(field.at));
  }
  }
}

/// What an entry of another program's can be said to be.
void ShowForeign(Image image, LineKind kind) {
  const bool isVpn = kind == LineKind::Vpn;
  PutLittle32(image, RasEntry::kOptions, kRemoteDefaultGateway);
  PutLittle32(image, RasEntry::kNetProtocols, kIpProtocol);
  PutLittle32(image, RasEntry::kFramingProtocol, kPppFraming);
  PutLittle32(image, RasEntry::kSubEntries, 1);
  PutLittle32(image, RasEntry::kDialMode, 1);
  PutLittle32(image, RasEntry::kEntryType, isVpn ? kVpnEntry : kBroadbandEntry);
  PutFieldText(image, RasEntry::kDeviceName, RasEntry::kDeviceNameBytes, DeviceTypeOf(kind));
}

/// With the empty text that ends them. What a caller has behind it is none of theirs.
ConstImage AlternatesOf(ConstImage image) {
  const std::size_t offset = Little32(image, RasEntry::kAlternateOffset);
  if (offset < RasEntry::kBytes || offset >= image.size()) return {};
  const auto rest = image.subspan(offset);
  constexpr std::array<std::uint8_t, 2> kEnd{};
  const auto end = std::search(rest.begin(), rest.end(), kEnd.begin(), kEnd.end());
  return rest.first(std::min(rest.size(), static_cast<std::size_t>(end - rest.begin()) + kEnd.size()));
}

/// A connection that changes its kind keeps nothing of the former.
void BecomeOfKind(NetworkSettings& settings, LineKind kind) {
  if (LineKindOf(settings) == kind) return;
  for (const char* setting : {"pppoe", "ppp", "802-3-ethernet", "vpn"}) settings.erase(setting);
  PutText(settings, "connection", "type", DeviceTypeOf(kind));
  if (kind == LineKind::Vpn)
    PutText(settings, "vpn", "service-type", nm::kPptpService);
  else
    PutText(settings, "pppoe", "username", kNoUserName);
}

} // namespace

std::vector<std::uint8_t> EntryImageOf(const NetworkSettings& settings, LineKind kind) {
  std::vector<std::uint8_t> image(RasEntry::kBytes);
  const TextMap data = TextsIn(settings, "user", "data");
  if (data.contains(kMark)) {
    for (const EntryField& field : kEntryFields)
      if (const auto stored = data.find(field.key); stored != data.end())
        ShowField(image, field, stored->second);
  } else {
    ShowForeign(image, kind);
  }
  PutLittle32(image, 0, RasEntry::kBytes);
  PutFieldText(image, RasEntry::kDeviceType, RasEntry::kDeviceTypeBytes, DeviceTypeOf(kind));
  PutFieldText(image, RasEntry::kLocalPhoneNumber, RasEntry::kLocalPhoneNumberBytes,
               Shown(NumberOf(settings, kind), RasEntry::kLocalPhoneNumberBytes));
  if (const auto stored = data.find(kAlternates); stored != data.end()) {
    const auto alternates = BytesOf(stored->second);
    if (!alternates.empty()) PutLittle32(image, RasEntry::kAlternateOffset, RasEntry::kBytes);
    image.insert(image.end(), alternates.begin(), alternates.end());
  }
  return image;
}

bool PutEntryImage(NetworkSettings& settings, ConstImage image) {
  const auto kind = LineKindOfDevice(FieldText(image, RasEntry::kDeviceType, RasEntry::kDeviceTypeBytes));
  const auto alternates = AlternatesOf(image);
  if (!kind || alternates.size() > kMostAlternateBytes) return false;
  BecomeOfKind(settings, *kind);
  const std::string number(FieldText(image, RasEntry::kLocalPhoneNumber, RasEntry::kLocalPhoneNumberBytes));
  PutNumber(settings, *kind, Kept(NumberOf(settings, *kind), number, RasEntry::kLocalPhoneNumberBytes));
  TextMap data = TextsIn(settings, "user", "data");
  data[kMark] = "1";
  for (const EntryField& field : kEntryFields) PutTextIn(data, field.key, StoredField(image, field));
  PutTextIn(data, kAlternates, HexOf(alternates));
  PutTexts(settings, "user", "data", data);
  return true;
}

} // namespace quendra::platform::linux_
