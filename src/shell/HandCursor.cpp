#include "shell/HandCursor.h"

namespace quendra::shell {

void HandCursor::ShowOverButtons(const forms::Container& container) {
  for (forms::Control* child : container.Children()) {
    if (const auto* inner = dynamic_cast<const forms::Container*>(child)) ShowOverButtons(*inner);
    auto* label = dynamic_cast<forms::Label*>(child);
    if (label && label->Style() != forms::Label::Look::Plain && !label->MouseMove)
      label->MouseMove = [this](int, int, int, int) { Show(); };
  }
}

} // namespace quendra::shell
