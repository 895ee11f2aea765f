#include "foundation/CSocketPlus.h"
#include "foundation/DataBytes.h"
#include "foundation/SocketErrors.h"

#include "runtime/Integers.h"

#include <algorithm>

namespace quendra::foundation {

void CSocketPlus::SendData(const Variant& index, const Variant& data) {
  constexpr auto kSource = u"CSocketPlus.SendData";
  const Slot slot = GetSocketIndex(index);
  const bool udp = At(slot).Protocol == sckUDPProtocol;
  if (udp) {
    if (!SocketExists(slot) || !BindInternal(slot)) return;
    At(slot).State = sckOpen;
  } else if (At(slot).State != sckConnected) {
    throw Misuse(kWrongProtocolOrState, kSource);
  }
  const auto bytes = BytesOf(data);
  if (!bytes) throw Misuse(kUnsupportedType, kSource);
  if (bytes->empty()) return;
  const bool wasEmpty = At(slot).SendBuffer.IsEmpty();
  At(slot).SendBuffer.Append(*bytes);
  if (!wasEmpty) return;
  udp ? SendBufferedDataUDP(slot) : SendBufferedData(slot);
}

void CSocketPlus::SendBufferedData(Slot slot) {
  const Life life = life_;
  const platform::SocketHandle socket = At(slot).SocketHandle;
  const Variant index = At(slot).Index;
  std::int64_t total = 0;
  while (StillHolds(life, slot, socket) && !At(slot).SendBuffer.IsEmpty()) {
    ByteQueue& buffer = At(slot).SendBuffer;
    const std::size_t piece =
        std::min(buffer.Size(), static_cast<std::size_t>(std::max(At(slot).SendBufferSize, 1)));
    const std::int32_t sent = module_.Library().send(socket, buffer.Front(piece), 0);
    if (sent == platform::kSocketError) {
      const std::int32_t reason = module_.Library().WSAGetLastError();
      if (reason != platform::kWouldBlock) return Fail(slot, reason, u"CSocketPlus.SendBufferedData");
      if (total >= 1)
        Events.SendProgress(index, ToInt32(total), ToInt32(static_cast<std::int64_t>(buffer.Size())));
      return;
    }
    total += sent;
    buffer.DropFirst(static_cast<std::size_t>(sent));
    if (!buffer.IsEmpty()) continue;
    Events.SendProgress(index, ToInt32(total), 0);
    if (!life.expired()) Events.SendComplete(index);
  }
}

void CSocketPlus::SendBufferedDataUDP(Slot slot) {
  constexpr auto kSource = u"CSocketPlus.SendBufferedDataUDP";
  std::int32_t error = 0;
  const platform::Ipv4Address address = ResolveBlocking(At(slot).RemoteHost, error);
  const ByteArray datagram = At(slot).SendBuffer.Take(At(slot).SendBuffer.Size());
  if (error == platform::kFamilyNotSupported) throw SystemError(error, kSource);
  if (error != 0) throw Fault(kInvalidArgumentFault, u"Invalid argument", kSource);
  const platform::SocketAddress peer{address, static_cast<std::uint16_t>(At(slot).RemotePort)};
  if (module_.Library().sendto(At(slot).SocketHandle, datagram, 0, peer) == platform::kSocketError)
    Fail(slot, module_.Library().WSAGetLastError(), kSource);
}

std::int32_t CSocketPlus::RecvDataToBuffer(Slot slot) {
  ByteQueue& buffer = At(slot).RecvBuffer;
  const auto room = buffer.Extend(static_cast<std::size_t>(std::max(At(slot).RecvBufferSize, 0)));
  const std::int32_t read = module_.Library().recv(At(slot).SocketHandle, room, 0);
  buffer.DropLast(room.size() - static_cast<std::size_t>(std::max(read, 0)));
  if (read != platform::kSocketError) return read;
  At(slot).State = sckError;
  throw SystemError(module_.Library().WSAGetLastError(), u"CSocketPlus.RecvDataToBuffer");
}

std::int32_t CSocketPlus::AmountWaiting(Slot slot) {
  SocketRecord& record = At(slot);
  if (record.Protocol == sckTCPProtocol) return ToInt32(static_cast<std::int64_t>(record.RecvBuffer.Size()));
  std::uint32_t amount = 0;
  if (module_.Library().ioctlsocket(record.SocketHandle, platform::kBytesWaiting, amount) ==
      platform::kSocketError)
    return 0;
  return static_cast<std::int32_t>(amount);
}

void CSocketPlus::GetData(const Variant& index, Variant& data, DataKind kind, const Variant& maxLength) {
  TakeData(index, data, kind, maxLength, false, u"CSocketPlus.GetData");
}

void CSocketPlus::PeekData(const Variant& index, Variant& data, DataKind kind, const Variant& maxLength) {
  TakeData(index, data, kind, maxLength, true, u"CSocketPlus.PeekData");
}

void CSocketPlus::TakeData(const Variant& index, Variant& data, DataKind kind, const Variant& maxLength,
                           bool peek, const char16_t* source) {
  const Slot slot = GetSocketIndex(index);
  if (At(slot).Protocol == sckUDPProtocol) {
    if (At(slot).State != sckOpen) throw Misuse(kWrongProtocolOrState, source);
    if (AmountWaiting(slot) == 0) return;
  } else if (At(slot).State != sckConnected && (peek || !acceptClass_)) {
    throw Misuse(kWrongProtocolOrState, source);
  }
  std::int32_t most = 0;
  if (!maxLength.IsMissing()) {
    const auto number = maxLength.NumberIfAny();
    if (number && *number < 0) throw Misuse(kInvalidArgumentFault, source);
    most = number ? maxLength.AsInt32() : AmountWaiting(slot);
  }
  RecvData(slot, data, kind, most, !maxLength.IsMissing(), peek);
}

void CSocketPlus::RecvData(Slot slot, Variant& data, DataKind kind, std::int32_t maxLength, bool bounded,
                           bool peek) {
  constexpr auto kSource = u"CSocketPlus.RecvData";
  const auto waiting = static_cast<std::size_t>(AmountWaiting(slot));
  const DataKind own = data.Kind();
  const DataKind asked = own != DataKind::None ? own : kind != DataKind::None ? kind : DataKind::ByteArray;
  if (asked == DataKind::Other) throw Misuse(kUnsupportedType, kSource);
  if (const std::size_t size = SizeOf(asked)) {
    if (waiting >= size) data = ValueOf(asked, TakeBytes(slot, size, peek));
    return;
  }
  std::size_t count = waiting;
  if (bounded) count = std::min(count, static_cast<std::size_t>(maxLength));
  if (count > 0) {
    data = ValueOf(asked, TakeBytes(slot, count, peek));
    return;
  }
  data = ValueOf(asked, {});
  if (!bounded || At(slot).Protocol != sckUDPProtocol) return;
  std::uint8_t byte = 0;
  module_.Library().recv(At(slot).SocketHandle, {&byte, 1}, 0);
  throw SystemError(platform::kMessageTooLong, kSource);
}

ByteArray CSocketPlus::TakeBytes(Slot slot, std::size_t count, bool peek) {
  SocketRecord& record = At(slot);
  if (record.Protocol == sckTCPProtocol) {
    if (!peek) return record.RecvBuffer.Take(count);
    const auto front = record.RecvBuffer.Front(count);
    return ByteArray(front.begin(), front.end());
  }
  ByteArray bytes(count);
  platform::SocketAddress from;
  const std::int32_t read =
      module_.Library().recvfrom(record.SocketHandle, bytes, peek ? platform::kPeek : 0, from);
  if (read == platform::kSocketError)
    throw SystemError(module_.Library().WSAGetLastError(), u"CSocketPlus.RecvData");
  bytes.resize(static_cast<std::size_t>(read));
  record.RemotePort = from.port;
  record.RemoteHostIP = from.address.AsText();
  record.RemoteHost.clear();
  return bytes;
}

} // namespace quendra::foundation
