#include "platform/simulated/net/SimulatedLookUps.h"

#include "platform/net/AddressList.h"
#include "platform/simulated/SimulatedCore.h"

namespace quendra::platform::simulated {

LookUpHandle SimulatedLookUps::Start(WindowHandle window, std::uint32_t message, const std::string& name,
                                     std::span<std::uint8_t> buffer) {
  const LookUpHandle lookUp(++lastLookUp_);
  const std::string cut = CutText(name);
  underWay_[lookUp] = {window, message, cut, buffer};
  if (!silentNames_.contains(cut)) messages_.Later([this, lookUp] { Resolve(lookUp); });
  return lookUp;
}

void SimulatedLookUps::Resolve(LookUpHandle lookUp) {
  const auto found = underWay_.find(lookUp);
  if (found == underWay_.end()) return;
  const LookUp asked = found->second;
  underWay_.erase(found);
  messages_.Post(asked.window, asked.message, lookUp.Value(), SocketMessageWord(0, Answer(asked)));
}

std::int32_t SimulatedLookUps::Answer(const LookUp& asked) {
  const auto addresses = hostNames_.gethostbyname(asked.name);
  if (const auto failing = failingNames_.find(asked.name); failing != failingNames_.end())
    return failing->second;
  if (!addresses) return hostNames_.LastError();
  PutAddressList(asked.buffer, *addresses);
  return 0;
}

} // namespace quendra::platform::simulated
