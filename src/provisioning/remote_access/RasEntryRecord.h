#pragma once

#include "runtime/Text.h"

#include <array>
#include <cstdint>

namespace quendra::provisioning {

/// An entry of the phone book as plain fields, in the order of the platform's record. An entry of a system
/// with a shorter record leaves the fields that this lacks at 0 and empty.
struct RasEntryRecord {
  std::uint32_t options = 0;
  std::uint32_t countryId = 0;
  std::uint32_t countryCode = 0;
  Text areaCode{};
  Text localPhoneNumber{};
  Text alternateNumbers{};
  std::array<std::uint8_t, 4> ipAddress{};
  std::array<std::uint8_t, 4> dnsAddress{};
  std::array<std::uint8_t, 4> alternateDnsAddress{};
  std::array<std::uint8_t, 4> winsAddress{};
  std::array<std::uint8_t, 4> alternateWinsAddress{};
  std::uint32_t frameSize = 0;
  std::uint32_t netProtocols = 0;
  std::uint32_t framingProtocol = 0;
  Text script{};
  Text autodialLibrary{};
  Text autodialFunction{};
  Text deviceType{};
  Text deviceName{};
  Text x25PadType{};
  Text x25Address{};
  Text x25Facilities{};
  Text x25UserData{};
  std::uint32_t channels = 0;
  std::uint32_t subEntries = 0;
  std::uint32_t dialMode = 0;
  std::uint32_t dialExtraPercent = 0;
  std::uint32_t dialExtraSampleSeconds = 0;
  std::uint32_t hangUpExtraPercent = 0;
  std::uint32_t hangUpExtraSampleSeconds = 0;
  std::uint32_t idleDisconnectSeconds = 0;
  std::uint32_t entryType = 0;
  std::uint32_t encryptionType = 0;
  std::uint32_t customAuthenticationKey = 0;
  std::array<std::uint8_t, 16> guid{};
  Text customDialLibrary{};
  std::uint32_t vpnStrategy = 0;

  friend bool operator==(const RasEntryRecord&, const RasEntryRecord&) = default;
};

} // namespace quendra::provisioning
