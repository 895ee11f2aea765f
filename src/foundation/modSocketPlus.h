#pragma once

#include "forms/Desktop.h"
#include "foundation/HandleOwners.h"
#include "platform/net/HostNames.h"
#include "platform/net/Sockets.h"
#include "runtime/Text.h"

#include <map>
#include <memory>
#include <optional>
#include <set>

namespace quendra::foundation {

class CSocketPlus;

/// What all socket objects of the program share: the library's start and end, the one hidden window, the
/// tables that tell which object owns which socket or look-up, and the dispatcher from window messages to
/// those objects.
class modSocketPlus {
 public:
  static constexpr std::uint32_t kResolveMessage = 32768;
  static constexpr std::uint32_t kSocketMessage = 32769;
  static constexpr std::int32_t kEventMask = 59;

  /// The windows may be others than the desktop's own.
  modSocketPlus(platform::Sockets& sockets, platform::HostNames& hostNames, forms::Desktop& desktop,
                forms::MessageWindows& windows);
  modSocketPlus(platform::Sockets& sockets, platform::HostNames& hostNames, forms::Desktop& desktop)
      : modSocketPlus(sockets, hostNames, desktop, desktop.Windows) {}
  ~modSocketPlus();

  void InitiateProcesses();
  void FinalizeProcesses();
  bool RegisterSocket(platform::SocketHandle socket, CSocketPlus* owner, bool selectEvents);
  void UnregisterSocket(platform::SocketHandle socket);
  /// What is still registered for an object that ends.
  void ForgetOwner(const CSocketPlus* owner);
  bool IsSocketRegistered(platform::SocketHandle socket) const;
  void RegisterResolve(platform::LookUpHandle handle, CSocketPlus* owner) { resolves_.Add(handle, owner); }
  void UnregisterResolve(platform::LookUpHandle handle) { resolves_.Remove(handle); }
  /// The look-up's handle, kNoLookUp on failure.
  platform::LookUpHandle StartResolve(const Text& name, std::span<std::uint8_t> buffer, CSocketPlus* owner);
  void ChangeSocketOwner(platform::SocketHandle socket, CSocketPlus* owner) {
    socketOwners_.ChangeOwner(socket, owner);
  }

  /// The pending list: connections accepted by the system that nobody has taken yet.
  void RegisterAccept(platform::SocketHandle socket);
  bool IsAcceptRegistered(platform::SocketHandle socket) const;
  void UnregisterAccept(platform::SocketHandle socket);
  /// nullptr for a socket that isn't in the list.
  std::shared_ptr<CSocketPlus> GetAcceptClass(platform::SocketHandle socket) const;

  /// The plain box of an error whose handler leaves its display to the class.
  void ShowError(const Text& description, const Text& source) { desktop_.MessageBox(description, 0, source); }

  platform::Sockets& Library() { return sockets_; }
  platform::HostNames& Names() { return hostNames_; }

  std::int32_t SocketClassCount() const { return socketClassCount_; }
  bool WinsockStarted() const { return winsockStarted_; }
  forms::WindowHandle SocketWindow() const { return socketWindow_; }
  int ResolveCount() const { return resolves_.Count(); }
  int SocketCount() const { return socketOwners_.Count(); }

 private:
  void CreateWinsockMessageWindow();
  void DestroyWinsockMessageWindow();
  void AttachDispatcher();
  void DetachDispatcher();

  platform::Sockets& sockets_;
  platform::HostNames& hostNames_;
  forms::Desktop& desktop_;
  forms::MessageWindows& windows_;
  std::int32_t socketClassCount_ = 0;
  bool winsockStarted_ = false;
  forms::WindowHandle socketWindow_;
  std::optional<std::set<platform::SocketHandle>> registeredSockets_;
  std::map<platform::SocketHandle, std::shared_ptr<CSocketPlus>> pendingAccepts_;
  HandleOwners<platform::LookUpHandle> resolves_;
  HandleOwners<platform::SocketHandle> socketOwners_;
  forms::WindowHandle subclassedWindow_;
  forms::WindowProcedure previousWindowProc_;
};

} // namespace quendra::foundation
