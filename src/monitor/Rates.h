#pragma once

#include "forms/controls/ListView.h"

namespace quendra::monitor {

/// Sums of the rates of all rows in one pass, in KB/s.
struct TrafficSums {
  double upload = 0;
  double download = 0;
};

/// Puts the rates since the previous pass, `seconds` ago, into the row's rate cells, adds them to the sums
/// and keeps the totals for the next pass. A rate that isn't above 0 leaves its cell empty.
void UpdateRates(forms::ListRow& row, double seconds, TrafficSums& sums);

/// What a meter shows for a sum: "0.0" when it isn't above 0.
Text MeterText(double sum);

} // namespace quendra::monitor
