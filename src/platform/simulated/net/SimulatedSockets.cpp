#include "platform/simulated/net/SimulatedSockets.h"

#include "platform/simulated/net/SimulatedHostNames.h"

#include <algorithm>

namespace quendra::platform::simulated {

namespace {

std::string TextOf(std::span<const std::uint8_t> bytes) { return std::string(bytes.begin(), bytes.end()); }

} // namespace

// The script.

SimulatedServer& SimulatedSockets::Listen(const std::string& host, std::uint16_t port) {
  return servers_[{AddressOf(host), port}];
}

std::shared_ptr<SimulatedPeer> SimulatedSockets::Dial(std::uint16_t port, const std::string& from,
                                                      std::uint16_t fromPort) {
  const End listener = Listener(port);
  if (!listener || listener->backlog.size() >= listener->backlogSize) return nullptr;
  const auto end = std::make_shared<SocketEnd>();
  end->stage = SocketEnd::Stage::Connected;
  end->remote = At(from, fromPort);
  end->local = {OwnAddressTowards(end->remote.address), port};
  end->peer = std::make_shared<SimulatedPeer>(*this, end);
  listener->backlog.push_back(end);
  Update(*listener);
  return end->peer;
}

bool SimulatedSockets::Step() {
  bool any = false;
  for (const auto& scripted : scripted_)
    if (const auto peer = scripted.lock()) any |= peer->Step();
  return any;
}

bool SimulatedSockets::SendDatagram(const std::string& from, std::uint16_t fromPort, std::uint16_t toPort,
                                    std::string bytes) {
  for (const auto& [handle, end] : sockets_) {
    if (end->stage != SocketEnd::Stage::Datagram || end->local.port != toPort) continue;
    end->datagrams.push_back({std::move(bytes), At(from, fromPort)});
    Update(*end);
    return true;
  }
  return false;
}

void SimulatedSockets::Fail(const std::string& operation, std::int32_t error, int times) {
  auto& failures = failures_[operation];
  failures.insert(failures.end(), static_cast<std::size_t>(times), error);
}

int SimulatedSockets::Count(const std::string& operation) const {
  const auto found = counts_.find(operation);
  return found == counts_.end() ? 0 : found->second;
}

bool SimulatedSockets::Scripted(const std::string& operation) {
  ++counts_[operation];
  auto& failures = failures_[operation];
  if (failures.empty()) return false;
  lastError_ = failures.front();
  failures.pop_front();
  return true;
}

std::int32_t SimulatedSockets::Refused(std::int32_t error) {
  lastError_ = error;
  return kSocketError;
}

void SimulatedSockets::Later(std::function<void()> work) {
  if (!loop_) return;
  loop_->Post([life = std::weak_ptr(life_), work = std::move(work)] {
    if (!life.expired()) work();
  });
}

// The library.

std::int32_t SimulatedSockets::WSAStartup(std::uint16_t) {
  if (Scripted("WSAStartup")) return lastError_;
  ++started_;
  return 0;
}

std::int32_t SimulatedSockets::WSACleanup() {
  core_.calls.push_back("WSACleanup");
  if (Scripted("WSACleanup")) return kSocketError;
  if (started_ == 0) return loop_ ? Refused(kNotStarted) : 0;
  if (--started_ > 0) return 0;
  sockets_.clear();
  lookUps_.clear();
  return 0;
}

SimulatedSockets::End SimulatedSockets::Find(SocketHandle socket) {
  const auto found = sockets_.find(socket);
  if (found != sockets_.end()) return found->second;
  lastError_ = started_ > 0 ? kNotASocket : kNotStarted;
  return nullptr;
}

SocketHandle SimulatedSockets::Give(const End& end) {
  lastSocket_ += 4;
  end->handle = SocketHandle(lastSocket_);
  sockets_[end->handle] = end;
  return end->handle;
}

SocketHandle SimulatedSockets::socket(std::int32_t, std::int32_t type, std::int32_t) {
  if (Scripted("socket")) return kNoSocket;
  if (started_ == 0) {
    Refused(kNotStarted);
    return kNoSocket;
  }
  const auto end = std::make_shared<SocketEnd>();
  if (type == kDatagramSocket) end->stage = SocketEnd::Stage::Datagram;
  return Give(end);
}

std::int32_t SimulatedSockets::closesocket(SocketHandle socket) {
  core_.calls.push_back("closesocket " + std::to_string(socket.Value()));
  if (Scripted("closesocket")) return kSocketError;
  const End end = Find(socket);
  if (!end) return loop_ ? kSocketError : 0;
  sockets_.erase(socket);
  if (end->peer) end->peer->Ended = true;
  if (const End partner = end->partner.lock()) EndOf(*partner, end->arrived.empty() ? 0 : kConnectionReset);
  for (const End& waiting : end->backlog) {
    if (waiting->peer) waiting->peer->Ended = true;
    if (const End partner = waiting->partner.lock()) EndOf(*partner, kConnectionReset);
  }
  return 0;
}

std::uint16_t SimulatedSockets::FreePort() {
  const auto isTaken = [&](std::uint16_t port) {
    return std::any_of(sockets_.begin(), sockets_.end(),
                       [&](const auto& entry) { return entry.second->local.port == port; });
  };
  do lastPort_ = lastPort_ < 1025 || lastPort_ >= 5000 ? 1025 : static_cast<std::uint16_t>(lastPort_ + 1);
  while (isTaken(lastPort_));
  return lastPort_;
}

bool SimulatedSockets::IsOwn(Ipv4Address address) const {
  if (address.IsAny() || address.IsLoopback()) return true;
  return std::any_of(hostNames_.Addresses.begin(), hostNames_.Addresses.end(),
                     [&](const std::string& own) { return AddressOf(own) == address; });
}

Ipv4Address SimulatedSockets::OwnAddressTowards(Ipv4Address address) const {
  if (IsOwn(address)) return address;
  return hostNames_.Addresses.empty() ? AddressOf("10.0.0.7") : AddressOf(hostNames_.Addresses.back());
}

std::int32_t SimulatedSockets::bind(SocketHandle socket, const SocketAddress& local) {
  if (Scripted("bind")) return kSocketError;
  const End end = Find(socket);
  if (!end) return kSocketError;
  if (end->local.port != 0) return Refused(kInvalidArgument);
  if (!IsOwn(local.address)) return Refused(kAddressNotAvailable);
  const bool datagrams = end->stage == SocketEnd::Stage::Datagram;
  for (const auto& [handle, other] : sockets_)
    if (local.port != 0 && other->local.port == local.port &&
        (other->stage == SocketEnd::Stage::Datagram) == datagrams)
      return Refused(kAddressInUse);
  end->local = {local.address, local.port != 0 ? local.port : FreePort()};
  return 0;
}

std::int32_t SimulatedSockets::listen(SocketHandle socket, std::int32_t backlog) {
  if (Scripted("listen")) return kSocketError;
  const End end = Find(socket);
  if (!end) return kSocketError;
  if (end->stage == SocketEnd::Stage::Datagram) return Refused(kOperationNotSupported);
  end->stage = SocketEnd::Stage::Listening;
  end->backlogSize = static_cast<std::size_t>(std::max(backlog, 1));
  Update(*end);
  return 0;
}

SocketHandle SimulatedSockets::accept(SocketHandle socket) {
  const bool fails = Scripted("accept");
  const End listener = Find(socket);
  if (!listener) return kNoSocket;
  listener->enabled |= kFdAccept;
  if (fails || listener->backlog.empty()) {
    if (!fails) lastError_ = kWouldBlock;
    return kNoSocket;
  }
  const End end = listener->backlog.front();
  listener->backlog.pop_front();
  end->window = listener->window;
  end->message = listener->message;
  end->mask = listener->mask;
  const SocketHandle accepted = Give(end);
  Update(*listener);
  Update(*end);
  return accepted;
}

SimulatedSockets::End SimulatedSockets::Listener(std::uint16_t port) {
  for (const auto& [handle, end] : sockets_)
    if (end->stage == SocketEnd::Stage::Listening && end->local.port == port) return end;
  return nullptr;
}

std::int32_t SimulatedSockets::connect(SocketHandle socket, const SocketAddress& peer) {
  if (Scripted("connect")) return kSocketError;
  const End end = Find(socket);
  if (!end) return kSocketError;
  if (end->stage == SocketEnd::Stage::Connecting) return Refused(kAlreadyInProgress);
  if (end->stage == SocketEnd::Stage::Connected) return Refused(kAlreadyConnected);
  if (peer.address.IsAny() || peer.port == 0) return Refused(kAddressNotAvailable);
  end->stage = SocketEnd::Stage::Connecting;
  end->remote = peer;
  if (end->local.port == 0) end->local.port = FreePort();
  if (end->local.address.IsAny()) end->local.address = OwnAddressTowards(peer.address);
  Later([this, end] { Answered(end); });
  return Refused(kWouldBlock);
}

void SimulatedSockets::Answered(const End& end) {
  if (!sockets_.contains(end->handle) || end->stage != SocketEnd::Stage::Connecting) return;
  const auto refuse = [&](std::int32_t error) {
    end->stage = SocketEnd::Stage::Fresh;
    Announce(*end, kFdConnect, error);
  };
  if (const End listener = IsOwn(end->remote.address) ? Listener(end->remote.port) : nullptr)
    return listener->backlog.size() < listener->backlogSize ? Meet(end, listener)
                                                            : refuse(kConnectionRefused);
  const auto found = servers_.find({end->remote.address, end->remote.port});
  if (found == servers_.end())
    return refuse(IsOwn(end->remote.address) ? kConnectionRefused : kConnectionTimedOut);
  SimulatedServer& server = found->second;
  if (server.manner_ == SimulatedServer::Manner::Silent) return;
  if (server.manner_ == SimulatedServer::Manner::Refuses) return refuse(server.refusal_);
  const auto peer = std::make_shared<ScriptedPeer>(*this, end, server);
  end->peer = peer;
  end->stage = SocketEnd::Stage::Connected;
  server.Connections.push_back(peer);
  scripted_.push_back(peer);
  Announce(*end, kFdConnect);
  Update(*end);
  peer->Begin();
}

void SimulatedSockets::Meet(const End& end, const End& listener) {
  const auto other = std::make_shared<SocketEnd>();
  other->stage = end->stage = SocketEnd::Stage::Connected;
  other->local = end->remote;
  other->remote = end->local;
  other->partner = end;
  end->partner = other;
  listener->backlog.push_back(other);
  Announce(*end, kFdConnect);
  Update(*end);
  Update(*listener);
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
  const bool datagrams = end->stage == SocketEnd::Stage::Datagram;
  const std::size_t amount = !datagrams               ? end->arrived.size()
                             : end->datagrams.empty() ? 0
                                                      : end->datagrams.front().bytes.size();
  value = static_cast<std::uint32_t>(amount);
  return 0;
}

// Data.

std::int32_t SimulatedSockets::send(SocketHandle socket, std::span<const std::uint8_t> bytes, std::int32_t) {
  if (Scripted("send")) {
    // After a send that would block comes the event that the socket can send again.
    const auto found = sockets_.find(socket);
    if (lastError_ == kWouldBlock && found != sockets_.end()) {
      found->second->room = 0;
      Refill(found->second);
    }
    return kSocketError;
  }
  const End end = Find(socket);
  if (!end) return kSocketError;
  if (end->stage != SocketEnd::Stage::Connected) return Refused(kNotConnected);
  if (end->ended && end->endError != 0) return Refused(end->endError);
  if (end->room == 0) {
    Refill(end);
    return Refused(kWouldBlock);
  }
  const std::size_t taken = std::min(bytes.size(), end->room);
  if (end->room != SocketEnd::kNoLimit) end->room -= taken;
  if (const End partner = end->partner.lock()) Arrive(*partner, TextOf(bytes.first(taken)));
  if (const auto peer = end->peer) {
    peer->Received += TextOf(bytes.first(taken));
    peer->OnReceived();
  }
  return static_cast<std::int32_t>(taken);
}

void SimulatedSockets::Refill(const End& end) {
  end->enabled |= kFdWrite;
  Later([this, end] {
    end->room = end->fullRoom;
    if (sockets_.contains(end->handle)) Update(*end);
  });
}

std::int32_t SimulatedSockets::sendto(SocketHandle socket, std::span<const std::uint8_t> bytes, std::int32_t,
                                      const SocketAddress& peer) {
  if (Scripted("sendto")) return kSocketError;
  const End end = Find(socket);
  if (!end) return kSocketError;
  if (bytes.size() > std::size_t{kLargestDatagram}) return Refused(kMessageTooLong);
  if (end->local.port == 0) end->local.port = FreePort();
  Datagrams.push_back({TextOf(bytes), peer});
  if (std::find(echoes_.begin(), echoes_.end(), peer) != echoes_.end()) {
    end->datagrams.push_back({TextOf(bytes), peer});
    Update(*end);
  }
  if (!IsOwn(peer.address)) return static_cast<std::int32_t>(bytes.size());
  for (const auto& [handle, other] : sockets_) {
    if (other->stage != SocketEnd::Stage::Datagram || other->local.port != peer.port) continue;
    other->datagrams.push_back({TextOf(bytes), {OwnAddressTowards(peer.address), end->local.port}});
    Update(*other);
  }
  return static_cast<std::int32_t>(bytes.size());
}

std::int32_t SimulatedSockets::ScriptedRead(SocketHandle socket, std::span<std::uint8_t> buffer) {
  auto& waiting = waiting_[socket];
  if (waiting.empty()) return 0;
  if (!waiting.front()) {
    waiting.pop_front();
    return kSocketError;
  }
  auto& bytes = *waiting.front();
  const std::size_t length = std::min(bytes.size(), buffer.size());
  std::copy_n(bytes.begin(), length, buffer.begin());
  bytes.erase(bytes.begin(), bytes.begin() + static_cast<std::ptrdiff_t>(length));
  if (bytes.empty()) waiting.pop_front();
  return static_cast<std::int32_t>(length);
}

std::int32_t SimulatedSockets::recv(SocketHandle socket, std::span<std::uint8_t> buffer, std::int32_t flags) {
  core_.calls.push_back("recv " + std::to_string(socket.Value()) + " " + std::to_string(buffer.size()));
  if (waiting_.contains(socket) || (!loop_ && !sockets_.contains(socket)))
    return ScriptedRead(socket, buffer);
  if (Scripted("recv")) return kSocketError;
  SocketAddress from;
  return recvfrom(socket, buffer, flags, from);
}

std::int32_t SimulatedSockets::recvfrom(SocketHandle socket, std::span<std::uint8_t> buffer,
                                        std::int32_t flags, SocketAddress& from) {
  if (Scripted("recvfrom")) return kSocketError;
  const End end = Find(socket);
  if (!end) return kSocketError;
  end->enabled |= kFdRead;
  const bool peeks = (flags & kPeek) != 0;
  std::string bytes;
  if (end->stage == SocketEnd::Stage::Datagram) {
    if (end->datagrams.empty()) return Refused(kWouldBlock);
    bytes = end->datagrams.front().bytes;
    from = end->datagrams.front().from;
    if (!peeks) end->datagrams.pop_front();
  } else {
    if (end->arrived.empty() && !end->ended) return Refused(kWouldBlock);
    if (end->arrived.empty() && end->endError != 0) return Refused(end->endError);
    bytes = end->arrived.substr(0, buffer.size());
    if (!peeks) end->arrived.erase(0, bytes.size());
  }
  std::copy_n(bytes.begin(), std::min(bytes.size(), buffer.size()), buffer.begin());
  Update(*end);
  if (bytes.size() > buffer.size()) return Refused(kMessageTooLong);
  return static_cast<std::int32_t>(bytes.size());
}

void SimulatedSockets::Arrive(SocketEnd& end, const std::string& bytes) {
  if (end.ended) return;
  end.arrived += bytes;
  Update(end);
}

void SimulatedSockets::EndOf(SocketEnd& end, std::int32_t error) {
  if (end.ended) return;
  end.ended = true;
  end.endError = error;
  Update(end);
}

// Notification.

void SimulatedSockets::Announce(SocketEnd& end, SocketEvent event, std::int32_t error) {
  if (end.handle == kNoSocket || (end.mask & end.enabled & event) == 0) return;
  end.enabled &= ~event;
  if (loop_) loop_->PostMessage(end.window, end.message, end.handle.Value(), SocketMessageWord(event, error));
}

void SimulatedSockets::Update(SocketEnd& end) {
  using Stage = SocketEnd::Stage;
  if (end.stage == Stage::Listening && !end.backlog.empty()) Announce(end, kFdAccept);
  if (end.stage == Stage::Datagram && !end.datagrams.empty()) Announce(end, kFdRead);
  if (end.stage == Stage::Datagram) Announce(end, kFdWrite);
  if (end.stage != Stage::Connected) return;
  if (end.room > 0) Announce(end, kFdWrite);
  if (!end.arrived.empty()) return Announce(end, kFdRead);
  // The end is announced after the last data was read.
  if (end.ended && (end.enabled & kFdRead) != 0) Announce(end, kFdClose, end.endError);
}

std::int32_t SimulatedSockets::WSAAsyncSelect(SocketHandle socket, WindowHandle window, std::uint32_t message,
                                              std::int32_t events) {
  core_.calls.push_back("WSAAsyncSelect " + std::to_string(socket.Value()) + " " +
                        std::to_string(window.Value()) + " " + std::to_string(message) + " " +
                        std::to_string(events));
  if (Scripted("WSAAsyncSelect")) return kSocketError;
  const End end = Find(socket);
  if (!end) return loop_ ? kSocketError : 0;
  end->window = window;
  end->message = message;
  end->mask = events;
  Update(*end);
  return 0;
}

// Names.

LookUpHandle SimulatedSockets::WSAAsyncGetHostByName(WindowHandle window, std::uint32_t message,
                                                     const std::string& name,
                                                     std::span<std::uint8_t> buffer) {
  if (Scripted("WSAAsyncGetHostByName")) return kNoLookUp;
  if (started_ == 0) {
    lastError_ = kNotStarted;
    return kNoLookUp;
  }
  const LookUpHandle lookUp(++lastLookUp_);
  lookUps_[lookUp] = {window, message, CutText(name), buffer};
  if (std::find(silentNames_.begin(), silentNames_.end(), CutText(name)) == silentNames_.end())
    Later([this, lookUp] { Resolved(lookUp); });
  return lookUp;
}

void SimulatedSockets::Resolved(LookUpHandle lookUp) {
  const auto found = lookUps_.find(lookUp);
  if (found == lookUps_.end()) return;
  const LookUp asked = found->second;
  lookUps_.erase(found);
  std::int32_t error = 0;
  const auto addresses = hostNames_.gethostbyname(asked.name);
  if (const auto failing = failingNames_.find(asked.name); failing != failingNames_.end())
    error = failing->second;
  else if (!addresses)
    error = hostNames_.LastError();
  if (error == 0) {
    const std::size_t count = std::min(addresses->size(), asked.buffer.size() / 4 - 1);
    PutLittle32(asked.buffer, 0, static_cast<std::uint32_t>(count));
    for (std::size_t i = 0; i < count; ++i) PutLittle32(asked.buffer, 4 + 4 * i, (*addresses)[i].InMemory());
  }
  if (loop_) loop_->PostMessage(asked.window, asked.message, lookUp.Value(), SocketMessageWord(0, error));
}

std::int32_t SimulatedSockets::WSACancelAsyncRequest(LookUpHandle lookUp) {
  if (Scripted("WSACancelAsyncRequest")) return kSocketError;
  return lookUps_.erase(lookUp) > 0 ? 0 : Refused(kInvalidArgument);
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
