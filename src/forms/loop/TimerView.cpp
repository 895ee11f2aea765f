#include "forms/loop/TimerView.h"

namespace quendra::forms {

void TimerView::Changed(Aspect aspect) {
  if (aspect != Aspect::All && aspect != Aspect::Timer && aspect != Aspect::Enabled) return;
  ticks_.reset();
  if (!timer_->Enabled() || timer_->Interval() <= 0) return;
  ticks_ = start_(timer_->Interval(), [timer = timer_] { timer->Tick(); });
}

void TimerView::Release() {
  if (!timer_) return;
  timer_->Attach(nullptr);
  ControlGone();
}

void TimerView::ControlGone() {
  ticks_.reset();
  timer_ = nullptr;
}

} // namespace quendra::forms
