#include "platform/windows/net/SystemAddress.h"
#include "platform/windows/net/WindowsSockets.h"

namespace quendra::platform::windows {

namespace {

template <typename Ask> int AskAddress(Ask ask, SOCKET socket, SocketAddress& address) {
  sockaddr_in system{};
  int size = sizeof system;
  const int result = ask(socket, reinterpret_cast<sockaddr*>(&system), &size);
  if (result == 0) address = LibraryAddress(system);
  return result;
}

const char* Characters(std::span<const std::uint8_t> bytes) {
  return reinterpret_cast<const char*>(bytes.data());
}

} // namespace

std::int32_t WindowsSockets::getsockname(SocketHandle socket, SocketAddress& local) {
  const SocketEntry* entry = Entry(socket);
  return entry ? Answer(AskAddress(library_.getsockname, entry->socket, local)) : kSocketError;
}

std::int32_t WindowsSockets::getpeername(SocketHandle socket, SocketAddress& peer) {
  const SocketEntry* entry = Entry(socket);
  return entry ? Answer(AskAddress(library_.getpeername, entry->socket, peer)) : kSocketError;
}

std::int32_t WindowsSockets::getsockopt(SocketHandle socket, std::int32_t level, std::int32_t option,
                                        std::int32_t& value) {
  const SocketEntry* entry = Entry(socket);
  if (!entry) return kSocketError;
  std::int32_t answered = 0; // of which some options fill a byte alone
  int size = sizeof answered;
  const int result =
      library_.getsockopt(entry->socket, level, option, reinterpret_cast<char*>(&answered), &size);
  if (result == 0) value = answered;
  return Answer(result);
}

std::int32_t WindowsSockets::setsockopt(SocketHandle socket, std::int32_t level, std::int32_t option,
                                        std::int32_t value) {
  const SocketEntry* entry = Entry(socket);
  if (!entry) return kSocketError;
  return Answer(
      library_.setsockopt(entry->socket, level, option, reinterpret_cast<const char*>(&value), sizeof value));
}

std::int32_t WindowsSockets::ioctlsocket(SocketHandle socket, std::uint32_t command, std::uint32_t& value) {
  const SocketEntry* entry = Entry(socket);
  if (!entry) return kSocketError;
  if (command != kBytesWaiting) return Fail(kInvalidArgument);
  u_long amount = 0;
  const int result = library_.ioctlsocket(entry->socket, static_cast<long>(command), &amount);
  if (result == 0) value = amount;
  return Answer(result);
}

std::int32_t WindowsSockets::send(SocketHandle socket, std::span<const std::uint8_t> bytes,
                                  std::int32_t flags) {
  SocketEntry* entry = Entry(socket);
  if (!entry) return kSocketError;
  const std::int32_t sent =
      Answer(library_.send(entry->socket, Characters(bytes), static_cast<int>(bytes.size()), flags));
  if (sent < 0 && lastError_ == kWouldBlock) entry->selection.enabled |= kFdWrite;
  return sent;
}

std::int32_t WindowsSockets::sendto(SocketHandle socket, std::span<const std::uint8_t> bytes,
                                    std::int32_t flags, const SocketAddress& peer) {
  const SocketEntry* entry = Entry(socket);
  if (!entry) return kSocketError;
  const sockaddr_in address = SystemAddress(peer);
  return Answer(library_.sendto(entry->socket, Characters(bytes), static_cast<int>(bytes.size()), flags,
                                reinterpret_cast<const sockaddr*>(&address), sizeof address));
}

std::int32_t WindowsSockets::recv(SocketHandle socket, std::span<std::uint8_t> buffer, std::int32_t flags) {
  SocketAddress from;
  return recvfrom(socket, buffer, flags, from);
}

std::int32_t WindowsSockets::recvfrom(SocketHandle socket, std::span<std::uint8_t> buffer, std::int32_t flags,
                                      SocketAddress& from) {
  SocketEntry* entry = Entry(socket);
  if (!entry) return kSocketError;
  entry->selection.enabled |= kFdRead;
  sockaddr_in address{};
  int size = sizeof address;
  const std::int32_t read = Answer(library_.recvfrom(entry->socket, reinterpret_cast<char*>(buffer.data()),
                                                     static_cast<int>(buffer.size()), flags,
                                                     reinterpret_cast<sockaddr*>(&address), &size));
  // A stream has no sender to tell.
  if (address.sin_family == AF_INET && (read >= 0 || lastError_ == kMessageTooLong))
    from = LibraryAddress(address);
  if (entry->awaitedEnd) OnEnd(socket, *entry, *entry->awaitedEnd);
  return read;
}

} // namespace quendra::platform::windows
