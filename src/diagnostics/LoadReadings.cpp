#include "diagnostics/LoadReadings.h"

#include "runtime/Format.h"

namespace quendra::diagnostics {

namespace {

constexpr std::uint32_t kPause = 200;
constexpr double kMostLoad = 40;

} // namespace

void TakeReadings(CheckRows& rows, platform::System& system, const std::function<void()>& takeReading) {
  for (int i = 1; i <= kReadings; ++i) {
    takeReading();
    if (i % 2 == 0) {
      rows.AppendBar();
      rows.Repaint();
    }
    system.Sleep(kPause);
  }
}

Outcome ShowLoad(CheckRows& rows, double load) {
  rows.SetDetail(Format(load, u"##0.00") + u"%");
  return load > kMostLoad ? Outcome::Failed : Outcome::Passed;
}

} // namespace quendra::diagnostics
