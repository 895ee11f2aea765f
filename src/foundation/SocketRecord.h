#pragma once

#include "foundation/ByteQueue.h"
#include "platform/net/Sockets.h"
#include "runtime/Variant.h"

#include <map>
#include <memory>
#include <vector>

namespace quendra::foundation {

enum SocketState : std::int32_t {
  sckClosed = 0,
  sckOpen = 1,
  sckListening = 2,
  sckConnectionPending = 3, ///< never entered
  sckResolvingHost = 4,
  sckHostResolved = 5,
  sckConnecting = 6,
  sckConnected = 7,
  sckClosing = 8,
  sckError = 9,
};

enum SocketProtocol : std::int32_t { sckTCPProtocol = 0, sckUDPProtocol = 1 };

/// The buffer of a running look-up.
using ResolveBuffer = std::vector<std::uint8_t>;

/// One socket of the array.
struct SocketRecord {
  platform::SocketHandle SocketHandle = platform::kNoSocket;
  SocketState State = sckClosed;
  Text Tag;
  Text RemoteHost;
  std::int32_t RemotePort = 0;
  Text RemoteHostIP;
  std::int32_t LocalPort = 0;
  std::int32_t LocalPortBind = 0;
  Text LocalIP;
  SocketProtocol Protocol = sckTCPProtocol;
  std::unique_ptr<ResolveBuffer> LookUpBuffer;
  ByteQueue SendBuffer;
  ByteQueue RecvBuffer;
  std::int32_t SendBufferSize = 0;
  std::int32_t RecvBufferSize = 0;
  std::vector<platform::LookUpHandle> ResolveRequests; ///< look-up handles under way
  Variant Index;

  /// What a slot is set to before it waits in the free list: its ports are -1 then, where a new slot's are 0.
  static SocketRecord Freed() {
    SocketRecord record;
    record.LocalPort = record.LocalPortBind = record.RemotePort = -1;
    return record;
  }
};

} // namespace quendra::foundation
