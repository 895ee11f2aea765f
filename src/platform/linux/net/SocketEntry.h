#pragma once

#include "platform/linux/system/Descriptor.h"
#include "platform/net/Sockets.h"

namespace quendra::platform::linux_ {

/// One socket: where it stands, and which of its events may be announced now.
struct SocketEntry {
  enum class Stage { Fresh, Connecting, Connected, Listening, Datagram };

  Descriptor descriptor;
  Stage stage = Stage::Fresh;
  SocketAddress peer{};      ///< of a stream, kept when the connection has gone
  std::int32_t endError = 0; ///< what ended a stream, as the library numbers it; 0 for an orderly end

  // What WSAAsyncSelect asked for.
  WindowHandle window;
  std::uint32_t message = 0;
  std::int32_t mask = 0;

  /// Events that may be announced; one leaves when it is and comes back with the call that re-enables it.
  std::int32_t enabled = kFdRead | kFdWrite | kFdAccept | kFdConnect | kFdClose;
  /// What the kernel watches for now; it stops with what it tells.
  std::uint32_t watched = 0;
  bool knownToKernel = false;
};

} // namespace quendra::platform::linux_
