#pragma once

#include "platform/remote_access/RemoteAccessNumbers.h"
#include "platform/simulated/remote_access/RecordText.h"
#include "runtime/ByteFields.h"

#include <vector>

namespace quendra::platform::simulated {

/// An entry of the phone book: its properties as the system keeps them, and what is saved for its dials.
struct SimulatedEntry {
  std::string name{};
  /// A RasEntry of the size that the system has.
  std::vector<std::uint8_t> properties{};
  std::vector<std::string> alternateNumbers{};

  // Saved for dials.
  std::string phoneNumber{};
  std::string callbackNumber{};
  std::string userName{};
  std::string password{};
  std::string domain{};
  std::uint32_t subEntry = 0;
  std::uint32_t callbackId = 0;

  /// A field of the properties by its place (RasEntry); 0 and empty where the record is shorter.
  std::uint32_t Number(std::size_t at) const {
    return at + 4 > properties.size() ? 0 : Little32(properties, at);
  }
  std::string TextOf(std::size_t at, std::size_t width) const { return TextAt(properties, at, width); }
  std::string DeviceType() const { return TextOf(RasEntry::kDeviceType, RasEntry::kDeviceTypeBytes); }
  std::string DeviceName() const {
    const bool isShort = properties.size() == RasEntry::kBytesOfShortDeviceNames;
    return TextOf(RasEntry::kDeviceName,
                  isShort ? RasEntry::kShortDeviceNameBytes : RasEntry::kDeviceNameBytes);
  }

  SimulatedEntry& Set(std::size_t at, std::uint32_t number) {
    PutLittle32(properties, at, number);
    return *this;
  }
  SimulatedEntry& SetText(std::size_t at, std::size_t width, const std::string& text) {
    PutTextAt(properties, at, width, text);
    return *this;
  }
  SimulatedEntry& SetDevice(const std::string& type, const std::string& deviceName) {
    const bool isShort = properties.size() == RasEntry::kBytesOfShortDeviceNames;
    SetText(RasEntry::kDeviceType, RasEntry::kDeviceTypeBytes, type);
    return SetText(RasEntry::kDeviceName,
                   isShort ? RasEntry::kShortDeviceNameBytes : RasEntry::kDeviceNameBytes, deviceName);
  }
  SimulatedEntry& SetLogin(const std::string& user, const std::string& secret) {
    userName = user;
    password = secret;
    return *this;
  }
};

} // namespace quendra::platform::simulated
