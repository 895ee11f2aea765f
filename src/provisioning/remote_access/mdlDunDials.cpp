#include "forms/Desktop.h"
#include "platform/remote_access/Dialling.h"
#include "platform/remote_access/PhoneBook.h"
#include "provisioning/remote_access/RasConnectionImage.h"
#include "provisioning/remote_access/RasDialParamsImage.h"
#include "provisioning/remote_access/RecordFields.h"
#include "provisioning/remote_access/mdlDun.h"

namespace quendra::provisioning {

using platform::Dialling;
using platform::RasConnection;

namespace {

/// More than any machine has; none of more is hung up.
constexpr std::uint32_t kMostConnections = 4096;

} // namespace

std::int32_t mdlDun::DialEntry(std::int16_t asynchronous, Text& entryName, Text& phoneNumber, Text& userName,
                               Text& password, std::optional<WindowHandle> window) {
  if (ActiveRasConn != platform::kNoRasConnection) {
    ShowExclamation(u"  Connection Already Opened", u"There is currently already a connection open.");
    return 0;
  }
  EndNameInNul(entryName);
  for (Text* text : {&phoneNumber, &userName, &password}) EndInNul(*text);
  Bytes params(platform::RasDialParams::kBytes);
  PutRasDialParams(
      {.entryName = entryName, .phoneNumber = phoneNumber, .userName = userName, .password = password},
      params);
  // What is saved with the entry wins over what was handed in, whatever the result.
  bool hasPassword = false;
  phoneBook_.RasGetEntryDialParamsA(nullptr, params, hasPassword);
  if (asynchronous != kTrue16) window.reset();
  if (window) {
    HookDialEvents(*window);
    // Nobody undoes this hook: it stays for the life of the window.
    HookedWindow = kNoWindow;
  }
  // An outcome is told by events, or not at all.
  Dial(params, window);
  return 0;
}

std::uint32_t mdlDun::Dial(const Bytes& params, std::optional<WindowHandle> window) {
  std::array<std::uint8_t, platform::RasDialExtensions::kBytes> extensions{};
  PutLittle32(extensions, 0, platform::RasDialExtensions::kBytes);
  Dialling::Notifier notifier;
  if (window) notifier = {platform::kRasNotifierIsWindow, *window};
  return dialling_.RasDialA(extensions, nullptr, params, notifier, ActiveRasConn);
}

Boolean16 mdlDun::HangUpActive(Boolean16 showMessages) {
  if (ActiveRasConn == platform::kNoRasConnection) {
    if (showMessages == kTrue16)
      ShowExclamation(u"  No Connection Open To Close", u"There is currently no connection open to close.");
    return kTrue16;
  }
  if (const std::uint32_t error = dialling_.RasHangUpA(ActiveRasConn)) {
    ReportRasError(error, u"RasHangUp", showMessages);
    return kFalse16;
  }
  ActiveRasConn = platform::kNoRasConnection;
  return kTrue16;
}

// Another program may make or end connections between the two questions: what the second one doesn't tell
// isn't hung up.
std::vector<RasConnection> mdlDun::OpenConnections(bool& told) {
  std::array<std::uint8_t, 4> sizeWord{};
  std::uint32_t size = 0;
  std::uint32_t count = 0;
  for (const std::uint32_t tried : kRasConnectionSizes) {
    size = tried;
    PutLittle32(sizeWord, 0, size);
    std::uint32_t bytes = sizeWord.size();
    const std::uint32_t result = dialling_.RasEnumConnectionsA(sizeWord, bytes, count);
    if (result != platform::kRasInvalidSize && result != platform::kRasBufferInvalid) break;
  }
  told = count <= kMostConnections;
  if (count == 0 || !told) return {};
  Bytes records(std::size_t{count} * size);
  PutLittle32(records, 0, size);
  auto bytes = static_cast<std::uint32_t>(records.size());
  told = dialling_.RasEnumConnectionsA(records, bytes, count) == platform::kRasSuccess;
  std::vector<RasConnection> connections;
  for (std::size_t at = 0; told && connections.size() < count && at + size <= records.size(); at += size)
    connections.emplace_back(RasConnectionOf(std::span(records).subspan(at, size)).handle);
  return connections;
}

Boolean16 mdlDun::HangUpAllConnections() {
  bool succeeded = true;
  for (const RasConnection connection : OpenConnections(succeeded))
    succeeded = dialling_.RasHangUpA(connection) == platform::kRasSuccess;
  return succeeded ? kTrue16 : kFalse16;
}

} // namespace quendra::provisioning
