#include "foundation/CSocketPlus.h"
#include "foundation/SocketErrors.h"

#include "runtime/Integers.h"

#include <array>

namespace quendra::foundation {

bool CSocketPlus::StillHolds(const Life& life, Slot slot, platform::SocketHandle socket) const {
  return !life.expired() && slot < records_.size() && records_[slot].SocketHandle == socket;
}

void CSocketPlus::PostSocket(platform::SocketHandle socket, std::int32_t event, std::int32_t error) {
  const auto found = slotsBySocket_.find(socket);
  if (found == slotsBySocket_.end()) return;
  const Slot slot = found->second;
  if (error != 0) return Fail(slot, error, u"CSocketPlus.PostSocket");
  switch (event) {
  case platform::kFdRead: return OnRead(slot);
  case platform::kFdWrite:
    if (At(slot).State == sckConnected && !At(slot).SendBuffer.IsEmpty()) SendBufferedData(slot);
    return;
  case platform::kFdAccept: return OnAccept(slot);
  case platform::kFdConnect: return OnConnect(slot);
  case platform::kFdClose: return OnClose(slot);
  default: return;
  }
}

void CSocketPlus::OnRead(Slot slot) {
  if (At(slot).Protocol == sckUDPProtocol) {
    if (At(slot).State == sckOpen) OnReadUDP(slot);
    return;
  }
  if (At(slot).State != sckConnected || RecvDataToBuffer(slot) <= 0) return;
  const Variant index = At(slot).Index;
  Events.DataArrival(index, ToInt32(static_cast<std::int64_t>(At(slot).RecvBuffer.Size())));
}

void CSocketPlus::OnReadUDP(Slot slot) {
  const Life life = life_;
  const platform::SocketHandle socket = At(slot).SocketHandle;
  const std::int32_t waiting = AmountWaiting(slot);
  if (waiting > 0) {
    const Variant index = At(slot).Index;
    Events.DataArrival(index, waiting);
  }
  if (!StillHolds(life, slot, socket)) return;
  // While a datagram stays unread the next one isn't announced, so one that the handler left is dropped.
  std::array<std::uint8_t, 1> byte{};
  module_.Library().recv(socket, byte, 0);
}

void CSocketPlus::OnConnect(Slot slot) {
  if (At(slot).State != sckConnecting) return;
  StoreLocalAddress(slot);
  StorePeerAddress(slot);
  At(slot).State = sckConnected;
  const Variant index = At(slot).Index;
  Events.Connect(index);
}

void CSocketPlus::OnClose(Slot slot) {
  if (At(slot).State != sckConnected) return;
  At(slot).State = sckClosing;
  const Variant index = At(slot).Index;
  Events.CloseSck(index);
}

void CSocketPlus::OnAccept(Slot slot) {
  if (At(slot).State != sckListening) return;
  const platform::SocketHandle accepted = module_.Library().accept(At(slot).SocketHandle);
  if (accepted == platform::kNoSocket)
    return Fail(slot, module_.Library().WSAGetLastError(), u"CSocketPlus.PostSocket");
  module_.RegisterAccept(accepted);
  modSocketPlus& module = module_;
  OfferConnection(slot, accepted);
  if (!module.IsAcceptRegistered(accepted)) return;
  module.Library().closesocket(accepted);
  module.UnregisterSocket(accepted);
  module.UnregisterAccept(accepted);
}

void CSocketPlus::OfferConnection(Slot slot, platform::SocketHandle accepted) {
  const Life life = life_;
  const platform::SocketHandle listener = At(slot).SocketHandle;
  const std::int32_t port = At(slot).RemotePort;
  const Text address = At(slot).RemoteHostIP;
  const Text host = At(slot).RemoteHost;
  platform::SocketAddress peer;
  module_.Library().getpeername(accepted, peer);
  At(slot).RemotePort = peer.port;
  At(slot).RemoteHostIP = peer.address.AsText();
  At(slot).RemoteHost.clear();
  const Variant index = At(slot).Index;
  Events.ConnectionRequest(index, accepted);
  if (!StillHolds(life, slot, listener) || At(slot).State != sckListening) return;
  At(slot).RemotePort = port;
  At(slot).RemoteHostIP = address;
  At(slot).RemoteHost = host;
}

void CSocketPlus::Accept(const Variant& index, platform::SocketHandle requestID) {
  const Slot slot = GetSocketIndex(index);
  if (At(slot).State != sckClosed) throw Misuse(kInvalidAtCurrentState, u"CSocketPlus.Accept");
  At(slot).SocketHandle = requestID;
  At(slot).Protocol = sckTCPProtocol;
  ProcessOptions(slot);
  if (module_.IsAcceptRegistered(requestID)) return TakePending(slot, requestID);
  if (module_.IsSocketRegistered(requestID)) {
    At(slot).SocketHandle = platform::kNoSocket;
    At(slot).RecvBufferSize = At(slot).SendBufferSize = 0;
    throw Misuse(kWrongProtocolOrState, u"CSocketPlus.Accept");
  }
  // No object knows this socket yet, so this one holds it until somebody takes it. It keeps the selection of
  // the listener, so data that comes early is gathered here.
  acceptClass_ = true;
  At(slot).State = sckConnected;
  StoreLocalAddress(slot);
  slotsBySocket_[requestID] = slot;
  module_.RegisterSocket(requestID, this, false);
}

void CSocketPlus::TakePending(Slot slot, platform::SocketHandle requestID) {
  const Life life = life_;
  const Variant pendingIndex = Text(u"Temporal_Socket");
  const auto held = module_.GetAcceptClass(requestID);
  CSocketPlus& pending = *held;
  StoreLocalAddress(slot);
  StorePeerAddress(slot);
  At(slot).State = sckConnected;
  if (pending.BytesReceived(pendingIndex) > 0) {
    Variant data;
    pending.GetData(pendingIndex, data, DataKind::ByteArray);
    At(slot).RecvBuffer.Append(*data.Find<ByteArray>());
  }
  const bool peerClosed = pending.State(pendingIndex) == sckClosing;
  slotsBySocket_[requestID] = slot;
  module_.ChangeSocketOwner(requestID, this);
  module_.UnregisterAccept(requestID);

  const Variant index = At(slot).Index;
  if (!At(slot).RecvBuffer.IsEmpty())
    Events.DataArrival(index, ToInt32(static_cast<std::int64_t>(At(slot).RecvBuffer.Size())));
  if (!peerClosed || !StillHolds(life, slot, requestID)) return;
  At(slot).State = sckClosing;
  Events.CloseSck(index);
}

} // namespace quendra::foundation
