#pragma once

#include "forms/qt/views/WidgetView.h"

#include <QTimer>

namespace quendra::forms::qt {

class TimerView : public View {
 public:
  TimerView(ViewContext& context, Timer& timer);

  void Changed(Aspect aspect) override;
  void Release() override;
  void ControlGone() override;

 private:
  ViewContext& context_;
  Timer* timer_;
  QTimer ticks_;
};

} // namespace quendra::forms::qt
