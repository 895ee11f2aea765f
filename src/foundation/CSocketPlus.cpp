#include "foundation/CSocketPlus.h"

#include "foundation/SocketErrors.h"

#include <exception>

namespace quendra::foundation {

namespace {

std::int32_t CheckedPort(std::int32_t port, const char16_t* source) {
  if (port < 0 || port > 65535) throw Misuse(kInvalidArgumentFault, source);
  return port;
}

} // namespace

CSocketPlus::CSocketPlus(modSocketPlus& module) : module_(module), records_(1) {
  module_.InitiateProcesses();
}

CSocketPlus::~CSocketPlus() {
  try {
    Release();
  } catch (const Fault&) {
    // An ending object has nobody to raise it to; who wants to know calls Release.
  }
}

void CSocketPlus::Release() {
  if (std::exchange(released_, true)) return;
  life_.reset();
  std::exception_ptr first;
  const auto attempt = [&](const auto& step) {
    try {
      step();
    } catch (const Fault&) {
      if (!first) first = std::current_exception();
    }
  };
  for (Slot slot = 1; slot < records_.size(); ++slot) {
    CancelResolves(slot);
    if (!acceptClass_) attempt([&] { DestroySocket(slot); });
  }
  // A socket that could not be closed must not lead messages to an object that is gone.
  attempt([&] { module_.ForgetOwner(this); });
  attempt([&] { module_.FinalizeProcesses(); });
  if (first) std::rethrow_exception(first);
}

std::int32_t CSocketPlus::WndProc(forms::WindowHandle, std::uint32_t message, std::uint32_t wParam,
                                  std::uint32_t lParam) {
  const std::int32_t error = platform::ErrorOfMessage(lParam);
  if (message == modSocketPlus::kResolveMessage) PostResolution(platform::LookUpHandle(wParam), error);
  if (message == modSocketPlus::kSocketMessage)
    PostSocket(platform::SocketHandle(wParam), platform::EventOfMessage(lParam), error);
  return 0;
}

std::int32_t CSocketPlus::RemotePort(const Variant& index) { return At(GetSocketIndex(index)).RemotePort; }

void CSocketPlus::SetRemotePort(const Variant& index, std::int32_t port) {
  constexpr auto kSource = u"CSocketPlus.RemotePort";
  SocketRecord& record = At(GetSocketIndex(index));
  if (record.Protocol == sckTCPProtocol && record.State != sckClosed)
    throw Misuse(kInvalidAtCurrentState, kSource);
  record.RemotePort = CheckedPort(port, kSource);
}

Text CSocketPlus::RemoteHost(const Variant& index) { return At(GetSocketIndex(index)).RemoteHost; }

void CSocketPlus::SetRemoteHost(const Variant& index, const Text& host) {
  SocketRecord& record = At(GetSocketIndex(index));
  if (record.Protocol == sckTCPProtocol && record.State != sckClosed)
    throw Misuse(kInvalidAtCurrentState, u"CSocketPlus.RemoteHost");
  record.RemoteHost = host;
}

Text CSocketPlus::RemoteHostIP(const Variant& index) { return At(GetSocketIndex(index)).RemoteHostIP; }

std::int32_t CSocketPlus::LocalPort(const Variant& index) {
  const SocketRecord& record = At(GetSocketIndex(index));
  return record.LocalPortBind != 0 ? record.LocalPortBind : record.LocalPort;
}

void CSocketPlus::SetLocalPort(const Variant& index, std::int32_t port) {
  constexpr auto kSource = u"CSocketPlus.LocalPort";
  SocketRecord& record = At(GetSocketIndex(index));
  if (record.State != sckClosed) throw Misuse(kInvalidAtCurrentState, kSource);
  record.LocalPort = CheckedPort(port, kSource);
}

SocketState CSocketPlus::State(const Variant& index) { return At(GetSocketIndex(index)).State; }

Text CSocketPlus::LocalHostName() {
  const auto name = module_.Names().gethostname();
  if (!name) throw SystemError(module_.Names().LastError(), u"CSocketPlus.GetLocalHostName");
  return FromCodePage(CutAtNul(std::string_view(*name).substr(0, 256)));
}

Text CSocketPlus::LocalIP(const Variant& index) {
  const SocketRecord& record = At(GetSocketIndex(index));
  if (record.State == sckConnected) return record.LocalIP;
  const auto addresses = module_.Names().gethostbyname(ToCodePage(LocalHostName()));
  if (!addresses) throw SystemError(module_.Names().LastError(), u"CSocketPlus.GetLocalIP");
  return addresses->front().AsText();
}

std::int32_t CSocketPlus::BytesReceived(const Variant& index) { return AmountWaiting(GetSocketIndex(index)); }

std::int32_t CSocketPlus::SocketHandle(const Variant& index) {
  return static_cast<std::int32_t>(At(GetSocketIndex(index)).SocketHandle.Value());
}

Text CSocketPlus::Tag(const Variant& index) { return At(GetSocketIndex(index)).Tag; }

void CSocketPlus::SetTag(const Variant& index, const Text& tag) { At(GetSocketIndex(index)).Tag = tag; }

SocketProtocol CSocketPlus::Protocol(const Variant& index) { return At(GetSocketIndex(index)).Protocol; }

void CSocketPlus::SetProtocol(const Variant& index, SocketProtocol protocol) {
  SocketRecord& record = At(GetSocketIndex(index));
  if (record.State != sckClosed) throw Misuse(kInvalidAtCurrentState, u"CSocketPlus.Protocol");
  record.Protocol = protocol;
}

void CSocketPlus::CloseSck(const Variant& index) { CloseSlot(GetSocketIndex(index)); }

void CSocketPlus::CloseSlot(Slot slot) {
  At(slot).State = sckClosing;
  CancelResolves(slot);
  DestroySocket(slot);
  SocketRecord& record = At(slot);
  record.LocalPortBind = 0;
  record.RemoteHostIP.clear();
  record.RecvBuffer.Clear();
  record.SendBuffer.Clear();
  record.SendBufferSize = record.RecvBufferSize = 0;
  record.State = sckClosed;
}

void CSocketPlus::CancelResolves(Slot slot) {
  for (const platform::LookUpHandle handle : std::exchange(At(slot).ResolveRequests, {})) {
    module_.Library().WSACancelAsyncRequest(handle);
    module_.UnregisterResolve(handle);
    slotsByResolve_.erase(handle);
  }
  At(slot).LookUpBuffer.reset();
}

void CSocketPlus::DestroySocket(Slot slot) {
  SocketRecord& record = At(slot);
  if (record.SocketHandle == platform::kNoSocket) return;
  if (module_.Library().closesocket(record.SocketHandle) == platform::kSocketError) {
    record.State = sckError;
    throw SystemError(module_.Library().WSAGetLastError(), u"CSocketPlus.DestroySocket");
  }
  module_.UnregisterSocket(record.SocketHandle);
  slotsBySocket_.erase(record.SocketHandle);
  record.SocketHandle = platform::kNoSocket;
}

void CSocketPlus::Fail(Slot slot, std::int32_t number, const char16_t* source) {
  At(slot).State = sckError;
  const Variant index = At(slot).Index;
  const Text description = SystemErrorText(number);
  modSocketPlus& module = module_; // the handler may end this object
  bool cancelDisplay = true;
  Events.Error(index, static_cast<std::int16_t>(number), description, 0, source, {}, 0, cancelDisplay);
  if (!cancelDisplay) module.ShowError(description, source);
}

} // namespace quendra::foundation
