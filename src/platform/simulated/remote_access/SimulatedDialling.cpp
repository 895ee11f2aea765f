#include "platform/process/SystemErrors.h"
#include "platform/simulated/remote_access/DialParameters.h"
#include "platform/simulated/remote_access/SimulatedRemoteAccess.h"

namespace quendra::platform::simulated {

RasConnection SimulatedRemoteAccess::Connect(const std::string& entryName) {
  SimulatedConnection connection{.entryName = entryName, .state = kRasConnected};
  if (const SimulatedEntry* entry = book_.Find(entryName)) {
    connection.deviceType = entry->DeviceType();
    connection.deviceName = entry->DeviceName();
  }
  return dials_.Add(std::move(connection)).handle;
}

void SimulatedRemoteAccess::Disconnect(const std::string& entryName) {
  std::vector<RasConnection> ended;
  for (const SimulatedConnection& connection : dials_.Connections())
    if (connection.entryName == entryName) ended.push_back(connection.handle);
  for (const RasConnection handle : ended) dials_.End(handle);
}

std::uint32_t SimulatedRemoteAccess::RasDialA(std::span<const std::uint8_t> extensions, const char* phoneBook,
                                              std::span<const std::uint8_t> params, const Notifier& notifier,
                                              RasConnection& connection) {
  const auto wrong = ErrorOfParams(params);
  const std::string name = wrong ? "" : EntryNameIn(params);
  Record("RasDialA", name);
  Dials.push_back({{extensions.begin(), extensions.end()}, {params.begin(), params.end()}, notifier});
  if (const auto error = Enter("RasDialA", phoneBook)) return error;
  if (wrong) return wrong;
  if (!extensions.empty() && (extensions.size() < 4 || Little32(extensions, 0) != RasDialExtensions::kBytes))
    return kRasInvalidSize;
  const SimulatedEntry* entry = book_.Find(name);
  if (!entry) return kRasCannotFindPhonebookEntry;
  return dials_.Start({.entryName = entry->name,
                       .deviceType = entry->DeviceType(),
                       .deviceName = entry->DeviceName(),
                       .notifier = notifier},
                      connection);
}

std::uint32_t SimulatedRemoteAccess::RasHangUpA(RasConnection connection) {
  const SimulatedConnection* standing = dials_.Find(connection);
  Record("RasHangUpA", standing ? standing->entryName : std::to_string(connection.Value()));
  if (const auto error = Enter("RasHangUpA")) return error;
  if (dials_.End(connection)) hungUp_.insert(connection);
  return hungUp_.contains(connection) ? std::uint32_t{kRasSuccess} : std::uint32_t{kErrorInvalidHandle};
}

std::uint32_t SimulatedRemoteAccess::RasEnumConnectionsA(std::span<std::uint8_t> connections,
                                                         std::uint32_t& bytes, std::uint32_t& count) {
  count = 0;
  if (const auto error = Enter("RasEnumConnectionsA")) return error;
  RecordList list{connections, bytes, count};
  const std::uint32_t size = list.StatedSize();
  if (std::ranges::find(ConnectionSizes, size) == ConnectionSizes.end()) return kRasInvalidSize;
  auto next = dials_.Connections().begin();
  return list.Fill(size, dials_.Connections().size(),
                   [&next](std::size_t, auto record) { PutConnection(*next++, record); });
}

std::uint32_t SimulatedRemoteAccess::RasGetErrorStringA(std::uint32_t error, std::span<char> text) {
  if (const auto refused = Enter("RasGetErrorStringA")) return refused;
  constexpr std::uint32_t kFirst = 600;
  constexpr std::uint32_t kLast = 799;
  const auto found = ErrorTexts.find(error);
  const bool isOwn = found != ErrorTexts.end() || (error >= kFirst && error <= kLast);
  if (!isOwn) return kInvalidParameter;
  const std::string told = found == ErrorTexts.end()
                               ? "Remote access failed by number " + std::to_string(error) + "."
                               : found->second;
  if (text.size() <= told.size()) return kRasBufferTooSmall;
  *std::ranges::copy(told, text.begin()).out = '\0';
  return kRasSuccess;
}

} // namespace quendra::platform::simulated
