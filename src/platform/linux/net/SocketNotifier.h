#pragma once

#include "platform/DescriptorWatch.h"
#include "platform/linux/net/SocketEntry.h"

#include <map>
#include <memory>

namespace quendra::platform::linux_ {

/// Turns the readiness of sockets into window messages. The kernel watches a socket only for what may be
/// announced, so a message that waits for its handler costs nothing meanwhile, and the loop serves others
/// between two messages.
class SocketNotifier {
 public:
  SocketNotifier(EventLoop& loop, DescriptorWatch& descriptors) : loop_(loop), descriptors_(descriptors) {}

  SocketEntry* Find(SocketHandle socket);
  SocketHandle Add(SocketEntry entry);
  void Remove(SocketHandle socket);
  void Clear();
  std::size_t Count() const { return sockets_.size(); }

  /// After a change of the selection: has the kernel watch the socket, or watch it no more. All that the
  /// kernel may lack for it is asked for here, so that no later step can leave a socket deaf. False, with the
  /// reason in errno, when it won't.
  bool Watch(SocketHandle socket, SocketEntry& entry);
  /// After a change of what may be announced: tells the kernel what to watch for.
  void Rearm(SocketHandle socket, SocketEntry& entry);
  void Enable(SocketHandle socket, SocketEntry& entry, std::int32_t events);
  /// Posts the event's message where the mask has it and it may be announced.
  void Announce(SocketHandle socket, SocketEntry& entry, SocketEvent event, std::int32_t error = 0);

 private:
  bool Open();
  void Serve();
  void OnReady(SocketHandle socket, SocketEntry& entry, std::uint32_t ready);
  void OnConnectionReady(SocketHandle socket, SocketEntry& entry);
  void OnStreamReadable(SocketHandle socket, SocketEntry& entry, std::uint32_t ready);

  EventLoop& loop_;
  DescriptorWatch& descriptors_;
  Descriptor epoll_;
  std::unique_ptr<EventLoop::Subscription> watch_;
  std::map<SocketHandle, SocketEntry> sockets_;
  std::uint32_t last_ = 0x100;
};

} // namespace quendra::platform::linux_
