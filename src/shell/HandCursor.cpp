#include "shell/HandCursor.h"

#include "forms/controls/Label.h"

namespace quendra::shell {

void HandCursor::ShowOverButtons(const forms::Container& container) {
  for (forms::Control* control : forms::ControlsIn(container)) {
    auto* label = dynamic_cast<forms::Label*>(control);
    if (label && label->Style() != forms::Label::Look::Plain && !label->MouseMove)
      label->MouseMove = [this](int, int, int, int) { Show(); };
  }
}

} // namespace quendra::shell
