#pragma once

#include "platform/net/Sockets.h"

#include <cstdint>
#include <deque>
#include <memory>
#include <string>
#include <vector>

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

  // What WSAAsyncSelect asked for, and which events may be announced now.
  WindowHandle window;
  std::uint32_t message = 0;
  std::int32_t mask = 0;
  std::int32_t enabled = kFdRead | kFdWrite | kFdAccept | kFdConnect | kFdClose;

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
};

class SimulatedSockets;

/// The far end of a connection, as a test plays it. What it does is seen by the program at once, save for the
/// message that tells of it.
class SimulatedPeer : public std::enable_shared_from_this<SimulatedPeer> {
 public:
  SimulatedPeer(SimulatedSockets& sockets, std::weak_ptr<SocketEnd> near)
      : sockets_(sockets), near_(std::move(near)) {}
  virtual ~SimulatedPeer() = default;

  void Send(const std::string& bytes);
  /// An orderly end, after what was sent.
  void Close();
  /// An end by force: the program reads what arrived before, then sees kConnectionReset.
  void Reset();
  /// Takes at most this many bytes, then none until the loop's next round.
  void TakeAtMost(std::size_t bytes);

  /// What the program sent so far.
  std::string Received;
  /// The program has closed its end.
  bool Ended = false;

  /// Called by the network.
  virtual void OnReceived() {}

 protected:
  SimulatedSockets& Network() { return sockets_; }

 private:
  SimulatedSockets& sockets_;
  std::weak_ptr<SocketEnd> near_;
};

} // namespace quendra::platform::simulated
