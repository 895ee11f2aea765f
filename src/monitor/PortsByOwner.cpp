#include "monitor/PortsByOwner.h"

namespace quendra::monitor {

void PortsByOwner::Add(std::uint32_t processId, std::uint32_t port) {
  texts_[processId] += u"." + DecimalText(port);
}

Text PortsByOwner::TextOf(std::uint32_t processId) const {
  const auto found = texts_.find(processId);
  return found == texts_.end() ? Text() : found->second + u".";
}

} // namespace quendra::monitor
