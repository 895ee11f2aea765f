#pragma once

#include "platform/icmp/Icmp.h"
#include "platform/windows/icmp/IcmpLibrary.h"

#include <set>

namespace quendra::platform::windows {

/// The system's own echoes.
class WindowsIcmp : public Icmp {
 public:
  IcmpHandle IcmpCreateFile() override;
  /// No right is needed from the first system on that this program runs on.
  std::string MissingRight() override { return {}; }
  std::uint32_t IcmpSendEcho(IcmpHandle handle, const EchoRequest& request,
                             std::span<std::uint8_t> replyBuffer, std::uint32_t milliseconds) override;
  bool IcmpCloseHandle(IcmpHandle handle) override;

 private:
  const IcmpLibrary library_;
  std::set<IcmpHandle> open_;
};

} // namespace quendra::platform::windows
