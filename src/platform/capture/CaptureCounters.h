#pragma once

#include <cstdint>

namespace quendra::platform {

/// What became of the packets of a capture, over all its sessions.
struct CaptureCounters {
  std::uint64_t received = 0;        ///< packets taken from the kernel
  std::uint64_t droppedByKernel = 0; ///< packets that the kernel's buffer had no room for
  std::uint64_t droppedByQueue = 0;  ///< frames that waited too long, as events took none
};

} // namespace quendra::platform
