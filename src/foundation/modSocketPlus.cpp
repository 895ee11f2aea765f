#include "foundation/modSocketPlus.h"

#include "foundation/CSocketPlus.h"
#include "foundation/LibraryName.h"
#include "foundation/SocketErrors.h"

namespace quendra::foundation {

namespace {
constexpr std::uint16_t kVersion11 = 257;
} // namespace

modSocketPlus::modSocketPlus(platform::Sockets& sockets, platform::HostNames& hostNames,
                             forms::Desktop& desktop, forms::MessageWindows& windows)
    : sockets_(sockets), hostNames_(hostNames), desktop_(desktop), windows_(windows) {}

modSocketPlus::~modSocketPlus() {
  // Objects use the module's tables when they end, so the pending ones end before the tables do.
  while (!pendingAccepts_.empty()) UnregisterAccept(pendingAccepts_.begin()->first);
  DetachDispatcher();
}

void modSocketPlus::InitiateProcesses() {
  ++socketClassCount_;
  if (winsockStarted_) return;
  winsockStarted_ = true;
  const std::int32_t error = sockets_.WSAStartup(kVersion11);
  if (error != 0) throw SystemError(error, u"modSocketPlus.InitiateProcesses");
}

void modSocketPlus::FinalizeProcesses() {
  const bool last = socketClassCount_-- == 1;
  if (!winsockStarted_ || !last) return;
  if (sockets_.WSACleanup() == platform::kSocketError)
    throw SystemError(sockets_.WSAGetLastError(), u"modSocketPlus.FinalizeProcesses");
  DetachDispatcher();
  resolves_.Clear();
  socketOwners_.Clear();
  winsockStarted_ = false;
}

bool modSocketPlus::RegisterSocket(platform::SocketHandle socket, CSocketPlus* owner, bool selectEvents) {
  if (!registeredSockets_) {
    registeredSockets_.emplace();
    CreateWinsockMessageWindow();
    AttachDispatcher();
  }
  socketOwners_.Add(socket, owner);
  if (selectEvents &&
      sockets_.WSAAsyncSelect(socket, socketWindow_, kSocketMessage, kEventMask) == platform::kSocketError)
    throw SystemError(sockets_.WSAGetLastError(), u"modSocketPlus.RegisterSocket");
  registeredSockets_->insert(socket);
  return true;
}

void modSocketPlus::UnregisterSocket(platform::SocketHandle socket) {
  socketOwners_.Remove(socket);
  if (!registeredSockets_) return;
  registeredSockets_->erase(socket);
  if (!registeredSockets_->empty()) return;
  registeredSockets_.reset();
  DetachDispatcher();
  DestroyWinsockMessageWindow();
}

void modSocketPlus::ForgetOwner(const CSocketPlus* owner) {
  for (const platform::LookUpHandle handle : resolves_.HandlesOf(owner)) UnregisterResolve(handle);
  for (const platform::SocketHandle handle : socketOwners_.HandlesOf(owner)) UnregisterSocket(handle);
}

bool modSocketPlus::IsSocketRegistered(platform::SocketHandle socket) const {
  return registeredSockets_ && registeredSockets_->contains(socket);
}

platform::LookUpHandle modSocketPlus::StartResolve(const Text& name, std::span<std::uint8_t> buffer,
                                                   CSocketPlus* owner) {
  const platform::LookUpHandle handle =
      sockets_.WSAAsyncGetHostByName(socketWindow_, kResolveMessage, LibraryName(name), buffer);
  if (handle != platform::kNoLookUp) RegisterResolve(handle, owner);
  return handle;
}

void modSocketPlus::RegisterAccept(platform::SocketHandle socket) {
  auto pending = std::make_shared<CSocketPlus>(*this);
  pending->ArrayAdd(Text(u"Temporal_Socket"));
  pending->Accept(Text(u"Temporal_Socket"), socket);
  pendingAccepts_[socket] = std::move(pending);
}

bool modSocketPlus::IsAcceptRegistered(platform::SocketHandle socket) const {
  return pendingAccepts_.contains(socket);
}

void modSocketPlus::UnregisterAccept(platform::SocketHandle socket) {
  // Taken out of the list first: an object that ends calls this module again, which must not find it then.
  const auto ended = pendingAccepts_.extract(socket);
}

std::shared_ptr<CSocketPlus> modSocketPlus::GetAcceptClass(platform::SocketHandle socket) const {
  const auto found = pendingAccepts_.find(socket);
  return found == pendingAccepts_.end() ? nullptr : found->second;
}

void modSocketPlus::CreateWinsockMessageWindow() {
  socketWindow_ = windows_.Create();
  if (socketWindow_ != forms::kNoWindow) return;
  registeredSockets_.reset();
  throw Fault(Fault::kOutOfMemory, u"Out of memory", u"modSocketPlus.RegisterSocket");
}

void modSocketPlus::DestroyWinsockMessageWindow() {
  if (!windows_.Destroy(socketWindow_))
    throw Fault(Fault::kOutOfMemory, u"Out of memory", u"modSocketPlus.DestroyWinsockMessageWindow");
  socketWindow_ = forms::kNoWindow;
}

void modSocketPlus::AttachDispatcher() {
  if (subclassedWindow_ != forms::kNoWindow) return;
  const auto previous = windows_.Procedure(socketWindow_);
  subclassedWindow_ = socketWindow_;
  previousWindowProc_ = previous;
  using Procedure = forms::WindowProcedure::element_type;
  windows_.Replace(socketWindow_, std::make_shared<Procedure>(
                                      [this, previous](forms::WindowHandle window, std::uint32_t message,
                                                       std::uint32_t wParam, std::uint32_t lParam) {
                                        CSocketPlus* owner = nullptr;
                                        if (message == kResolveMessage)
                                          owner = resolves_.OwnerOf(platform::LookUpHandle(wParam));
                                        if (message == kSocketMessage)
                                          owner = socketOwners_.OwnerOf(platform::SocketHandle(wParam));
                                        return owner
                                                   ? owner->WndProc(window, message, wParam, lParam)
                                                   : windows_.Call(previous, window, message, wParam, lParam);
                                      }));
}

void modSocketPlus::DetachDispatcher() {
  if (subclassedWindow_ == forms::kNoWindow) return;
  windows_.Replace(subclassedWindow_, previousWindowProc_);
  subclassedWindow_ = forms::kNoWindow;
  previousWindowProc_ = nullptr;
}

} // namespace quendra::foundation
