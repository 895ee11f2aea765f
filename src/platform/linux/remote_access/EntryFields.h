#pragma once

#include "platform/remote_access/RemoteAccessNumbers.h"

#include <array>
#include <cstddef>
#include <cstdint>

namespace quendra::platform::linux_ {

/// Numbers of an entry, as far as one is made up.
inline constexpr std::uint32_t kRemoteDefaultGateway = 0x10;
inline constexpr std::uint32_t kIpProtocol = 4;
inline constexpr std::uint32_t kPppFraming = 1;
inline constexpr std::uint32_t kVpnEntry = 2;
inline constexpr std::uint32_t kBroadbandEntry = 5;

/// NetworkManager keeps no PPPoE connection without a user name. No name that a provider gives is a blank.
inline constexpr const char* kNoUserName = " ";

/// A field of RasEntry that is kept in a connection's user data.
struct EntryField {
  enum class Kind { Number, Text, Bytes };

  const char* key;
  std::size_t at;
  std::size_t bytes;
  Kind kind;
};

namespace entry_fields {

inline constexpr std::size_t kX25Pad = RasEntry::kDeviceName + RasEntry::kDeviceNameBytes;
inline constexpr std::size_t kX25Address = kX25Pad + RasEntry::kPadTypeBytes;
inline constexpr std::size_t kX25Facilities = kX25Address + RasEntry::kX25TextBytes;
inline constexpr std::size_t kX25UserData = kX25Facilities + RasEntry::kX25TextBytes;
inline constexpr std::size_t kChannels = kX25UserData + RasEntry::kChannelsFromUserData;

constexpr EntryField Number(const char* key, std::size_t at) {
  return {key, at, 4, EntryField::Kind::Number};
}
constexpr EntryField Text(const char* key, std::size_t at, std::size_t bytes) {
  return {key, at, bytes, EntryField::Kind::Text};
}
constexpr EntryField Bytes(const char* key, std::size_t at, std::size_t bytes) {
  return {key, at, bytes, EntryField::Kind::Bytes};
}

} // namespace entry_fields

inline constexpr std::array kEntryFields{
    entry_fields::Number("quendra.entry.options", RasEntry::kOptions),
    entry_fields::Number("quendra.entry.country-id", RasEntry::kCountryId),
    entry_fields::Number("quendra.entry.country-code", RasEntry::kCountryCode),
    entry_fields::Text("quendra.entry.area-code", RasEntry::kAreaCode, RasEntry::kAreaCodeBytes),
    entry_fields::Bytes("quendra.entry.addresses", RasEntry::kAddresses, 20),
    entry_fields::Number("quendra.entry.frame-size", RasEntry::kFrameSize),
    entry_fields::Number("quendra.entry.net-protocols", RasEntry::kNetProtocols),
    entry_fields::Number("quendra.entry.framing-protocol", RasEntry::kFramingProtocol),
    entry_fields::Text("quendra.entry.script", RasEntry::kScript, RasEntry::kPathBytes),
    entry_fields::Text("quendra.entry.autodial-library", RasEntry::kAutodialLibrary, RasEntry::kPathBytes),
    entry_fields::Text("quendra.entry.autodial-function", RasEntry::kAutodialFunction, RasEntry::kPathBytes),
    entry_fields::Text("quendra.entry.device-name", RasEntry::kDeviceName, RasEntry::kDeviceNameBytes),
    entry_fields::Text("quendra.entry.x25-pad-type", entry_fields::kX25Pad, RasEntry::kPadTypeBytes),
    entry_fields::Text("quendra.entry.x25-address", entry_fields::kX25Address, RasEntry::kX25TextBytes),
    entry_fields::Text("quendra.entry.x25-facilities", entry_fields::kX25Facilities, RasEntry::kX25TextBytes),
    entry_fields::Text("quendra.entry.x25-user-data", entry_fields::kX25UserData, RasEntry::kX25TextBytes),
    entry_fields::Number("quendra.entry.channels", entry_fields::kChannels),
    entry_fields::Number("quendra.entry.sub-entries", RasEntry::kSubEntries),
    entry_fields::Number("quendra.entry.dial-mode", RasEntry::kDialMode),
    entry_fields::Number("quendra.entry.dial-extra-percent", RasEntry::kDialExtraPercent),
    entry_fields::Number("quendra.entry.dial-extra-sample-seconds", RasEntry::kDialExtraSampleSeconds),
    entry_fields::Number("quendra.entry.hang-up-extra-percent", RasEntry::kHangUpExtraPercent),
    entry_fields::Number("quendra.entry.hang-up-extra-sample-seconds", RasEntry::kHangUpExtraSampleSeconds),
    entry_fields::Number("quendra.entry.idle-disconnect-seconds", RasEntry::kIdleDisconnectSeconds),
    entry_fields::Number("quendra.entry.entry-type", RasEntry::kEntryType),
    entry_fields::Number("quendra.entry.encryption-type", RasEntry::kEncryptionType),
    entry_fields::Number("quendra.entry.custom-auth-key", RasEntry::kCustomAuthKey),
    entry_fields::Bytes("quendra.entry.guid", RasEntry::kGuid, RasEntry::kGuidBytes),
    entry_fields::Text("quendra.entry.custom-dial-library", RasEntry::kCustomDialLibrary,
                       RasEntry::kPathBytes),
    entry_fields::Number("quendra.entry.vpn-strategy", RasEntry::kVpnStrategy),
};

} // namespace quendra::platform::linux_
