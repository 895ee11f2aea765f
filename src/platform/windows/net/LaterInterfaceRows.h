#pragma once

#include "platform/windows/net/NetworkCards.h"

#include <array>
#include <map>
#include <span>

namespace quendra::platform::windows {

/// The interface table of Vista and later as XP tells it. Those list each filter of each card as an interface
/// of its own, so that the table passes what the program can read; their counters have run since the system's
/// start, past what the program can count; and they tell speeds that it can't reckon with.
class LaterInterfaceRows {
 public:
  /// Counters count from these rows on.
  explicit LaterInterfaceRows(std::span<const InterfaceRow> atStart);

  /// Those of the cards, and the loopback, by ascending index.
  std::vector<InterfaceRow> AsOnXp(std::span<const InterfaceRow> rows, std::span<const ListedCard> cards);

  static constexpr std::uint32_t kUnknownSpeed = 10'000'000;
  static constexpr std::uint32_t kMostSpeed = 0x7FFFFFFF;
  /// Whoever reads the table counts its bytes in 16 bits, and would end the program at the next row.
  static constexpr std::size_t kMostRows = 39;

 private:
  static constexpr std::array kCounters{
      InterfaceRow::kInOctets,    InterfaceRow::kInUnicast,  InterfaceRow::kInNonunicast,
      InterfaceRow::kInDiscards,  InterfaceRow::kInErrors,   InterfaceRow::kInUnknownProtocols,
      InterfaceRow::kOutOctets,   InterfaceRow::kOutUnicast, InterfaceRow::kOutNonunicast,
      InterfaceRow::kOutDiscards, InterfaceRow::kOutErrors};
  void CountFromStart(InterfaceRow& row);

  std::map<std::uint32_t, InterfaceRow> atStart_; ///< by index
};

} // namespace quendra::platform::windows
