#pragma once

#include "provisioning/remote_access/RasDialParamsRecord.h"
#include "provisioning/remote_access/RasEntryRecord.h"

#include <string>
#include <vector>

namespace quendra::provisioning {

using Bytes = std::vector<std::uint8_t>;

/// Every field with a value of its own.
inline RasEntryRecord FullEntry() {
  RasEntryRecord entry{.options = 0x81828384,
                       .countryId = 972,
                       .countryCode = 973,
                       .areaCode = u"04",
                       .localPhoneNumber = u"10.0.0.138",
                       .alternateNumbers = u"111",
                       .ipAddress = {1, 2, 3, 4},
                       .dnsAddress = {5, 6, 7, 8},
                       .alternateDnsAddress = {9, 10, 11, 12},
                       .winsAddress = {13, 14, 15, 16},
                       .alternateWinsAddress = {17, 18, 19, 20},
                       .frameSize = 1006,
                       .netProtocols = 4,
                       .framingProtocol = 1,
                       .script = u"C:\\a.scp",
                       .autodialLibrary = u"C:\\a.dll",
                       .autodialFunction = u"Dial",
                       .deviceType = u"vpn",
                       .deviceName = u"\u05d7\u05d9\u05d9\u05d2\u05df",
                       .x25PadType = u"pad",
                       .x25Address = u"address",
                       .x25Facilities = u"facilities",
                       .x25UserData = u"data",
                       .channels = 2};
  entry.subEntries = 3;
  entry.dialMode = 5;
  entry.dialExtraPercent = 75;
  entry.dialExtraSampleSeconds = 120;
  entry.hangUpExtraPercent = 121;
  entry.hangUpExtraSampleSeconds = 122;
  entry.idleDisconnectSeconds = 123;
  entry.entryType = 6;
  entry.encryptionType = 7;
  entry.customAuthenticationKey = 8;
  for (std::uint8_t i = 0; i < 16; ++i) entry.guid[i] = 0xA0 + i;
  entry.customDialLibrary = u"C:\\b.dll";
  entry.vpnStrategy = 9;
  return entry;
}

inline RasDialParamsRecord FullDialParams() {
  return {.size = 0,
          .entryName = u"Home",
          .phoneNumber = u"10.0.0.138",
          .callbackNumber = u"222",
          .userName = u"user@097",
          .password = u"secret",
          .domain = u"domain",
          .subEntry = 11,
          .callbackId = 12};
}

/// An image written number by number and text by text, from offsets as they stand in the platform's papers.
class PlainImage {
 public:
  explicit PlainImage(std::size_t size) : bytes_(size) {}
  PlainImage& Number(std::size_t at, std::uint32_t number) {
    for (std::size_t i = 0; i < 4; ++i) bytes_.at(at + i) = static_cast<std::uint8_t>(number >> 8 * i);
    return *this;
  }
  PlainImage& Words(std::size_t at, const std::string& text) {
    for (std::size_t i = 0; i < text.size(); ++i) bytes_.at(at + i) = static_cast<std::uint8_t>(text[i]);
    return *this;
  }
  PlainImage& Counted(std::size_t at, std::uint8_t first, std::uint8_t count) {
    for (std::uint8_t i = 0; i < count; ++i) bytes_.at(at + i) = static_cast<std::uint8_t>(first + i);
    return *this;
  }
  const Bytes& Image() const { return bytes_; }

 private:
  Bytes bytes_;
};

} // namespace quendra::provisioning
