#include "platform/windows/net/WindowsSockets.h"

#include "platform/windows/net/SystemAddress.h"

#include <utility>

namespace quendra::platform::windows {

static_assert(kFdRead == FD_READ && kFdWrite == FD_WRITE && kFdAccept == FD_ACCEPT &&
              kFdConnect == FD_CONNECT && kFdClose == FD_CLOSE);
static_assert(kSocketError == SOCKET_ERROR && kPeek == MSG_PEEK && kSocketLevel == SOL_SOCKET);

WindowsSockets::WindowsSockets(EventLoop& loop, const SocketLibrary& library)
    : loop_(loop), library_(library),
      relay_([this](UINT message, WPARAM wParam, LPARAM lParam) { OnRelayed(message, wParam, lParam); }),
      lookUps_(library, loop) {}

WindowsSockets::~WindowsSockets() {
  CloseAll();
  for (; started_ > 0; --started_) library_.WSACleanup();
}

std::int32_t WindowsSockets::WSAStartup(std::uint16_t version) {
  if (!library_.IsThere()) return kSubsystemUnavailable;
  WSADATA data{};
  const int reason = library_.WSAStartup(version, &data);
  if (reason == 0) ++started_;
  return reason;
}

std::int32_t WindowsSockets::WSACleanup() {
  if (started_ == 0) return Fail(kNotStarted);
  // Others of this process may have the library open, so it wouldn't close the sockets itself, nor stop
  // look-ups whose buffers may go now.
  if (--started_ == 0) {
    lookUps_.CancelAll();
    CloseAll();
  }
  return Answer(library_.WSACleanup());
}

void WindowsSockets::CloseAll() {
  for (const auto& [handle, entry] : table_.All()) library_.closesocket(entry.socket);
  table_.All().clear();
}

SocketEntry* WindowsSockets::Entry(SocketHandle socket) {
  SocketEntry* entry = started_ > 0 ? table_.Find(socket) : nullptr;
  if (!entry) Fail(started_ > 0 ? kNotASocket : kNotStarted);
  return entry;
}

std::int32_t WindowsSockets::Fail(std::int32_t error) {
  lastError_ = error;
  return kSocketError;
}

std::int32_t WindowsSockets::Answer(int result) {
  return result < 0 ? Fail(library_.WSAGetLastError()) : result;
}

SocketHandle WindowsSockets::socket(std::int32_t family, std::int32_t type, std::int32_t protocol) {
  if (started_ == 0) {
    Fail(kNotStarted);
    return kNoSocket;
  }
  const SOCKET made = library_.socket(family, type, protocol);
  if (made != INVALID_SOCKET) return table_.Add(made);
  Fail(library_.WSAGetLastError());
  return kNoSocket;
}

std::int32_t WindowsSockets::closesocket(SocketHandle socket) {
  const SocketEntry* entry = Entry(socket);
  if (!entry) return kSocketError;
  const SOCKET closed = entry->socket;
  table_.Remove(socket);
  return Answer(library_.closesocket(closed));
}

std::int32_t WindowsSockets::bind(SocketHandle socket, const SocketAddress& local) {
  const SocketEntry* entry = Entry(socket);
  if (!entry) return kSocketError;
  const sockaddr_in address = SystemAddress(local);
  return Answer(library_.bind(entry->socket, reinterpret_cast<const sockaddr*>(&address), sizeof address));
}

std::int32_t WindowsSockets::listen(SocketHandle socket, std::int32_t backlog) {
  const SocketEntry* entry = Entry(socket);
  return entry ? Answer(library_.listen(entry->socket, backlog)) : kSocketError;
}

SocketHandle WindowsSockets::accept(SocketHandle socket) {
  SocketEntry* listener = Entry(socket);
  if (!listener) return kNoSocket;
  listener->selection.enabled |= kFdAccept;
  const SOCKET made = library_.accept(listener->socket, nullptr, nullptr);
  if (made == INVALID_SOCKET) {
    Fail(library_.WSAGetLastError());
    return kNoSocket;
  }
  const SocketSelection& selection = listener->selection;
  const SocketHandle accepted = table_.Add(made);
  SocketEntry& entry = *table_.Find(accepted);
  entry.selection.Select(selection.window, selection.message, selection.mask);
  // What is told of it before this call comes under its listener's number and is told once more.
  if (selection.mask == 0 || Relay(entry)) return accepted;
  closesocket(accepted);
  return kNoSocket;
}

std::int32_t WindowsSockets::connect(SocketHandle socket, const SocketAddress& peer) {
  const SocketEntry* entry = Entry(socket);
  if (!entry) return kSocketError;
  // Some systems take address 0 for their own host.
  if (peer.address.IsAny() || peer.port == 0) return Fail(kAddressNotAvailable);
  const sockaddr_in address = SystemAddress(peer);
  return Answer(library_.connect(entry->socket, reinterpret_cast<const sockaddr*>(&address), sizeof address));
}

bool WindowsSockets::Relay(SocketEntry& entry) {
  const std::int32_t mask = entry.selection.mask;
  return Answer(library_.WSAAsyncSelect(entry.socket, relay_.Get(), mask == 0 ? 0 : entry.relayed, mask)) ==
         0;
}

std::int32_t WindowsSockets::WSAAsyncSelect(SocketHandle socket, WindowHandle window, std::uint32_t message,
                                            std::int32_t events) {
  SocketEntry* entry = Entry(socket);
  if (!entry) return kSocketError;
  const SocketSelection before = entry->selection;
  entry->selection.Select(window, message, events);
  if (Relay(*entry)) return 0;
  entry->selection.Select(before.window, before.message, before.mask);
  return kSocketError;
}

void WindowsSockets::OnRelayed(UINT message, WPARAM wParam, LPARAM lParam) {
  if (message == SocketTable::kLookUpMessage) return lookUps_.OnEnd(reinterpret_cast<HANDLE>(wParam), lParam);
  const auto [socket, entry] = table_.Relayed(message, wParam);
  if (!entry) return;
  const std::int32_t event = WSAGETSELECTEVENT(lParam);
  const std::int32_t error = WSAGETSELECTERROR(lParam);
  if (event == kFdClose)
    OnEnd(socket, *entry, error);
  else
    entry->selection.Announce(loop_, socket, static_cast<SocketEvent>(event), error);
}

void WindowsSockets::OnEnd(SocketHandle socket, SocketEntry& entry, std::int32_t error) {
  const std::int32_t next = NextByte(entry);
  if (next > 0) {
    entry.awaitedEnd = error;
    return;
  }
  entry.awaitedEnd.reset();
  // Where a read fails, too, it says better why: some systems tell a reset as a mere abort.
  const bool readFails = next < 0 && next != -kWouldBlock;
  const std::int32_t reason = error != 0 && readFails ? -next : error;
  entry.selection.Announce(loop_, socket, kFdClose, reason);
  entry.selection.enabled &= ~kFdClose;
  // A peer that sends no more may still read.
  if (error != 0) entry.selection.enabled &= ~kFdWrite;
}

std::int32_t WindowsSockets::NextByte(const SocketEntry& entry) const {
  char byte = 0;
  const int count = library_.recvfrom(entry.socket, &byte, 1, MSG_PEEK, nullptr, nullptr);
  return count < 0 ? -library_.WSAGetLastError() : count;
}

LookUpHandle WindowsSockets::WSAAsyncGetHostByName(WindowHandle window, std::uint32_t message,
                                                   const std::string& name, std::span<std::uint8_t> buffer) {
  if (started_ == 0) {
    Fail(kNotStarted);
    return kNoLookUp;
  }
  const LookUpHandle lookUp =
      lookUps_.Start(relay_.Get(), SocketTable::kLookUpMessage, name, {window, message, buffer});
  if (lookUp == kNoLookUp) Fail(library_.WSAGetLastError());
  return lookUp;
}

std::int32_t WindowsSockets::WSACancelAsyncRequest(LookUpHandle lookUp) {
  return lookUps_.Cancel(lookUp) ? 0 : Fail(kInvalidArgument);
}

bool WindowsSockets::WSAIsBlocking() { return library_.IsThere() && library_.WSAIsBlocking() != FALSE; }

std::int32_t WindowsSockets::WSACancelBlockingCall() {
  return WSAIsBlocking() ? Answer(library_.WSACancelBlockingCall()) : Fail(kInvalidArgument);
}

} // namespace quendra::platform::windows
