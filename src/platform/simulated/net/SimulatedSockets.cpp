#include "platform/simulated/net/SimulatedSockets.h"

namespace quendra::platform::simulated {

std::int32_t SimulatedSockets::WSAStartup(std::uint16_t) {
  if (Scripted("WSAStartup")) return WSAGetLastError();
  ++started_;
  return 0;
}

std::int32_t SimulatedSockets::WSACleanup() {
  core_.calls.push_back("WSACleanup");
  if (Scripted("WSACleanup")) return kSocketError;
  if (started_ == 0) return messages_.HasLoop() ? Refused(kNotStarted) : 0;
  if (--started_ > 0) return 0;
  table_.Clear();
  lookUps_.Clear();
  return 0;
}

SimulatedSockets::End SimulatedSockets::Find(SocketHandle socket) {
  End found = table_.Find(socket);
  if (!found) Refused(started_ > 0 ? kNotASocket : kNotStarted);
  return found;
}

SocketHandle SimulatedSockets::socket(std::int32_t, std::int32_t type, std::int32_t) {
  if (Scripted("socket")) return kNoSocket;
  if (started_ == 0) {
    Refused(kNotStarted);
    return kNoSocket;
  }
  const auto end = std::make_shared<SocketEnd>();
  if (type == kDatagramSocket) end->stage = SocketEnd::Stage::Datagram;
  return table_.Add(end);
}

std::int32_t SimulatedSockets::closesocket(SocketHandle socket) {
  core_.calls.push_back("closesocket " + std::to_string(socket.Value()));
  if (Scripted("closesocket")) return kSocketError;
  const End end = Find(socket);
  if (!end) return messages_.HasLoop() ? kSocketError : 0;
  table_.Remove(socket);
  streams_.Close(*end);
  return 0;
}

std::int32_t SimulatedSockets::bind(SocketHandle socket, const SocketAddress& local) {
  if (Scripted("bind")) return kSocketError;
  const End end = Find(socket);
  if (!end) return kSocketError;
  const std::int32_t error = table_.Bind(*end, local);
  return error == 0 ? 0 : Refused(error);
}

std::int32_t SimulatedSockets::listen(SocketHandle socket, std::int32_t backlog) {
  if (Scripted("listen")) return kSocketError;
  const End end = Find(socket);
  return end ? connections_.Listen(*end, backlog) : kSocketError;
}

SocketHandle SimulatedSockets::accept(SocketHandle socket) {
  const bool fails = Scripted("accept");
  const End listener = Find(socket);
  if (!listener) return kNoSocket;
  listener->selection.enabled |= kFdAccept;
  if (fails) return kNoSocket;
  const End end = connections_.Accept(*listener);
  if (!end) {
    Refused(kWouldBlock);
    return kNoSocket;
  }
  const SocketHandle accepted = table_.Add(end);
  messages_.Update(*listener);
  messages_.Update(*end);
  return accepted;
}

std::int32_t SimulatedSockets::connect(SocketHandle socket, const SocketAddress& peer) {
  if (Scripted("connect")) return kSocketError;
  const End end = Find(socket);
  return end ? connections_.Connect(end, peer) : kSocketError;
}

std::int32_t SimulatedSockets::getsockname(SocketHandle socket, SocketAddress& local) {
  if (Scripted("getsockname")) return kSocketError;
  const End end = Find(socket);
  if (!end) return kSocketError;
  local = end->local;
  return 0;
}

std::int32_t SimulatedSockets::getpeername(SocketHandle socket, SocketAddress& peer) {
  if (Scripted("getpeername")) return kSocketError;
  const End end = Find(socket);
  if (!end) return kSocketError;
  if (end->stage != SocketEnd::Stage::Connected) return Refused(kNotConnected);
  peer = end->remote;
  return 0;
}

std::int32_t SimulatedSockets::getsockopt(SocketHandle socket, std::int32_t, std::int32_t option,
                                          std::int32_t& value) {
  if (Scripted("getsockopt") || !Find(socket)) return kSocketError;
  switch (option) {
  case kSendBufferOption: value = SendBufferSize; return 0;
  case kReceiveBufferOption: value = ReceiveBufferSize; return 0;
  case kMaxMessageSizeOption: value = kLargestDatagram; return 0;
  default: return Refused(kBadProtocolOption);
  }
}

std::int32_t SimulatedSockets::setsockopt(SocketHandle socket, std::int32_t, std::int32_t, std::int32_t) {
  return Scripted("setsockopt") || !Find(socket) ? kSocketError : 0;
}

std::int32_t SimulatedSockets::ioctlsocket(SocketHandle socket, std::uint32_t command, std::uint32_t& value) {
  if (Scripted("ioctlsocket")) return kSocketError;
  const End end = Find(socket);
  if (!end) return kSocketError;
  if (command != kBytesWaiting) return Refused(kInvalidArgument);
  value = static_cast<std::uint32_t>(end->BytesWaiting());
  return 0;
}

std::int32_t SimulatedSockets::WSAAsyncSelect(SocketHandle socket, WindowHandle window, std::uint32_t message,
                                              std::int32_t events) {
  core_.calls.push_back("WSAAsyncSelect " + std::to_string(socket.Value()) + " " +
                        std::to_string(window.Value()) + " " + std::to_string(message) + " " +
                        std::to_string(events));
  if (Scripted("WSAAsyncSelect")) return kSocketError;
  const End end = Find(socket);
  if (!end) return messages_.HasLoop() ? kSocketError : 0;
  end->selection.Select(window, message, events);
  messages_.Update(*end);
  return 0;
}

LookUpHandle SimulatedSockets::WSAAsyncGetHostByName(WindowHandle window, std::uint32_t message,
                                                     const std::string& name,
                                                     std::span<std::uint8_t> buffer) {
  if (Scripted("WSAAsyncGetHostByName")) return kNoLookUp;
  if (started_ > 0) return lookUps_.Start(window, message, name, buffer);
  Refused(kNotStarted);
  return kNoLookUp;
}

std::int32_t SimulatedSockets::WSACancelAsyncRequest(LookUpHandle lookUp) {
  if (Scripted("WSACancelAsyncRequest")) return kSocketError;
  return lookUps_.Cancel(lookUp) ? 0 : Refused(kInvalidArgument);
}

bool SimulatedSockets::WSAIsBlocking() {
  core_.calls.push_back("WSAIsBlocking");
  return Blocking;
}

std::int32_t SimulatedSockets::WSACancelBlockingCall() {
  core_.calls.push_back("WSACancelBlockingCall");
  return 0;
}

} // namespace quendra::platform::simulated
