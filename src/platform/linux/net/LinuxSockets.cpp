#include "platform/linux/net/LinuxSockets.h"

#include "platform/linux/net/SocketErrorNumbers.h"
#include "platform/linux/net/SystemAddress.h"
#include "platform/net/AddressList.h"

#include <sys/ioctl.h>
#include <sys/socket.h>

#include <cerrno>

namespace quendra::platform::linux_ {

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
  const SocketSelection& selection = listener->selection;
  entry.selection.Select(selection.window, selection.message, selection.mask);
  const SocketHandle accepted = notifier_.Add(std::move(entry));
  if (notifier_.Watch(accepted, *notifier_.Find(accepted))) return accepted;
  FailWithErrno();
  notifier_.Remove(accepted);
  return kNoSocket;
}

std::int32_t LinuxSockets::connect(SocketHandle socket, const SocketAddress& peer) {
  SocketEntry* entry = Entry(socket);
  if (!entry) return kSocketError;
  // This system takes address 0 for its own host; the library connects neither there nor to port 0.
  if (peer.address.IsAny() || peer.port == 0) return Fail(kAddressNotAvailable);
  const sockaddr_in address = SystemAddress(peer);
  const int descriptor = entry->descriptor.Number();
  const int result = ::connect(descriptor, reinterpret_cast<const sockaddr*>(&address), sizeof address);
  const int error = result == 0 ? 0 : errno;
  if (entry->stage == SocketEntry::Stage::Fresh) entry->peer = peer;
  if (entry->selection.mask == 0 || entry->stage != SocketEntry::Stage::Fresh) {
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

std::int32_t LinuxSockets::WSAAsyncSelect(SocketHandle socket, WindowHandle window, std::uint32_t message,
                                          std::int32_t events) {
  SocketEntry* entry = Entry(socket);
  if (!entry) return kSocketError;
  int nonBlocking = 1;
  if (::ioctl(entry->descriptor.Number(), FIONBIO, &nonBlocking) != 0) return FailWithErrno();
  entry->selection.Select(window, message, events);
  if (notifier_.Watch(socket, *entry)) return 0;
  entry->selection.mask = 0;
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
        if (error == 0) PutAddressList(buffer, addresses);
        loop_.PostMessage(window, message, handle->Value(), SocketMessageWord(0, error));
      });
  if (*handle == kNoLookUp) Fail(kNoBufferSpace);
  return *handle;
}

std::int32_t LinuxSockets::WSACancelAsyncRequest(LookUpHandle lookUp) {
  return lookUps_.Cancel(lookUp) ? 0 : Fail(kInvalidArgument);
}

} // namespace quendra::platform::linux_
