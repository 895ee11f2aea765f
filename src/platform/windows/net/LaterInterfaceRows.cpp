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
  if (told == 0 || told == kNotTold) return kUnknownSpeed;
  return std::min(told, kMostSpeed);
}

} // namespace

std::vector<InterfaceRow> AsOnXp(std::span<const InterfaceRow> rows, std::span<const ListedCard> cards) {
  std::vector<InterfaceRow> listed;
  std::ranges::copy_if(rows, std::back_inserter(listed),
                       [&](const InterfaceRow& row) { return IsListed(row, cards); });
  std::ranges::stable_sort(listed, {}, IndexOf);
  listed.resize(std::min(listed.size(), kMostInterfaceRows));
  for (InterfaceRow& row : listed)
    row.Set(InterfaceRow::kSpeed, ReckonableSpeed(row.Get(InterfaceRow::kSpeed)));
  return listed;
}

} // namespace quendra::platform::windows
