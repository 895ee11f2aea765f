#pragma once

#include "platform/icmp/Icmp.h"

namespace quendra::platform::unavailable {

/// A system without the ICMP helper: no handle, so no echo.
class UnavailableIcmp : public Icmp {
 public:
  IcmpHandle IcmpCreateFile() override { return kNoIcmp; }
  std::string MissingRight() override { return {}; }
  std::uint32_t IcmpSendEcho(IcmpHandle, const EchoRequest&, std::span<std::uint8_t>,
                             std::uint32_t) override {
    return 0;
  }
  bool IcmpCloseHandle(IcmpHandle) override { return false; }
};

} // namespace quendra::platform::unavailable
