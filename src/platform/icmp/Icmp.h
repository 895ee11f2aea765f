#pragma once

#include "platform/icmp/IcmpNumbers.h"
#include "platform/net/Ipv4Address.h"
#include "runtime/OpaqueHandle.h"

#include <cstdint>
#include <span>
#include <string>

namespace quendra::platform {

using IcmpHandle = OpaqueHandle<struct IcmpKind>;
/// What a handle that couldn't be opened is: the system's invalid handle.
inline constexpr IcmpHandle kNoIcmp{0xFFFFFFFF};

/// What to send: where, the data, and IP_OPTION_INFORMATION or nothing for the system's own.
struct EchoRequest {
  Ipv4Address address;
  std::span<const std::uint8_t> data;
  std::span<const std::uint8_t> options;
};

/// The system's ICMP helper.
class Icmp {
 public:
  virtual ~Icmp() = default;

  virtual IcmpHandle IcmpCreateFile() = 0;
  /// The system's name of the right for want of which the last IcmpCreateFile failed; empty for any other
  /// outcome.
  virtual std::string MissingRight() = 0;
  /// Sends one echo and blocks the thread until its reply or the time limit. Gives the number of replies that
  /// the buffer now holds, 0 or 1: ICMP_ECHO_REPLY and the data. A router's answer is a reply too, with that
  /// router's address and its status. Without a reply the record is empty save for its status, the number of
  /// the failure. A buffer smaller than the record stays as it was.
  virtual std::uint32_t IcmpSendEcho(IcmpHandle handle, const EchoRequest& request,
                                     std::span<std::uint8_t> replyBuffer, std::uint32_t milliseconds) = 0;
  /// False for what is no open handle.
  virtual bool IcmpCloseHandle(IcmpHandle handle) = 0;
};

} // namespace quendra::platform
