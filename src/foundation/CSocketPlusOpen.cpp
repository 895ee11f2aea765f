#include "foundation/CSocketPlus.h"
#include "foundation/LibraryName.h"
#include "foundation/SocketErrors.h"

#include "platform/net/AddressList.h"
#include "platform/net/IpProtocols.h"

#include <algorithm>
#include <new>

namespace quendra::foundation {

namespace {

/// In place of an address: the look-up is under way. An address of this very value is taken for it too.
constexpr auto kLookUpRunning = platform::Ipv4Address::FromMemory(1);
constexpr std::size_t kResolveBufferSize = 1024;
constexpr std::int32_t kListenBacklog = 5;

std::int32_t PortArgument(const Variant& port, std::int32_t lowest, const char16_t* source) {
  const auto number = port.NumberIfAny();
  if (!number) throw Misuse(kUnsupportedType, source);
  if (!(*number >= lowest && *number <= 65535)) throw Misuse(kInvalidArgumentFault, source);
  return port.AsInt32();
}

} // namespace

void CSocketPlus::Connect(const Variant& index, const Variant& remoteHost, const Variant& remotePort) {
  constexpr auto kSource = u"CSocketPlus.Connect";
  const Slot slot = GetSocketIndex(index);
  if (At(slot).State != sckClosed) throw Misuse(kInvalidAtCurrentState, kSource);
  const bool isNull = remoteHost.Is<Null>();
  if (!remoteHost.IsMissing()) At(slot).RemoteHost = isNull ? Text{} : remoteHost.AsText();
  if (!remotePort.IsMissing()) At(slot).RemotePort = PortArgument(remotePort, 1, kSource);
  if (!SocketExists(slot)) return;
  if (!BindInternal(slot)) return;
  if (At(slot).Protocol == sckUDPProtocol) {
    At(slot).State = sckOpen;
    return;
  }
  const platform::Ipv4Address address = ResolveIfHostname(slot, At(slot).RemoteHost);
  if (address != kLookUpRunning) ConnectToIP(slot, address, 0);
}

void CSocketPlus::Bind(const Variant& index, const Variant& localPort, const Variant& localIP) {
  const Slot slot = GetSocketIndex(index);
  if (At(slot).State != sckClosed) throw Misuse(kInvalidAtCurrentState, u"CSocketPlus.Bind");
  if (BindInternal(slot, localPort, localIP)) At(slot).State = sckOpen;
}

void CSocketPlus::Listen(const Variant& index) {
  constexpr auto kSource = u"CSocketPlus.Listen";
  const Slot slot = GetSocketIndex(index);
  if (At(slot).State != sckClosed && At(slot).State != sckOpen) throw Misuse(kInvalidAtCurrentState, kSource);
  if (!SocketExists(slot)) return;
  if (!BindInternal(slot)) return;
  if (module_.Library().listen(At(slot).SocketHandle, kListenBacklog) == platform::kSocketError)
    throw SystemError(module_.Library().WSAGetLastError(), kSource);
  At(slot).State = sckListening;
}

bool CSocketPlus::SocketExists(Slot slot) {
  if (At(slot).SocketHandle != platform::kNoSocket) return true;
  const bool tcp = At(slot).Protocol == sckTCPProtocol;
  const platform::SocketHandle socket = module_.Library().socket(
      platform::kInternetFamily, tcp ? platform::kStreamSocket : platform::kDatagramSocket,
      tcp ? platform::kTcp : platform::kUdp);
  if (socket == platform::kNoSocket) {
    Fail(slot, module_.Library().WSAGetLastError(), u"CSocketPlus.SocketExists");
    return false;
  }
  slotsBySocket_[socket] = slot;
  At(slot).SocketHandle = socket;
  ProcessOptions(slot);
  return module_.RegisterSocket(socket, this, true);
}

void CSocketPlus::ProcessOptions(Slot slot) {
  platform::Sockets& library = module_.Library();
  SocketRecord& record = At(slot);
  const auto read = [&](std::int32_t option, std::int32_t& value) {
    if (library.getsockopt(record.SocketHandle, platform::kSocketLevel, option, value) ==
        platform::kSocketError)
      throw SystemError(library.WSAGetLastError(), u"CSocketPlus.ProcessOptions");
  };
  if (record.Protocol == sckUDPProtocol) {
    library.setsockopt(record.SocketHandle, platform::kSocketLevel, platform::kBroadcastOption, 1);
    read(platform::kMaxMessageSizeOption, record.RecvBufferSize);
    record.SendBufferSize = record.RecvBufferSize;
  } else {
    read(platform::kReceiveBufferOption, record.RecvBufferSize);
    read(platform::kSendBufferOption, record.SendBufferSize);
  }
}

bool CSocketPlus::BindInternal(Slot slot, const Variant& port, const Variant& address) {
  constexpr auto kSource = u"CSocketPlus.BindInternal";
  if (At(slot).State == sckOpen) return true;
  const std::int32_t wanted = port.IsMissing() ? At(slot).LocalPort : PortArgument(port, 0, kSource);
  const Text host = address.IsMissing() ? Text{} : address.AsText();
  platform::SocketAddress local;
  local.port = static_cast<std::uint16_t>(wanted);
  if (!host.empty()) {
    std::int32_t error = 0;
    local.address = ResolveBlocking(host, error);
    if (error != 0) throw Fault(kInvalidArgumentFault, u"Invalid argument", kSource);
  }
  if (!SocketExists(slot)) return false;
  if (module_.Library().bind(At(slot).SocketHandle, local) == platform::kSocketError)
    throw SystemError(module_.Library().WSAGetLastError(), kSource);
  if (wanted != 0) {
    At(slot).LocalPort = wanted;
  } else {
    platform::SocketAddress bound;
    module_.Library().getsockname(At(slot).SocketHandle, bound);
    At(slot).LocalPortBind = bound.port;
  }
  return true;
}

platform::Ipv4Address CSocketPlus::ResolveBlocking(const Text& host, std::int32_t& error) {
  error = 0;
  const std::string name = LibraryName(host);
  const platform::Ipv4Address address = platform::Sockets::inet_addr(name);
  if (address != platform::kNoAddress) return address;
  const auto addresses = module_.Names().gethostbyname(name);
  if (addresses) return addresses->front();
  error = module_.Names().LastError();
  return platform::kNoAddress;
}

platform::Ipv4Address CSocketPlus::ResolveIfHostname(Slot slot, const Text& host) {
  constexpr auto kSource = u"CSocketPlus.ResolveIfHostname";
  const platform::Ipv4Address address = platform::Sockets::inet_addr(LibraryName(host));
  if (address != platform::kNoAddress) return address;
  At(slot).State = sckResolvingHost;
  try {
    At(slot).LookUpBuffer = std::make_unique<ResolveBuffer>(kResolveBufferSize);
  } catch (const std::bad_alloc&) {
    At(slot).State = sckError;
    throw Fault(Fault::kOutOfMemory, u"Out of memory", kSource);
  }
  const platform::LookUpHandle handle = module_.StartResolve(host, *At(slot).LookUpBuffer, this);
  if (handle != platform::kNoLookUp) {
    At(slot).ResolveRequests.push_back(handle);
    slotsByResolve_[handle] = slot;
  } else {
    At(slot).LookUpBuffer.reset();
    Fail(slot, module_.Library().WSAGetLastError(), kSource);
  }
  return kLookUpRunning;
}

void CSocketPlus::PostResolution(platform::LookUpHandle handle, std::int32_t error) {
  const auto found = slotsByResolve_.find(handle);
  if (found == slotsByResolve_.end()) return;
  const Slot slot = found->second;
  slotsByResolve_.erase(found);
  std::erase(At(slot).ResolveRequests, handle);
  module_.UnregisterResolve(handle);
  if (At(slot).State != sckResolvingHost) return;
  const auto buffer = std::exchange(At(slot).LookUpBuffer, nullptr);
  const auto address = buffer ? platform::FirstOfAddressList(*buffer) : std::nullopt;
  if (error == 0 && !address) error = platform::kHostNotFound;
  if (error != 0) return ConnectToIP(slot, kLookUpRunning, error);
  At(slot).State = sckHostResolved;
  ConnectToIP(slot, *address, 0);
}

void CSocketPlus::ConnectToIP(Slot slot, platform::Ipv4Address address, std::int32_t error) {
  constexpr auto kSource = u"CSocketPlus.ConnectToIP";
  if (error != 0) return Fail(slot, error, kSource);
  At(slot).State = sckConnecting;
  const platform::SocketAddress peer{address, static_cast<std::uint16_t>(At(slot).RemotePort)};
  if (module_.Library().connect(At(slot).SocketHandle, peer) != platform::kSocketError) return;
  const std::int32_t reason = module_.Library().WSAGetLastError();
  if (reason == platform::kWouldBlock) return;
  if (reason == platform::kAddressNotAvailable) throw SystemError(reason, kSource);
  Fail(slot, reason, kSource);
}

void CSocketPlus::StoreLocalAddress(Slot slot) {
  platform::SocketAddress local;
  module_.Library().getsockname(At(slot).SocketHandle, local);
  At(slot).LocalPortBind = local.port;
  At(slot).LocalIP = local.address.AsText();
}

void CSocketPlus::StorePeerAddress(Slot slot) {
  platform::SocketAddress peer;
  module_.Library().getpeername(At(slot).SocketHandle, peer);
  At(slot).RemotePort = peer.port;
  At(slot).RemoteHostIP = peer.address.AsText();
  At(slot).RemoteHost.clear();
}

} // namespace quendra::foundation
