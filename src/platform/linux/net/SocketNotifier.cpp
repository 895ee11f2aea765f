#include "platform/linux/net/SocketNotifier.h"

#include "platform/linux/net/SocketErrorNumbers.h"

#include <sys/epoll.h>
#include <sys/socket.h>

#include <array>
#include <cerrno>

namespace quendra::platform::linux_ {

namespace {

constexpr int kBatch = 64;
constexpr std::uint32_t kReadable = EPOLLIN;
constexpr std::uint32_t kWritable = EPOLLOUT;
constexpr std::uint32_t kEnded = EPOLLRDHUP;
constexpr std::uint32_t kAtEnd = EPOLLRDHUP | EPOLLHUP | EPOLLERR;

/// The error that waits on the socket; asking takes it away.
int TakeError(int descriptor) {
  int error = 0;
  socklen_t size = sizeof error;
  return ::getsockopt(descriptor, SOL_SOCKET, SO_ERROR, &error, &size) == 0 ? error : errno;
}

/// Whether a stream at its end has data left; notes what ended it when it has none. The kernel's count of
/// bytes stops at an urgent one, so only a look at the data itself tells.
bool HasData(SocketEntry& entry) {
  std::uint8_t byte = 0;
  const auto seen = ::recv(entry.descriptor.Number(), &byte, 1, MSG_PEEK | MSG_DONTWAIT);
  if (seen > 0) return true;
  const int error = seen < 0 && errno != EAGAIN ? errno : TakeError(entry.descriptor.Number());
  if (error != 0) entry.endError = SocketErrorOf(error);
  return false;
}

std::uint32_t InterestOf(const SocketEntry& entry) {
  const auto wants = [&](SocketEvent event) { return entry.selection.Wants(event); };
  switch (entry.stage) {
  case SocketEntry::Stage::Fresh: return 0;
  case SocketEntry::Stage::Connecting: return wants(kFdConnect) ? kWritable : 0;
  case SocketEntry::Stage::Listening: return wants(kFdAccept) ? kReadable : 0;
  case SocketEntry::Stage::Connected:
  case SocketEntry::Stage::Datagram: break;
  }
  // The end of a stream is told after its last data, so it is looked for together with data.
  const bool reads = wants(kFdRead) && (entry.selection.enabled & kFdClose) != 0;
  return (reads ? kReadable | kEnded : 0) | (wants(kFdWrite) ? kWritable : 0);
}

epoll_event EventFor(SocketHandle socket, std::uint32_t interest) {
  epoll_event event{};
  event.events = interest | EPOLLONESHOT;
  event.data.u32 = socket.Value();
  return event;
}

} // namespace

SocketEntry* SocketNotifier::Find(SocketHandle socket) {
  const auto found = sockets_.find(socket);
  return found == sockets_.end() ? nullptr : &found->second;
}

SocketHandle SocketNotifier::Add(SocketEntry entry) {
  // A number of its own, never that of a socket gone before: messages for that one may still be on their way.
  last_ += 4;
  const SocketHandle socket(last_);
  sockets_.emplace(socket, std::move(entry));
  return socket;
}

void SocketNotifier::Remove(SocketHandle socket) { sockets_.erase(socket); }

void SocketNotifier::Clear() { sockets_.clear(); }

bool SocketNotifier::Open() {
  if (epoll_) return true;
  epoll_ = Descriptor(::epoll_create1(EPOLL_CLOEXEC));
  if (epoll_) watch_ = descriptors_.WatchDescriptor(epoll_.Number(), [this] { Serve(); });
  return static_cast<bool>(epoll_);
}

bool SocketNotifier::Watch(SocketHandle socket, SocketEntry& entry) {
  const bool wanted = entry.selection.mask != 0;
  if (wanted && !Open()) return false;
  if (wanted != entry.knownToKernel) {
    epoll_event event = EventFor(socket, 0);
    if (::epoll_ctl(epoll_.Number(), wanted ? EPOLL_CTL_ADD : EPOLL_CTL_DEL, entry.descriptor.Number(),
                    &event) != 0)
      return false;
    entry.knownToKernel = wanted;
    entry.watched = 0;
  }
  Rearm(socket, entry);
  return true;
}

void SocketNotifier::Rearm(SocketHandle socket, SocketEntry& entry) {
  const std::uint32_t interest = InterestOf(entry);
  if (!entry.knownToKernel || interest == entry.watched) return;
  epoll_event event = EventFor(socket, interest);
  ::epoll_ctl(epoll_.Number(), EPOLL_CTL_MOD, entry.descriptor.Number(), &event);
  entry.watched = interest;
}

void SocketNotifier::Enable(SocketHandle socket, SocketEntry& entry, std::int32_t events) {
  entry.selection.enabled |= events;
  Rearm(socket, entry);
}

void SocketNotifier::Announce(SocketHandle socket, SocketEntry& entry, SocketEvent event,
                              std::int32_t error) {
  entry.selection.Announce(loop_, socket, event, error);
}

void SocketNotifier::Serve() {
  std::array<epoll_event, kBatch> ready;
  const int count = ::epoll_wait(epoll_.Number(), ready.data(), kBatch, 0);
  for (int i = 0; i < count; ++i) {
    const SocketHandle socket(ready[static_cast<std::size_t>(i)].data.u32);
    SocketEntry* entry = Find(socket);
    if (!entry) continue;
    entry->watched = 0;
    OnReady(socket, *entry, ready[static_cast<std::size_t>(i)].events);
    Rearm(socket, *entry);
  }
}

void SocketNotifier::OnReady(SocketHandle socket, SocketEntry& entry, std::uint32_t ready) {
  switch (entry.stage) {
  case SocketEntry::Stage::Fresh: return;
  case SocketEntry::Stage::Connecting: return OnConnectionReady(socket, entry);
  case SocketEntry::Stage::Listening: return Announce(socket, entry, kFdAccept);
  case SocketEntry::Stage::Datagram:
    // An answer that nobody listens there leaves an error on the socket; a datagram socket goes on.
    if ((ready & EPOLLERR) != 0) TakeError(entry.descriptor.Number());
    if ((ready & EPOLLIN) != 0) Announce(socket, entry, kFdRead);
    break;
  case SocketEntry::Stage::Connected:
    if ((ready & (kReadable | kAtEnd)) != 0) OnStreamReadable(socket, entry, ready);
    break;
  }
  if ((ready & EPOLLOUT) != 0) Announce(socket, entry, kFdWrite);
}

void SocketNotifier::OnConnectionReady(SocketHandle socket, SocketEntry& entry) {
  const int error = TakeError(entry.descriptor.Number());
  // A peer may have ended a connection that stood: that is told like any other, and its end after it.
  const bool stood = error == 0 || error == ECONNRESET || error == EPIPE;
  entry.stage = stood ? SocketEntry::Stage::Connected : SocketEntry::Stage::Fresh;
  if (stood) entry.endError = SocketErrorOf(error);
  Announce(socket, entry, kFdConnect, stood ? 0 : SocketErrorOf(error));
  if (error == 0) Announce(socket, entry, kFdWrite);
}

void SocketNotifier::OnStreamReadable(SocketHandle socket, SocketEntry& entry, std::uint32_t ready) {
  if ((entry.selection.enabled & kFdRead) == 0) return;
  // Readable and not at its end, a stream has data; at its end it may have some left.
  if ((ready & kAtEnd) == 0 || HasData(entry)) return Announce(socket, entry, kFdRead);
  Announce(socket, entry, kFdClose, entry.endError);
  entry.selection.enabled &= ~kFdClose;
  // A peer that sends no more may still read.
  if (entry.endError != 0) entry.selection.enabled &= ~kFdWrite;
}

} // namespace quendra::platform::linux_
