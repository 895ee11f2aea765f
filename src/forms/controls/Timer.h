#pragma once

#include "forms/controls/Control.h"

namespace quendra::forms {

/// Calls Tick every Interval milliseconds while it is enabled and its form is loaded. An interval of 0 never
/// ticks.
class Timer : public Control {
 public:
  Timer(Container& parent, Text name, int interval, bool enabled) : Control(parent, std::move(name)) {
    Interval = interval;
    Enabled = enabled;
  }
  void Accept(ControlVisitor& visitor) override { visitor.Visit(*this); }
  Property<int, Aspect::Timer> Interval{*this, 0};
  Event<> Tick;
};

} // namespace quendra::forms
