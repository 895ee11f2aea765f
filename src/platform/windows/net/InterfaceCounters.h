#pragma once

#include "platform/net/InterfaceRow.h"

#include <array>
#include <map>
#include <span>

namespace quendra::platform::windows {

/// The counters of the interfaces, counted from the program's start. The system's own have run since it
/// started, and the program can't count past 2,147,483,647: on a machine that has carried that much it would
/// end at its first look.
class InterfaceCounters {
 public:
  explicit InterfaceCounters(std::span<const InterfaceRow> atStart);

  void CountFromStart(InterfaceRow& row);

 private:
  static bool BeganAnew(const InterfaceRow& now, const InterfaceRow& start);

  static constexpr std::array kCounters{
      InterfaceRow::kInOctets,    InterfaceRow::kInUnicast,  InterfaceRow::kInNonunicast,
      InterfaceRow::kInDiscards,  InterfaceRow::kInErrors,   InterfaceRow::kInUnknownProtocols,
      InterfaceRow::kOutOctets,   InterfaceRow::kOutUnicast, InterfaceRow::kOutNonunicast,
      InterfaceRow::kOutDiscards, InterfaceRow::kOutErrors};

  std::map<std::uint32_t, InterfaceRow> atStart_; ///< by index
};

} // namespace quendra::platform::windows
