#pragma once

#include <cstdint>

namespace quendra::platform {

/// Dormant: what of the socket library only the capture's second way to the packets asks, and nothing opens
/// that.
class BlockingCalls {
 public:
  virtual ~BlockingCalls() = default;

  virtual bool WSAIsBlocking() = 0;
  virtual std::int32_t WSACancelBlockingCall() = 0;
};

} // namespace quendra::platform
