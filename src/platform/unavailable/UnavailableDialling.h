#pragma once

#include "platform/process/SystemErrors.h"
#include "platform/remote_access/Dialling.h"

namespace quendra::platform::unavailable {

/// A system whose remote access can't start, and has no texts for its failures.
class UnavailableDialling : public Dialling {
 public:
  std::uint32_t RasDialA(std::span<const std::uint8_t>, const char*, std::span<const std::uint8_t>,
                         const Notifier&, RasConnection&) override {
    return kRasManagerCannotStart;
  }
  std::uint32_t RasHangUpA(RasConnection) override { return kRasManagerCannotStart; }
  std::uint32_t RasEnumConnectionsA(std::span<std::uint8_t>, std::uint32_t&, std::uint32_t& count) override {
    count = 0;
    return kRasManagerCannotStart;
  }
  std::uint32_t RasGetErrorStringA(std::uint32_t, std::span<char>) override { return kCallNotImplemented; }
};

} // namespace quendra::platform::unavailable
