#include "forms/qt/views/TimerView.h"

namespace quendra::forms::qt {

TimerView::TimerView(ViewContext& context, Timer& timer) : context_(context), timer_(&timer) {
  QObject::connect(&ticks_, &QTimer::timeout, &ticks_, [this] {
    context_.dispatcher.Dispatch([this] {
      if (timer_) timer_->Tick();
    });
  });
}

void TimerView::Release() {
  if (!timer_) return;
  timer_->Attach(nullptr);
  ControlGone();
}

void TimerView::ControlGone() {
  ticks_.stop();
  timer_ = nullptr;
}

void TimerView::Changed(Aspect aspect) {
  if (aspect != Aspect::All && aspect != Aspect::Timer && aspect != Aspect::Enabled) return;
  const int interval = timer_->Interval();
  if (!timer_->Enabled() || interval <= 0) return ticks_.stop();
  // Coarse timers may come a twentieth early or late, which a roll of 5 ms would show.
  ticks_.setTimerType(interval < 20 ? Qt::PreciseTimer : Qt::CoarseTimer);
  ticks_.start(interval);
}

} // namespace quendra::forms::qt
