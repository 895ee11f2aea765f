#include "platform/linux/net/LinuxSockets.h"

#include "platform/linux/net/SocketErrorNumbers.h"
#include "platform/linux/net/SystemAddress.h"

#include <sys/socket.h>

#include <cerrno>

namespace quendra::platform::linux_ {

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

} // namespace quendra::platform::linux_
