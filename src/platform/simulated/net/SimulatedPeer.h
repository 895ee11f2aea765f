#pragma once

#include "platform/simulated/net/SocketEnd.h"

namespace quendra::platform::simulated {

class SimulatedStreams;

/// The far end of a connection, as a test plays it. What it does is seen by the program at once, save for the
/// message that tells of it.
class SimulatedPeer : public std::enable_shared_from_this<SimulatedPeer> {
 public:
  SimulatedPeer(SimulatedStreams& streams, std::weak_ptr<SocketEnd> near)
      : streams_(streams), near_(std::move(near)) {}
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
  SimulatedStreams& Streams() { return streams_; }

 private:
  SimulatedStreams& streams_;
  std::weak_ptr<SocketEnd> near_;
};

} // namespace quendra::platform::simulated
