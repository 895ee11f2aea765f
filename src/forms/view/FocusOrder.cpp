#include "forms/view/FocusOrder.h"

#include <algorithm>

namespace quendra::forms {

namespace {

bool Holds(const Geometry& outer, const Geometry& inner) {
  return outer.width > 0 && outer.height > 0 && outer.left <= inner.left && outer.top <= inner.top &&
         outer.left + outer.width >= inner.left + inner.width &&
         outer.top + outer.height >= inner.top + inner.height;
}

/// A panel that lies over the whole of a control hides it without making it invisible.
bool IsUnderPanel(const Control& control) {
  const auto& siblings = control.Parent()->Children();
  const auto inFront = std::find(siblings.begin(), siblings.end(), &control) + 1;
  return std::any_of(inFront, siblings.end(), [&](const Control* sibling) {
    return sibling->AsContainer() && sibling->Visible() && Holds(sibling->Position(), control.Position());
  });
}

bool CanBeSeen(const Control& control) {
  const Control* part = &control;
  while (part->Parent() && !IsUnderPanel(*part)) part = part->Parent();
  return !part->Parent();
}

} // namespace

Control* NextFocus(const Form& form, const Control* focused, TabDirection direction) {
  std::vector<Control*> order = TabOrder(form);
  if (direction == TabDirection::Backwards) std::reverse(order.begin(), order.end());
  const auto place = std::find(order.begin(), order.end(), focused);
  if (place != order.end()) std::rotate(order.begin(), place + 1, order.end());
  const auto next = std::find_if(order.begin(), order.end(), [](const Control* control) {
    return control->TakesFocus() && control->IsUsable() && CanBeSeen(*control);
  });
  return next == order.end() ? nullptr : *next;
}

} // namespace quendra::forms
