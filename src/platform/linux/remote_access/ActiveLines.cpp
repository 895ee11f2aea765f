#include "platform/linux/remote_access/ActiveLines.h"

#include "platform/linux/network_manager/NetworkManagerNames.h"
#include "platform/process/SystemErrors.h"
#include "platform/remote_access/RemoteAccessNumbers.h"

#include <algorithm>

namespace quendra::platform::linux_ {

std::uint32_t ReadActiveLines(NetworkManagerBus& bus, ConnectionBook& book, std::vector<ActiveLine>& active) {
  active.clear();
  std::vector<Line> lines;
  if (const std::uint32_t error = book.ReadAllLines(lines)) return error;
  const auto answer = bus.Ask({nm::kManagerPath,
                               nm::kProperties,
                               "Get",
                               {BusValue::Text(nm::kManager), BusValue::Text("ActiveConnections")}});
  if (!answer.IsGiven()) return ErrorOf(answer);
  std::vector<BusQuestion> questions;
  for (const BusValue& held : answer.First().items)
    for (const BusValue& path : held.items)
      questions.push_back({path.text, nm::kProperties, "GetAll", {BusValue::Text(nm::kActive)}});
  const auto answers = bus.AskAll(questions);
  // One that nobody answers for may be any line.
  if (std::ranges::find(answers, BusAnswer::Kind::NobodyThere, &BusAnswer::kind) != answers.end())
    return kRasManagerCannotStart;
  for (std::size_t i = 0; i < answers.size(); ++i) {
    ValueMap properties = ValueMapOf(answers[i].First());
    const std::uint64_t state = properties["State"].number;
    const auto line = std::ranges::find(lines, properties["Connection"].text, &Line::path);
    if (line != lines.end() && (state == nm::kActivating || state == nm::kActivated))
      active.push_back({questions[i].path, *line});
  }
  return kRasSuccess;
}

BusQuestion QuestionOfEnd(const std::string& path) {
  return {nm::kManagerPath, nm::kManager, "DeactivateConnection", {BusValue::Path(path)}};
}

std::uint32_t EndActiveLine(NetworkManagerBus& bus, const std::string& path) {
  const std::uint32_t error = ErrorOf(bus.AskForChange(QuestionOfEnd(path)));
  // It is told so of one that NetworkManager knows no more.
  return error == kInvalidParameter ? std::uint32_t{kRasSuccess} : error;
}

} // namespace quendra::platform::linux_
