#include "platform/windows/net/InterfaceCounters.h"

namespace quendra::platform::windows {

InterfaceCounters::InterfaceCounters(std::span<const InterfaceRow> atStart) {
  for (const InterfaceRow& row : atStart) atStart_[row.Get(InterfaceRow::kIndex)] = row;
}

void InterfaceCounters::CountFromStart(InterfaceRow& row) {
  // One that came later began at 0, as did the counters of a card that was started again.
  const auto start = atStart_.find(row.Get(InterfaceRow::kIndex));
  if (start == atStart_.end()) return;
  for (const InterfaceRow::Field field : kCounters) {
    const std::uint32_t now = row.Get(field);
    // From here on it counts from there: it must not fall back when it passes its old start.
    if (now < start->second.Get(field)) start->second.Set(field, 0);
    row.Set(field, now - start->second.Get(field));
  }
}

} // namespace quendra::platform::windows
