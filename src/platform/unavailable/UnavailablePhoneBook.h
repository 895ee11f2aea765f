#pragma once

#include "platform/remote_access/PhoneBook.h"

namespace quendra::platform::unavailable {

/// A system whose remote access can't start.
class UnavailablePhoneBook : public PhoneBook {
 public:
  std::uint32_t RasEnumEntriesA(const char*, std::span<std::uint8_t>, std::uint32_t&,
                                std::uint32_t& count) override {
    count = 0;
    return kRasManagerCannotStart;
  }
  std::uint32_t RasDeleteEntryA(const char*, const char*) override { return kRasManagerCannotStart; }
  std::uint32_t RasGetEntryPropertiesA(const char*, const char*, std::span<std::uint8_t>,
                                       std::uint32_t&) override {
    return kRasManagerCannotStart;
  }
  std::uint32_t RasSetEntryPropertiesA(const char*, const char*, std::span<const std::uint8_t>) override {
    return kRasManagerCannotStart;
  }
  std::uint32_t RasGetEntryDialParamsA(const char*, std::span<std::uint8_t>, bool& hasPassword) override {
    hasPassword = false;
    return kRasManagerCannotStart;
  }
  std::uint32_t RasSetEntryDialParamsA(const char*, std::span<const std::uint8_t>, bool) override {
    return kRasManagerCannotStart;
  }
  std::uint32_t RasEnumDevicesA(std::span<std::uint8_t>, std::uint32_t&, std::uint32_t& count) override {
    count = 0;
    return kRasManagerCannotStart;
  }
};

} // namespace quendra::platform::unavailable
