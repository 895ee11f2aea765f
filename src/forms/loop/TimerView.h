#pragma once

#include "forms/controls/Timer.h"
#include "forms/view/View.h"

#include <functional>
#include <memory>

namespace quendra::forms {

/// Starts a timer of the loop: its milliseconds and what each tick runs. It stops when what is given goes,
/// which may be in its own tick.
using TimerStarter = std::function<std::shared_ptr<void>(int, std::function<void()>)>;

/// Keeps a timer of the loop in step with the Interval and Enabled of a Timer control.
class TimerView : public View {
 public:
  TimerView(Timer& timer, TimerStarter start) : timer_(&timer), start_(std::move(start)) {}

  void Changed(Aspect aspect) override;
  void Release() override;
  void ControlGone() override;

 private:
  Timer* timer_;
  TimerStarter start_;
  std::shared_ptr<void> ticks_;
};

} // namespace quendra::forms
