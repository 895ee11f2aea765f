#include "platform/linux/remote_access/ConnectionBook.h"

#include "platform/linux/network_manager/NetworkManagerNames.h"
#include "platform/process/SystemErrors.h"
#include "platform/remote_access/RemoteAccessNumbers.h"
#include "runtime/Text.h"

#include <algorithm>
#include <tuple>

namespace quendra::platform::linux_ {

namespace {

bool SameName(std::string_view left, std::string_view right) {
  return SameIgnoringCase(FromCodePage(left), FromCodePage(right));
}

} // namespace

std::uint32_t ErrorOf(const BusAnswer& answer) {
  if (answer.IsGiven()) return kRasSuccess;
  if (answer.kind == BusAnswer::Kind::NobodyThere) return kRasManagerCannotStart;
  return answer.IsForbidden() ? kAccessDenied : kInvalidParameter;
}

ConnectionBook::ConnectionBook(NetworkManagerBus& bus) : bus_(bus) {
  bus_.Listen([this](const BusSignal& signal) {
    if (signal.TellsOfAnotherManager()) known_.clear();
    if (signal.interface == nm::kConnection) known_.erase(signal.path);
  });
}

std::uint32_t ConnectionBook::Refresh() {
  const auto answer = bus_.Ask({nm::kSettingsPath, nm::kSettings, "ListConnections"});
  if (!answer.IsGiven()) return ErrorOf(answer);
  // What changed before this answer was sent has been told before it.
  bus_.HandleArrived();
  std::map<std::string, Known> known;
  for (const BusValue& path : answer.First().items) known[path.text] = std::move(known_[path.text]);
  known_ = std::move(known);
  return ReadUnknown();
}

std::uint32_t ConnectionBook::ReadUnknown() {
  std::vector<BusQuestion> questions;
  for (const auto& [path, known] : known_)
    if (!known.isRead) questions.push_back({path, nm::kConnection, "GetSettings"});
  const auto answers = bus_.AskAll(questions);
  std::uint32_t error = kRasSuccess;
  for (std::size_t i = 0; i < answers.size(); ++i) {
    // One that nobody answers for may be any entry.
    if (answers[i].kind == BusAnswer::Kind::NobodyThere) error = kRasManagerCannotStart;
    // One that is private to another user, or gone by now, is none.
    if (!answers[i].IsGiven()) continue;
    const NetworkSettings settings = NetworkSettingsOf(answers[i].First());
    known_[questions[i].path] = {true, LineKindOf(settings),
                                 Shown(TextIn(settings, "connection", "id"), RasEntryName::kNameBytes)};
  }
  return error;
}

std::uint32_t ConnectionBook::ReadAllLines(std::vector<Line>& lines) {
  lines.clear();
  if (const std::uint32_t error = Refresh()) return error;
  for (const auto& [path, known] : known_)
    if (known.kind && !known.name.empty()) lines.push_back({path, known.name, *known.kind});
  std::ranges::sort(lines, {},
                    [](const Line& line) { return std::tuple(Lowered(FromCodePage(line.name)), line.path); });
  return kRasSuccess;
}

std::uint32_t ConnectionBook::ReadLines(std::vector<Line>& lines) {
  if (const std::uint32_t error = ReadAllLines(lines)) return error;
  const auto repeated = std::unique(lines.begin(), lines.end(), [](const Line& left, const Line& right) {
    return SameName(left.name, right.name);
  });
  lines.erase(repeated, lines.end());
  return kRasSuccess;
}

bool ConnectionBook::IsThere() {
  return bus_
      .Ask({nm::kSettingsPath,
            nm::kProperties,
            "Get",
            {BusValue::Text(nm::kSettings), BusValue::Text("CanModify")}})
      .IsGiven();
}

std::uint32_t ConnectionBook::Find(std::string_view name, Line& line) {
  std::vector<Line> lines;
  if (const std::uint32_t error = ReadLines(lines)) return error;
  const auto found = std::ranges::find_if(lines, [&](const Line& one) { return SameName(one.name, name); });
  if (found == lines.end()) return kRasCannotFindPhonebookEntry;
  line = *found;
  return kRasSuccess;
}

std::uint32_t ConnectionBook::ReadSettings(const Line& line, NetworkSettings& settings) {
  const auto answer = bus_.Ask({line.path, nm::kConnection, "GetSettings"});
  settings = NetworkSettingsOf(answer.First());
  return ErrorOf(answer);
}

std::uint32_t ConnectionBook::ReadSecrets(const Line& line, NetworkSettings& secrets) {
  const auto answer = bus_.AskForChange(
      {line.path, nm::kConnection, "GetSecrets", {BusValue::Text(DeviceTypeOf(line.kind))}});
  secrets = NetworkSettingsOf(answer.First());
  const std::uint32_t error = ErrorOf(answer);
  return error == kInvalidParameter ? std::uint32_t{kRasSuccess} : error;
}

std::uint32_t ConnectionBook::Add(const NetworkSettings& settings) {
  return ErrorOf(bus_.AskForChange({nm::kSettingsPath, nm::kSettings, "AddConnection", {ValueOf(settings)}}));
}

std::uint32_t ConnectionBook::Update(const Line& line, const NetworkSettings& settings) {
  return ErrorOf(bus_.AskForChange({line.path, nm::kConnection, "Update", {ValueOf(settings)}}));
}

std::uint32_t ConnectionBook::ClearSecrets(const Line& line) {
  return ErrorOf(bus_.AskForChange({line.path, nm::kConnection, "ClearSecrets"}));
}

std::uint32_t ConnectionBook::Delete(const Line& line) {
  return ErrorOf(bus_.AskForChange({line.path, nm::kConnection, "Delete"}));
}

} // namespace quendra::platform::linux_
