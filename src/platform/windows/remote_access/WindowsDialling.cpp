#include "platform/windows/remote_access/WindowsDialling.h"

#include "platform/process/SystemErrors.h"
#include "platform/unavailable/UnavailableDialling.h"
#include "platform/windows/remote_access/RasRecords.h"

namespace quendra::platform::windows {

namespace {

constexpr std::uint32_t kMostMillisecondsToEnd = 3000; // as the system's makers advise

HRASCONN HandleOf(RasConnection connection) { return reinterpret_cast<HRASCONN>(connection.Value()); }

RasConnection ConnectionOf(HRASCONN handle) {
  return RasConnection(static_cast<std::uint32_t>(reinterpret_cast<std::uintptr_t>(handle)));
}

} // namespace

WindowsDialling::~WindowsDialling() {
  const std::uint32_t begin = ::GetTickCount();
  for (const RasConnection connection : hungUp_)
    while (HasHandle(connection) && ::GetTickCount() - begin < kMostMillisecondsToEnd) ::Sleep(10);
}

bool WindowsDialling::HasHandle(RasConnection connection) {
  const auto call = ras_.Calls().GetConnectStatus;
  RASCONNSTATUSW status{};
  status.dwSize = sizeof status;
  return call && call(HandleOf(connection), &status) == kRasSuccess;
}

std::unique_ptr<DialRelay> WindowsDialling::RelayTo(const Notifier& notifier) {
  // A notifier of another kind is the address of a procedure, which none of the program's numbers is.
  if (notifier.type != kRasNotifierIsWindow || notifier.window == kNoWindow) return nullptr;
  const std::uint32_t registered = loop_.RegisterWindowMessageA(kRasDialEventName);
  return std::make_unique<DialRelay>(
      [this, window = notifier.window, message = registered != 0 ? registered : std::uint32_t{kRasDialEvent}](
          std::uint32_t state, std::uint32_t error) { loop_.PostMessage(window, message, state, error); });
}

std::uint32_t WindowsDialling::RasDialA(std::span<const std::uint8_t> extensions, const char* phoneBook,
                                        std::span<const std::uint8_t> params, const Notifier& notifier,
                                        RasConnection& connection) {
  const auto call = ras_.Calls().Dial;
  if (!call) return kRasManagerCannotStart;
  if (const std::uint32_t error = ErrorOfRecord(kRasDialParams, params)) return error;
  if (!extensions.empty() && ErrorOfRecord(extensions) != kRasSuccess) return kRasInvalidSize;
  auto relay = RelayTo(notifier);
  if (relay && !relay->Window()) return kRasManagerCannotStart;
  std::vector<std::uint8_t> extended(extensions.begin(), extensions.end());
  WideRecord image(kRasDialParams, params);
  HRASCONN handle = nullptr;
  const std::uint32_t error =
      call(extensions.empty() ? nullptr : reinterpret_cast<RASDIALEXTENSIONS*>(extended.data()),
           BookNamed(phoneBook), image.As<RASDIALPARAMSW>(), relay ? kRasNotifierIsWindow : 0,
           relay ? relay->Window() : nullptr, &handle);
  if (handle) Keep(ConnectionOf(handle), std::move(relay), error, connection);
  return error;
}

void WindowsDialling::Keep(RasConnection made, std::unique_ptr<DialRelay> relay, std::uint32_t error,
                           RasConnection& connection) {
  hungUp_.erase(made); // a number that the system gives again
  if (!relay && error != kRasSuccess) {
    // A failed dial leaves its handle, and with it the line, to whoever dialled. Here nobody hears of it.
    RasHangUpA(made);
    return;
  }
  connection = made;
  if (relay) relays_[made] = std::move(relay);
}

std::uint32_t WindowsDialling::RasHangUpA(RasConnection connection) {
  const auto call = ras_.Calls().HangUp;
  if (!call) return unavailable::UnavailableDialling().RasHangUpA(connection);
  const std::uint32_t error = call(HandleOf(connection));
  const bool hasEnded = error == kRasSuccess || error == kErrorInvalidHandle;
  if (hasEnded) relays_.erase(connection);
  if (error == kRasSuccess) hungUp_.insert(connection);
  const bool wasHungUp = error == kErrorInvalidHandle && hungUp_.contains(connection);
  return wasHungUp ? std::uint32_t{kRasSuccess} : error;
}

std::uint32_t WindowsDialling::RasEnumConnectionsA(std::span<std::uint8_t> connections, std::uint32_t& bytes,
                                                   std::uint32_t& count) {
  const auto call = ras_.Calls().EnumConnections;
  if (!call) return unavailable::UnavailableDialling().RasEnumConnectionsA(connections, bytes, count);
  count = 0;
  // The size is the question here: there is none to take in its place.
  if (connections.empty()) return kRasInvalidSize;
  return FillList<RASCONNW>(kRasConnection, connections, bytes, count, RasConnectionRecord::kBytes, call);
}

std::uint32_t WindowsDialling::RasGetErrorStringA(std::uint32_t error, std::span<char> text) {
  const auto call = ras_.Calls().GetErrorString;
  if (!call) return unavailable::UnavailableDialling().RasGetErrorStringA(error, text);
  std::vector<wchar_t> told(text.size() + 1);
  const std::uint32_t result = call(error, told.data(), static_cast<DWORD>(text.size()));
  if (result != kRasSuccess) return result;
  const std::string bytes = ToCodePage(winapi::TextOf(told.data()));
  if (bytes.size() >= text.size()) return kRasBufferTooSmall;
  *std::ranges::copy(bytes, text.begin()).out = '\0';
  return result;
}

} // namespace quendra::platform::windows
