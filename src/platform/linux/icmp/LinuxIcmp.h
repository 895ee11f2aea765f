#pragma once

#include "platform/icmp/Icmp.h"
#include "platform/linux/icmp/EchoSocket.h"

#include <map>

namespace quendra::platform::linux_ {

/// Echoes by a socket of their own for each handle.
class LinuxIcmp : public Icmp {
 public:
  using Opener = OpenedEchoSocket (*)();
  explicit LinuxIcmp(Opener open = OpenEchoSocket) : openSocket_(open) {}

  IcmpHandle IcmpCreateFile() override;
  std::string MissingRight() override { return lacksRight_ ? "CAP_NET_RAW" : ""; }
  std::uint32_t IcmpSendEcho(IcmpHandle handle, const EchoRequest& request,
                             std::span<std::uint8_t> replyBuffer, std::uint32_t milliseconds) override;
  bool IcmpCloseHandle(IcmpHandle handle) override { return open_.erase(handle) > 0; }

 private:
  struct Opened {
    std::unique_ptr<EchoSocket> socket;
    std::uint16_t lastSequence = 0;
  };

  Opener openSocket_;
  bool lacksRight_ = false;
  std::map<IcmpHandle, Opened> open_;
  std::uint32_t lastHandle_ = 0;
};

} // namespace quendra::platform::linux_
