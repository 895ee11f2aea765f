#pragma once

#include "platform/windows/net/NetworkCards.h"

#include <span>

namespace quendra::platform::windows {

// The interface table of Vista and later. Those list each filter of each card as an interface of its own, so
// that the table passes what the program can read, and tell speeds that it can't reckon with.

inline constexpr std::uint32_t kUnknownSpeed = 10'000'000;
inline constexpr std::uint32_t kMostSpeed = 0x7FFFFFFF;
/// Whoever reads the table counts its bytes in 16 bits, and would end the program at the next row.
inline constexpr std::size_t kMostInterfaceRows = 39;

/// As XP tells it: the rows of the cards, and the loopback, by ascending index.
std::vector<InterfaceRow> AsOnXp(std::span<const InterfaceRow> rows, std::span<const ListedCard> cards);

} // namespace quendra::platform::windows
