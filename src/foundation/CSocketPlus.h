#pragma once

#include "forms/controls/Event.h"
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

  std::int32_t RemotePort(const Variant& index);
  /// Refused with fault 40020 by a TCP socket that is not closed.
  void SetRemotePort(const Variant& index, std::int32_t port);
  Text RemoteHost(const Variant& index);
  void SetRemoteHost(const Variant& index, const Text& host);
  Text RemoteHostIP(const Variant& index);
  /// The port that is bound, else the port asked for.
  std::int32_t LocalPort(const Variant& index);
  void SetLocalPort(const Variant& index, std::int32_t port);
  SocketState State(const Variant& index);
  Text LocalHostName();
  Text LocalIP(const Variant& index);
  std::int32_t BytesReceived(const Variant& index);
  std::int32_t SocketHandle(const Variant& index);
  Text Tag(const Variant& index);
  void SetTag(const Variant& index, const Text& tag);
  SocketProtocol Protocol(const Variant& index);
  void SetProtocol(const Variant& index, SocketProtocol protocol);

  void Accept(const Variant& index, platform::SocketHandle requestID);
  /// Gives the index; without one it is the lowest number from 1 that is free.
  Variant ArrayAdd(const Variant& index = {});
  Variant ArrayRemove(const Variant& index);
  bool ArrayIndexInUse(const Variant& index) const;
  std::int32_t ArrayCount() const;
  void Bind(const Variant& index, const Variant& localPort = {}, const Variant& localIP = {});
  void CloseSck(const Variant& index);
  void Connect(const Variant& index, const Variant& remoteHost = {}, const Variant& remotePort = {});
  void GetData(const Variant& index, Variant& data, DataKind kind = DataKind::None,
               const Variant& maxLength = {});
  void Listen(const Variant& index);
  void PeekData(const Variant& index, Variant& data, DataKind kind = DataKind::None,
                const Variant& maxLength = {});
  void SendData(const Variant& index, const Variant& data);

  /// The events; each has the index first. In Error follow number, description, Scode, source, help file,
  /// help context and CancelDisplay, which a handler sets to false to have the class show the error in a box.
  struct EventTable {
    forms::Event<const Variant&> CloseSck;
    forms::Event<const Variant&> Connect;
    forms::Event<const Variant&, platform::SocketHandle> ConnectionRequest;
    forms::Event<const Variant&, std::int32_t> DataArrival;
    forms::Event<const Variant&, std::int16_t, const Text&, std::int32_t, const Text&, const Text&,
                 std::int32_t, bool&>
        Error;
    forms::Event<const Variant&> SendComplete;
    forms::Event<const Variant&, std::int32_t, std::int32_t> SendProgress;
  } Events;

 private:
  using Slot = std::size_t;
  /// Lives as long as the object: a handler may end the object that raised its event.
  using Life = std::weak_ptr<const int>;

  // The array of sockets.
  Slot GetSocketIndex(const Variant& index) const;
  Slot GetFreeSocketIndex();
  void CleanSocketArray(Slot slot);
  SocketRecord& At(Slot slot) { return records_[slot]; }
  /// The slot that holds this socket now; nothing when an event's handler has closed it or ended the object.
  bool StillHolds(const Life& life, Slot slot, platform::SocketHandle socket) const;

  // Opening.
  bool SocketExists(Slot slot);
  void ProcessOptions(Slot slot);
  bool BindInternal(Slot slot, const Variant& port = {}, const Variant& address = {});
  platform::Ipv4Address ResolveBlocking(const Text& host, std::int32_t& error);
  platform::Ipv4Address ResolveIfHostname(Slot slot, const Text& host);
  void PostResolution(platform::LookUpHandle handle, std::int32_t error);
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
  void TakeData(const Variant& index, Variant& data, DataKind kind, const Variant& maxLength, bool peek,
                const char16_t* source);
  void RecvData(Slot slot, Variant& data, DataKind kind, std::int32_t maxLength, bool bounded, bool peek);
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
  std::unordered_map<platform::LookUpHandle, Slot> slotsByResolve_;
  bool acceptClass_ = false;
  bool released_ = false;
  std::shared_ptr<const int> life_ = std::make_shared<const int>(0);
};

} // namespace quendra::foundation
