#pragma once

#include "platform/remote_access/Dialling.h"
#include "platform/remote_access/PhoneBook.h"
#include "platform/simulated/SimulatedCore.h"

namespace quendra::platform::simulated {

/// A phone book, devices and dials, as a test scripts them.
class SimulatedRemoteAccess : public PhoneBook, public Dialling {
 public:
  explicit SimulatedRemoteAccess(Core& core) : core_(core) {}

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
  std::uint32_t RasDialA(std::span<const std::uint8_t>, const char*, std::span<const std::uint8_t>,
                         const Notifier&, RasConnection&) override {
    return kRasManagerCannotStart;
  }
  std::uint32_t RasHangUpA(RasConnection) override { return kRasManagerCannotStart; }
  std::uint32_t RasEnumConnectionsA(std::span<std::uint8_t>, std::uint32_t&, std::uint32_t& count) override {
    count = 0;
    return kRasManagerCannotStart;
  }
  std::uint32_t RasGetErrorStringA(std::uint32_t, std::span<char>) override { return kRasManagerCannotStart; }

 private:
  [[maybe_unused]] Core& core_;
};

} // namespace quendra::platform::simulated
