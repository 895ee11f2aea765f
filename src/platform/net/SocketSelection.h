#pragma once

#include "platform/EventLoop.h"
#include "platform/net/Sockets.h"

namespace quendra::platform {

/// What WSAAsyncSelect asked for of one socket, and which of its events may be announced now.
struct SocketSelection {
  WindowHandle window;
  std::uint32_t message = 0;
  std::int32_t mask = 0;
  /// One leaves when it is announced and comes back with the call that re-enables it.
  std::int32_t enabled = kFdRead | kFdWrite | kFdAccept | kFdConnect | kFdClose;

  /// Replaces what was asked for; what may be announced stays as it is.
  void Select(WindowHandle newWindow, std::uint32_t newMessage, std::int32_t newMask) {
    window = newWindow;
    message = newMessage;
    mask = newMask;
  }
  bool Wants(SocketEvent event) const { return (mask & enabled & event) != 0; }
  /// Posts the event's message, if it is asked for and may be announced.
  void Announce(EventLoop& loop, SocketHandle socket, SocketEvent event, std::int32_t error) {
    if (!Wants(event)) return;
    enabled &= ~event;
    loop.PostMessage(window, message, socket.Value(), SocketMessageWord(event, error));
  }
};

} // namespace quendra::platform
