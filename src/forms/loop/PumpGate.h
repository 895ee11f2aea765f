#pragma once

#include <cstdint>
#include <utility>

namespace quendra::forms {

/// Tells when a pump can matter. Handlers yield after every captured frame, some hundred thousand times a
/// second, while asking a toolkit costs microseconds even when nothing waits. So work posted from within the
/// program is seen by a flag, and what comes from outside (the user, descriptors, timers) is looked for when
/// a coarse clock has moved on, every few milliseconds: reading that clock costs some nanoseconds, and nobody
/// sees the delay.
///
/// `Clock` is called for the time of a clock that moves every few milliseconds and is cheap to read.
template <typename Clock> class PumpGate {
 public:
  explicit PumpGate(Clock now = {}) : now_(std::move(now)) {}

  bool IsDue(bool workWaits) const { return workWaits || now_() != lastPump_; }
  /// Everything that waited has been handled.
  void Pumped() { lastPump_ = now_(); }

 private:
  Clock now_;
  std::int64_t lastPump_ = 0;
};

} // namespace quendra::forms
