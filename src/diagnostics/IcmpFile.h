#pragma once

#include "platform/icmp/Icmp.h"

namespace quendra::diagnostics {

/// An ICMP handle, closed at the end however that comes.
class IcmpFile {
 public:
  explicit IcmpFile(platform::Icmp& icmp) : icmp_(icmp), handle_(icmp.IcmpCreateFile()) {}
  ~IcmpFile() {
    if (IsOpen()) icmp_.IcmpCloseHandle(handle_);
  }
  IcmpFile(const IcmpFile&) = delete;
  IcmpFile& operator=(const IcmpFile&) = delete;

  bool IsOpen() const { return handle_ != platform::kNoIcmp; }
  std::uint32_t SendEcho(const platform::EchoRequest& request, std::span<std::uint8_t> reply,
                         std::uint32_t milliseconds) {
    return icmp_.IcmpSendEcho(handle_, request, reply, milliseconds);
  }

 private:
  platform::Icmp& icmp_;
  platform::IcmpHandle handle_;
};

} // namespace quendra::diagnostics
