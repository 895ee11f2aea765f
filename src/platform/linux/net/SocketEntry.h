#pragma once

#include "platform/linux/system/Descriptor.h"
#include "platform/net/SocketSelection.h"

namespace quendra::platform::linux_ {

/// One socket: where it stands, and what of it is to be told.
struct SocketEntry {
  enum class Stage { Fresh, Connecting, Connected, Listening, Datagram };

  Descriptor descriptor;
  Stage stage = Stage::Fresh;
  SocketAddress peer{};      ///< of a stream, kept when the connection has gone
  std::int32_t endError = 0; ///< what ended a stream, as the library numbers it; 0 for an orderly end

  SocketSelection selection;
  /// What the kernel watches for now; it stops with what it tells.
  std::uint32_t watched = 0;
  bool knownToKernel = false;
};

} // namespace quendra::platform::linux_
