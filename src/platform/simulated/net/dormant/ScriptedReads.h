#pragma once

#include "platform/net/Sockets.h"

#include <deque>
#include <map>
#include <optional>
#include <vector>

namespace quendra::platform::simulated {

/// Dormant: what a test puts before the reads of handles that belong to no simulated network. Only the
/// capture's second way to the packets reads such handles, and nothing opens it.
class ScriptedReads {
 public:
  void Put(SocketHandle socket, std::vector<std::uint8_t> bytes) {
    waiting_[socket].push_back(std::move(bytes));
  }
  void PutFailure(SocketHandle socket) { waiting_[socket].push_back(std::nullopt); }
  bool Knows(SocketHandle socket) const { return waiting_.contains(socket); }
  /// As recv gives it: at most one of the pieces, 0 when nothing is left.
  std::int32_t Read(SocketHandle socket, std::span<std::uint8_t> buffer);

 private:
  std::map<SocketHandle, std::deque<std::optional<std::vector<std::uint8_t>>>> waiting_;
};

} // namespace quendra::platform::simulated
