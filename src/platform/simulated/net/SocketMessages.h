#pragma once

#include "platform/EventLoop.h"
#include "platform/simulated/net/SocketEnd.h"

namespace quendra::platform::simulated {

/// What the sockets tell through the loop that they were given; without one they tell nothing.
class SocketMessages {
 public:
  void UseLoop(EventLoop& loop) { loop_ = &loop; }
  bool HasLoop() const { return loop_ != nullptr; }

  /// Runs after what waits in the loop; not at all once this object has gone.
  void Later(std::function<void()> work);
  void Post(WindowHandle window, std::uint32_t message, std::uint32_t wParam, std::uint32_t lParam);

  /// Announces an event where the socket's selection has it and it may be announced.
  void Announce(SocketEnd& end, SocketEvent event, std::int32_t error = 0);
  /// Announces whatever the socket's state calls for; after every change of it.
  void Update(SocketEnd& end);

 private:
  EventLoop* loop_ = nullptr;
  std::shared_ptr<const int> life_ = std::make_shared<const int>(0);
};

} // namespace quendra::platform::simulated
