#include "platform/linux/net/LinuxSockets.h"

#include "platform/linux/net/SocketErrorNumbers.h"
#include "runtime/ByteFields.h"

#include <netinet/in.h>
#include <sys/ioctl.h>
#include <sys/socket.h>

#include <algorithm>
#include <cerrno>

namespace quendra::platform::linux_ {

namespace {

sockaddr_in SystemAddress(const SocketAddress& address) {
  sockaddr_in system{};
  system.sin_family = AF_INET;
  system.sin_addr.s_addr = address.address.InMemory();
  system.sin_port = htons(address.port);
  return system;
}

SocketAddress LibraryAddress(const sockaddr_in& system) {
  return {Ipv4Address::FromMemory(system.sin_addr.s_addr), ntohs(system.sin_port)};
}

/// This system's name for an option of the library's socket level; -1 for one that it lacks.
int SystemOption(std::int32_t option) {
  switch (option) {
  case kReuseAddressOption: return SO_REUSEADDR;
  case kBroadcastOption: return SO_BROADCAST;
  case kSendBufferOption: return SO_SNDBUF;
  case kReceiveBufferOption: return SO_RCVBUF;
  default: return -1;
  }
}

template <typename Ask> std::int32_t AskAddress(Ask ask, int descriptor, SocketAddress& address) {
  sockaddr_in system{};
  socklen_t size = sizeof system;
  const int result = ask(descriptor, reinterpret_cast<sockaddr*>(&system), &size);
  if (result == 0) address = LibraryAddress(system);
  return result;
}

} // namespace

std::int32_t LinuxSockets::WSAStartup(std::uint16_t) {
  ++started_;
  return 0;
}

std::int32_t LinuxSockets::WSACleanup() {
  if (started_ == 0) return Fail(kNotStarted);
  if (--started_ == 0) notifier_.Clear();
  return 0;
}

SocketEntry* LinuxSockets::Entry(SocketHandle socket) {
  SocketEntry* entry = started_ > 0 ? notifier_.Find(socket) : nullptr;
  if (!entry) Fail(started_ > 0 ? kNotASocket : kNotStarted);
  return entry;
}

std::int32_t LinuxSockets::Fail(std::int32_t error) {
  lastError_ = error;
  return kSocketError;
}

SocketHandle LinuxSockets::FailSocket(std::int32_t error) {
  Fail(error);
  return kNoSocket;
}

std::int32_t LinuxSockets::FailWithErrno() { return Fail(SocketErrorOf(errno)); }

std::int32_t LinuxSockets::Answer(std::int64_t result) {
  return result < 0 ? FailWithErrno() : static_cast<std::int32_t>(result);
}

SocketHandle LinuxSockets::socket(std::int32_t family, std::int32_t type, std::int32_t protocol) {
  if (started_ == 0) return FailSocket(kNotStarted);
  SocketEntry entry;
  entry.descriptor = Descriptor(::socket(family, type | SOCK_CLOEXEC, protocol));
  if (!entry.descriptor) return FailSocket(SocketErrorOf(errno));
  if (type == SOCK_DGRAM) entry.stage = SocketEntry::Stage::Datagram;
  return notifier_.Add(std::move(entry));
}

std::int32_t LinuxSockets::closesocket(SocketHandle socket) {
  if (!Entry(socket)) return kSocketError;
  notifier_.Remove(socket);
  return 0;
}

std::int32_t LinuxSockets::bind(SocketHandle socket, const SocketAddress& local) {
  SocketEntry* entry = Entry(socket);
  if (!entry) return kSocketError;
  const sockaddr_in address = SystemAddress(local);
  return Answer(
      ::bind(entry->descriptor.Number(), reinterpret_cast<const sockaddr*>(&address), sizeof address));
}

std::int32_t LinuxSockets::listen(SocketHandle socket, std::int32_t backlog) {
  SocketEntry* entry = Entry(socket);
  if (!entry) return kSocketError;
  if (::listen(entry->descriptor.Number(), backlog) != 0) return FailWithErrno();
  entry->stage = SocketEntry::Stage::Listening;
  notifier_.Rearm(socket, *entry);
  return 0;
}

SocketHandle LinuxSockets::accept(SocketHandle socket) {
  SocketEntry* listener = Entry(socket);
  if (!listener) return kNoSocket;
  sockaddr_in peer{};
  socklen_t size = sizeof peer;
  SocketEntry entry;
  entry.descriptor = Descriptor(::accept4(listener->descriptor.Number(), reinterpret_cast<sockaddr*>(&peer),
                                          &size, SOCK_CLOEXEC | SOCK_NONBLOCK));
  const int error = errno;
  notifier_.Enable(socket, *listener, kFdAccept);
  if (!entry.descriptor) return FailSocket(SocketErrorOf(error));
  entry.stage = SocketEntry::Stage::Connected;
  entry.peer = LibraryAddress(peer);
  entry.window = listener->window;
  entry.message = listener->message;
  entry.mask = listener->mask;
  const SocketHandle accepted = notifier_.Add(std::move(entry));
  if (notifier_.Watch(accepted, *notifier_.Find(accepted))) return accepted;
  FailWithErrno();
  notifier_.Remove(accepted);
  return kNoSocket;
}

std::int32_t LinuxSockets::connect(SocketHandle socket, const SocketAddress& peer) {
  SocketEntry* entry = Entry(socket);
  if (!entry) return kSocketError;
  // This system takes address 0 for its own host; to the library neither is a place to connect to.
  if (peer.address.IsAny() || peer.port == 0) return Fail(kAddressNotAvailable);
  const sockaddr_in address = SystemAddress(peer);
  const int descriptor = entry->descriptor.Number();
  const int result = ::connect(descriptor, reinterpret_cast<const sockaddr*>(&address), sizeof address);
  const int error = result == 0 ? 0 : errno;
  if (entry->stage == SocketEntry::Stage::Fresh) entry->peer = peer;
  if (entry->mask == 0 || entry->stage != SocketEntry::Stage::Fresh) {
    if (error == 0 && entry->stage == SocketEntry::Stage::Fresh) entry->stage = SocketEntry::Stage::Connected;
    return error == 0 ? 0 : Fail(SocketErrorOf(error));
  }
  // A peer of this machine may answer before the call returns. The library tells it by message all the same.
  if (error == 0 || error == EINPROGRESS) {
    entry->stage = SocketEntry::Stage::Connecting;
    notifier_.Rearm(socket, *entry);
  } else if (error == ECONNREFUSED) {
    notifier_.Announce(socket, *entry, kFdConnect, SocketErrorOf(error));
  } else {
    return Fail(SocketErrorOf(error));
  }
  return Fail(kWouldBlock);
}

std::int32_t LinuxSockets::getsockname(SocketHandle socket, SocketAddress& local) {
  SocketEntry* entry = Entry(socket);
  return entry ? Answer(AskAddress(::getsockname, entry->descriptor.Number(), local)) : kSocketError;
}

std::int32_t LinuxSockets::getpeername(SocketHandle socket, SocketAddress& peer) {
  SocketEntry* entry = Entry(socket);
  if (!entry) return kSocketError;
  // The kernel forgets the peer of a connection that was reset.
  if (entry->stage != SocketEntry::Stage::Connected)
    return Answer(AskAddress(::getpeername, entry->descriptor.Number(), peer));
  peer = entry->peer;
  return 0;
}

std::int32_t LinuxSockets::getsockopt(SocketHandle socket, std::int32_t level, std::int32_t option,
                                      std::int32_t& value) {
  SocketEntry* entry = Entry(socket);
  if (!entry) return kSocketError;
  if (level == kSocketLevel && option == kMaxMessageSizeOption) {
    value = kLargestDatagram;
    return 0;
  }
  const int known = level == kSocketLevel ? SystemOption(option) : -1;
  if (known < 0) return Fail(SocketErrorOf(ENOPROTOOPT));
  socklen_t size = sizeof value;
  return Answer(::getsockopt(entry->descriptor.Number(), SOL_SOCKET, known, &value, &size));
}

std::int32_t LinuxSockets::setsockopt(SocketHandle socket, std::int32_t level, std::int32_t option,
                                      std::int32_t value) {
  SocketEntry* entry = Entry(socket);
  if (!entry) return kSocketError;
  const int known = level == kSocketLevel ? SystemOption(option) : -1;
  if (known < 0) return Fail(SocketErrorOf(ENOPROTOOPT));
  return Answer(::setsockopt(entry->descriptor.Number(), SOL_SOCKET, known, &value, sizeof value));
}

std::int32_t LinuxSockets::ioctlsocket(SocketHandle socket, std::uint32_t command, std::uint32_t& value) {
  SocketEntry* entry = Entry(socket);
  if (!entry) return kSocketError;
  if (command != kBytesWaiting) return Fail(kInvalidArgument);
  int amount = 0;
  if (::ioctl(entry->descriptor.Number(), FIONREAD, &amount) != 0) return FailWithErrno();
  value = static_cast<std::uint32_t>(amount);
  return 0;
}

std::int32_t LinuxSockets::send(SocketHandle socket, std::span<const std::uint8_t> bytes, std::int32_t) {
  SocketEntry* entry = Entry(socket);
  if (!entry) return kSocketError;
  const auto sent = ::send(entry->descriptor.Number(), bytes.data(), bytes.size(), MSG_NOSIGNAL);
  if (sent >= 0) return static_cast<std::int32_t>(sent);
  const int error = errno;
  if (error == EAGAIN) notifier_.Enable(socket, *entry, kFdWrite);
  return Fail(SocketErrorOf(error));
}

std::int32_t LinuxSockets::sendto(SocketHandle socket, std::span<const std::uint8_t> bytes, std::int32_t,
                                  const SocketAddress& peer) {
  SocketEntry* entry = Entry(socket);
  if (!entry) return kSocketError;
  const sockaddr_in address = SystemAddress(peer);
  return Answer(::sendto(entry->descriptor.Number(), bytes.data(), bytes.size(), MSG_NOSIGNAL,
                         reinterpret_cast<const sockaddr*>(&address), sizeof address));
}

std::int32_t LinuxSockets::recv(SocketHandle socket, std::span<std::uint8_t> buffer, std::int32_t flags) {
  SocketAddress from;
  return recvfrom(socket, buffer, flags, from);
}

std::int32_t LinuxSockets::recvfrom(SocketHandle socket, std::span<std::uint8_t> buffer, std::int32_t flags,
                                    SocketAddress& from) {
  SocketEntry* entry = Entry(socket);
  if (!entry) return kSocketError;
  const bool datagram = entry->stage == SocketEntry::Stage::Datagram;
  sockaddr_in address{};
  socklen_t size = sizeof address;
  const int systemFlags = ((flags & kPeek) != 0 ? MSG_PEEK : 0) | (datagram ? MSG_TRUNC : 0);
  const auto read = ::recvfrom(entry->descriptor.Number(), buffer.data(), buffer.size(), systemFlags,
                               reinterpret_cast<sockaddr*>(&address), &size);
  const int error = errno;
  notifier_.Enable(socket, *entry, kFdRead);
  if (read < 0) return Fail(SocketErrorOf(error));
  if (read == 0 && !buffer.empty() && entry->endError != 0) return Fail(entry->endError);
  if (datagram) from = LibraryAddress(address);
  if (datagram && static_cast<std::size_t>(read) > buffer.size()) return Fail(kMessageTooLong);
  return static_cast<std::int32_t>(read);
}

std::int32_t LinuxSockets::WSAAsyncSelect(SocketHandle socket, WindowHandle window, std::uint32_t message,
                                          std::int32_t events) {
  SocketEntry* entry = Entry(socket);
  if (!entry) return kSocketError;
  int nonBlocking = 1;
  if (::ioctl(entry->descriptor.Number(), FIONBIO, &nonBlocking) != 0) return FailWithErrno();
  entry->window = window;
  entry->message = message;
  entry->mask = events;
  if (notifier_.Watch(socket, *entry)) return 0;
  entry->mask = 0;
  return FailWithErrno();
}

LookUpHandle LinuxSockets::WSAAsyncGetHostByName(WindowHandle window, std::uint32_t message,
                                                 const std::string& name, std::span<std::uint8_t> buffer) {
  if (started_ == 0) {
    Fail(kNotStarted);
    return kNoLookUp;
  }
  // The handle is known only once the look-up has started, and its end needs it.
  const auto handle = std::make_shared<LookUpHandle>();
  *handle = lookUps_.Start(
      name, [this, handle, window, message, buffer](std::int32_t error, const auto& addresses) {
        const std::size_t room = buffer.size() / sizeof(std::uint32_t);
        const std::size_t count = room == 0 ? 0 : std::min(addresses.size(), room - 1);
        if (error == 0 && room > 0) PutLittle32(buffer, 0, static_cast<std::uint32_t>(count));
        for (std::size_t i = 0; error == 0 && i < count; ++i)
          PutLittle32(buffer, 4 + 4 * i, addresses[i].InMemory());
        loop_.PostMessage(window, message, handle->Value(), SocketMessageWord(0, error));
      });
  if (*handle == kNoLookUp) Fail(kNoBufferSpace);
  return *handle;
}

std::int32_t LinuxSockets::WSACancelAsyncRequest(LookUpHandle lookUp) {
  return lookUps_.Cancel(lookUp) ? 0 : Fail(kInvalidArgument);
}

} // namespace quendra::platform::linux_
