#pragma once

#include "forms/Event.h"
#include "foundation/SocketRecord.h"
#include "foundation/modSocketPlus.h"

#include <unordered_map>

namespace quendra::foundation {

/// An array of event-driven sockets, told apart by an index of the caller's choice: a 16-bit or 32-bit
/// integer or a text. Never blocks on the network. Misuse raises numbered faults; failures of the network
/// raise the Error event.
class CSocketPlus {
 public:
  explicit CSocketPlus(modSocketPlus& module);
  /// Ends the object as `Release` does; a fault of it is lost here.
  ~CSocketPlus();
  CSocketPlus(const CSocketPlus&) = delete;

  /// Cancels all look-ups, closes all sockets and leaves the module; the first fault of these is raised when
  /// all of them were tried. Once only.
  void Release();

  std::int32_t WndProc(forms::WindowHandle window, std::uint32_t message, std::uint32_t wParam,
                       std::uint32_t lParam);

  std::int32_t RemotePort(const Value& index);
  /// Refused with fault 40020 by a TCP socket that is not closed.
  void SetRemotePort(const Value& index, std::int32_t port);
  Text RemoteHost(const Value& index);
  void SetRemoteHost(const Value& index, const Text& host);
  Text RemoteHostIP(const Value& index);
  /// The port that is bound, else the port asked for.
  std::int32_t LocalPort(const Value& index);
  void SetLocalPort(const Value& index, std::int32_t port);
  SocketState State(const Value& index);
  Text LocalHostName();
  Text LocalIP(const Value& index);
  std::int32_t BytesReceived(const Value& index);
  std::int32_t SocketHandle(const Value& index);
  Text Tag(const Value& index);
  void SetTag(const Value& index, const Text& tag);
  SocketProtocol Protocol(const Value& index);
  void SetProtocol(const Value& index, SocketProtocol protocol);

  void Accept(const Value& index, platform::SocketHandle requestID);
  /// Gives the index; without one it is the lowest number from 1 that is free.
  Value ArrayAdd(const Value& index = {});
  Value ArrayRemove(const Value& index);
  bool ArrayIndexInUse(const Value& index) const;
  std::int32_t ArrayCount() const;
  void Bind(const Value& index, const Value& localPort = {}, const Value& localIP = {});
  void CloseSck(const Value& index);
  void Connect(const Value& index, const Value& remoteHost = {}, const Value& remotePort = {});
  void GetData(const Value& index, Value& data, DataKind kind = DataKind::None, const Value& maxLength = {});
  void Listen(const Value& index);
  void PeekData(const Value& index, Value& data, DataKind kind = DataKind::None, const Value& maxLength = {});
  void SendData(const Value& index, const Value& data);

  /// The events; each has the index first. In Error follow number, description, Scode, source, help file,
  /// help context and CancelDisplay, which a handler sets to false to have the class show the error in a box.
  struct EventTable {
    forms::Event<const Value&> CloseSck;
    forms::Event<const Value&> Connect;
    forms::Event<const Value&, platform::SocketHandle> ConnectionRequest;
    forms::Event<const Value&, std::int32_t> DataArrival;
    forms::Event<const Value&, std::int16_t, const Text&, std::int32_t, const Text&, const Text&,
                 std::int32_t, bool&>
        Error;
    forms::Event<const Value&> SendComplete;
    forms::Event<const Value&, std::int32_t, std::int32_t> SendProgress;
  } Events;

 private:
  using Slot = std::size_t;
  /// Lives as long as the object: a handler may end the object that raised its event.
  using Life = std::weak_ptr<const int>;

  // The array of sockets.
  Slot GetSocketIndex(const Value& index) const;
  Slot GetFreeSocketIndex();
  void CleanSocketArray(Slot slot);
  SocketRecord& At(Slot slot) { return records_[slot]; }
  /// The slot that holds this socket now; nothing when an event's handler has closed it or ended the object.
  bool StillHolds(const Life& life, Slot slot, platform::SocketHandle socket) const;

  // Opening.
  bool SocketExists(Slot slot);
  void ProcessOptions(Slot slot);
  bool BindInternal(Slot slot, const Value& port = {}, const Value& address = {});
  platform::Ipv4Address ResolveBlocking(const Text& host, std::int32_t& error);
  platform::Ipv4Address ResolveIfHostname(Slot slot, const Text& host);
  void PostResolution(std::uint32_t handle, std::int32_t error);
  void ConnectToIP(Slot slot, platform::Ipv4Address address, std::int32_t error);
  void StoreLocalAddress(Slot slot);
  void StorePeerAddress(Slot slot);

  // Events of the system.
  void PostSocket(platform::SocketHandle socket, std::int32_t event, std::int32_t error);
  void OnRead(Slot slot);
  void OnReadUDP(Slot slot);
  void OnAccept(Slot slot);
  void OnConnect(Slot slot);
  void OnClose(Slot slot);
  void OfferConnection(Slot slot, platform::SocketHandle accepted);
  void TakePending(Slot slot, platform::SocketHandle requestID);

  // Data.
  void SendBufferedData(Slot slot);
  void SendBufferedDataUDP(Slot slot);
  std::int32_t RecvDataToBuffer(Slot slot);
  void TakeData(const Value& index, Value& data, DataKind kind, const Value& maxLength, bool peek,
                const char16_t* source);
  void RecvData(Slot slot, Value& data, DataKind kind, std::int32_t maxLength, bool bounded, bool peek);
  ByteArray TakeBytes(Slot slot, std::size_t count, bool peek);
  std::int32_t AmountWaiting(Slot slot);

  // Closing.
  void CloseSlot(Slot slot);
  void CancelResolves(Slot slot);
  void DestroySocket(Slot slot);

  void Fail(Slot slot, std::int32_t number, const char16_t* source);

  modSocketPlus& module_;
  std::vector<SocketRecord> records_;
  std::vector<Slot> freeSlots_;
  std::unordered_map<Text, Slot> slotsByStringIndex_;
  std::unordered_map<std::int32_t, Slot> slotsByNumericIndex_;
  std::unordered_map<platform::SocketHandle, Slot> slotsBySocket_;
  std::unordered_map<std::uint32_t, Slot> slotsByResolve_;
  bool acceptClass_ = false;
  bool released_ = false;
  std::shared_ptr<const int> life_ = std::make_shared<const int>(0);
};

} // namespace quendra::foundation
