#include "platform/simulated/remote_access/SimulatedRemoteAccess.h"

namespace quendra::platform::simulated {

std::vector<std::string> SimulatedRemoteAccess::EntryNames() const {
  std::vector<std::string> names;
  for (const SimulatedEntry& entry : book_.All()) names.push_back(entry.name);
  return names;
}

std::uint32_t SimulatedRemoteAccess::Enter(const std::string& operation) {
  const std::uint32_t refused = refusals_.Enter(operation);
  return IsThere ? refused : static_cast<std::uint32_t>(kRasManagerCannotStart);
}

std::uint32_t SimulatedRemoteAccess::Enter(const std::string& operation, const char* phoneBook) {
  PhoneBookOf[operation] = phoneBook ? std::optional<std::string>(phoneBook) : std::nullopt;
  return Enter(operation);
}

} // namespace quendra::platform::simulated
