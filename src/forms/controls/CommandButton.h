#pragma once

#include "forms/controls/Label.h"

namespace quendra::forms {

/// A button: a label that has its face from the start, with a handler or without.
class CommandButton : public Label {
 public:
  CommandButton(Container& parent, Text name) : Label(parent, std::move(name)) {
    Style = Look::Button;
    Align = Alignment::Centre;
  }
};

} // namespace quendra::forms
