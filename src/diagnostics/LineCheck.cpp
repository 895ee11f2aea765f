#include "diagnostics/LineCheck.h"

#include "diagnostics/interfaces/CIpHelper.h"
#include "runtime/Integers.h"

namespace quendra::diagnostics {

namespace {

/// Octets that the interfaces had received and sent when the table was read.
std::int32_t Octets(const CIpHelper& helper) {
  return ToInt32(std::int64_t{helper.BytesReceived()} + helper.BytesSent());
}

} // namespace

Outcome LineCheck::Run(CheckRows& rows) {
  CIpHelper helper(ipHelper_, loop_);
  helper.Interfaces(); // the totals are those of this read, however long the readings go on
  double figure = -static_cast<double>(Octets(helper));
  TakeReadings(rows, system_, [&] { figure += Octets(helper); });
  figure /= 3;
  const std::int32_t last = helper.Interfaces()->Count();
  const auto speed = static_cast<std::int32_t>(helper.Interfaces()->item(last)->Speed);
  return ShowLoad(rows, Quotient(figure, speed / 3.0) / 100);
}

} // namespace quendra::diagnostics
