#include "platform/windows/net/LaterInterfaceRows.h"

#include <algorithm>
#include <iterator>
#include <limits>

namespace quendra::platform::windows {

namespace {

std::uint32_t IndexOf(const InterfaceRow& row) { return row.Get(InterfaceRow::kIndex); }

bool IsListed(const InterfaceRow& row, std::span<const ListedCard> cards) {
  return row.Get(InterfaceRow::kType) == kLoopbackInterface ||
         std::ranges::find(cards, IndexOf(row), &ListedCard::index) != cards.end();
}

/// All bits are set for a speed that finds no room.
std::uint32_t ReckonableSpeed(std::uint32_t told) {
  constexpr std::uint32_t kNotTold = std::numeric_limits<std::uint32_t>::max();
  if (told == 0 || told == kNotTold) return LaterInterfaceRows::kUnknownSpeed;
  return std::min(told, LaterInterfaceRows::kMostSpeed);
}

} // namespace

LaterInterfaceRows::LaterInterfaceRows(std::span<const InterfaceRow> atStart) {
  for (const InterfaceRow& row : atStart) atStart_[IndexOf(row)] = row;
}

std::vector<InterfaceRow> LaterInterfaceRows::AsOnXp(std::span<const InterfaceRow> rows,
                                                     std::span<const ListedCard> cards) {
  std::vector<InterfaceRow> listed;
  std::ranges::copy_if(rows, std::back_inserter(listed),
                       [&](const InterfaceRow& row) { return IsListed(row, cards); });
  std::ranges::stable_sort(listed, {}, IndexOf);
  listed.resize(std::min(listed.size(), kMostRows));
  for (InterfaceRow& row : listed) {
    row.Set(InterfaceRow::kSpeed, ReckonableSpeed(row.Get(InterfaceRow::kSpeed)));
    CountFromStart(row);
  }
  return listed;
}

void LaterInterfaceRows::CountFromStart(InterfaceRow& row) {
  // One that came later began at 0, as did the counters of a card that was started again.
  const auto start = atStart_.find(IndexOf(row));
  if (start == atStart_.end()) return;
  for (const InterfaceRow::Field field : kCounters) {
    const std::uint32_t now = row.Get(field);
    // From here on it counts from there: it must not fall back when it passes its old start.
    if (now < start->second.Get(field)) start->second.Set(field, 0);
    row.Set(field, now - start->second.Get(field));
  }
}

} // namespace quendra::platform::windows
