#pragma once

#include "platform/net/SocketSelection.h"

#include <deque>
#include <memory>
#include <string>

namespace quendra::platform::simulated {

class SimulatedPeer;

/// One end of a connection, or a socket that will be one.
struct SocketEnd {
  enum class Stage { Fresh, Connecting, Connected, Listening, Datagram };
  struct Datagram {
    std::string bytes;
    SocketAddress from;
  };
  static constexpr std::size_t kNoLimit = SIZE_MAX;

  SocketHandle handle = kNoSocket; ///< kNoSocket while nobody has accepted it
  Stage stage = Stage::Fresh;
  SocketAddress local;
  SocketAddress remote;

  SocketSelection selection;

  std::string arrived;             ///< TCP
  std::deque<Datagram> datagrams;  ///< UDP
  bool ended = false;              ///< nothing will arrive any more
  std::int32_t endError = 0;       ///< 0 for an orderly end
  std::size_t room = kNoLimit;     ///< bytes that the far end takes now
  std::size_t fullRoom = kNoLimit; ///< and after it has worked on them
  std::size_t backlogSize = 0;
  std::deque<std::shared_ptr<SocketEnd>> backlog;

  // The far end is one of these, or nothing.
  std::weak_ptr<SocketEnd> partner;
  std::shared_ptr<SimulatedPeer> peer;

  /// Of the stream, or of the next datagram.
  std::size_t BytesWaiting() const {
    if (stage != Stage::Datagram) return arrived.size();
    return datagrams.empty() ? 0 : datagrams.front().bytes.size();
  }
};

} // namespace quendra::platform::simulated
