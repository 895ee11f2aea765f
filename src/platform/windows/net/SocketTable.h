#pragma once

#include "platform/net/SocketSelection.h"
#include "platform/windows/net/RelayWindow.h"
#include "platform/windows/net/Winsock.h"

#include <map>
#include <optional>

namespace quendra::platform::windows {

struct SocketEntry {
  SOCKET socket = INVALID_SOCKET;
  SocketSelection selection;
  /// The number of the messages that the relay gets about it.
  UINT relayed = 0;
  /// The error of an end that was told while data waited, which is read first.
  std::optional<std::int32_t> awaitedEnd;
};

/// The sockets under the program's numbers for them. The system gives a number again as soon as its socket is
/// closed, while messages about that one may still be on their way; here none comes twice.
class SocketTable {
 public:
  SocketHandle Add(SOCKET socket) {
    last_ += 4;
    const SocketHandle handle(last_);
    SocketEntry& entry = sockets_[handle];
    entry.socket = socket;
    entry.relayed = kFirst + last_ / 4 % (RelayWindow::kLastMessage - kFirst + 1);
    return handle;
  }
  SocketEntry* Find(SocketHandle handle) {
    const auto found = sockets_.find(handle);
    return found == sockets_.end() ? nullptr : &found->second;
  }
  void Remove(SocketHandle handle) { sockets_.erase(handle); }
  /// Whom a message of the relay is about: nobody, when it is about a socket that has gone.
  std::pair<SocketHandle, SocketEntry*> Relayed(UINT message, SOCKET socket) {
    for (auto& [handle, entry] : sockets_)
      if (entry.relayed == message && entry.socket == socket) return {handle, &entry};
    return {kNoSocket, nullptr};
  }
  std::map<SocketHandle, SocketEntry>& All() { return sockets_; }

  /// The first of the relay's messages is for look-ups.
  static constexpr UINT kLookUpMessage = RelayWindow::kFirstMessage;

 private:
  static constexpr UINT kFirst = kLookUpMessage + 1;

  std::map<SocketHandle, SocketEntry> sockets_;
  std::uint32_t last_ = 0x100;
};

} // namespace quendra::platform::windows
