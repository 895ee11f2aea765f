#include "forms/view/FocusOrder.h"

#include <algorithm>

namespace quendra::forms {

Control* NextFocus(const Form& form, const Control* focused, TabDirection direction) {
  std::vector<Control*> order = TabOrder(form);
  if (direction == TabDirection::Backwards) std::reverse(order.begin(), order.end());
  const auto place = std::find(order.begin(), order.end(), focused);
  if (place != order.end()) std::rotate(order.begin(), place + 1, order.end());
  const auto next = std::find_if(order.begin(), order.end(), [](const Control* control) {
    return control->TakesFocus() && control->IsUsable();
  });
  return next == order.end() ? nullptr : *next;
}

} // namespace quendra::forms
