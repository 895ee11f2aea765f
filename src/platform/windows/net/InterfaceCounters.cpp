#include "platform/windows/net/InterfaceCounters.h"

#include <algorithm>

namespace quendra::platform::windows {

InterfaceCounters::InterfaceCounters(std::span<const InterfaceRow> atStart) {
  for (const InterfaceRow& row : atStart) atStart_[row.Get(InterfaceRow::kIndex)] = row;
}

void InterfaceCounters::CountFromStart(InterfaceRow& row) {
  // One that came later began at 0, as did the counters of a card that was started again.
  const auto start = atStart_.find(row.Get(InterfaceRow::kIndex));
  if (start == atStart_.end()) return;
  // From here on it counts from 0: it must not fall back when it passes its old start.
  if (BeganAnew(row, start->second)) start->second = InterfaceRow();
  for (const InterfaceRow::Field field : kCounters) row.Set(field, row.Get(field) - start->second.Get(field));
}

// A single one that is less has passed its 32 bits, and the difference still holds.
bool InterfaceCounters::BeganAnew(const InterfaceRow& now, const InterfaceRow& start) {
  const auto differs = [&](InterfaceRow::Field field) { return now.Get(field) != start.Get(field); };
  return std::ranges::any_of(kCounters, differs) &&
         std::ranges::all_of(kCounters, [&](auto field) { return now.Get(field) <= start.Get(field); });
}

} // namespace quendra::platform::windows
