#include "platform/linux/net/LinuxSockets.h"

#include "platform/linux/net/SocketErrorNumbers.h"
#include "platform/linux/net/SystemAddress.h"

#include <sys/ioctl.h>
#include <sys/socket.h>

#include <cerrno>

namespace quendra::platform::linux_ {

namespace {

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

} // namespace quendra::platform::linux_
