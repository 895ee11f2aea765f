#include "forms/controls/ListBox.h"

#include "runtime/Fault.h"

namespace quendra::forms {

void ListBox::Clear() {
  if (items_.empty()) return;
  items_.clear();
  selected_ = -1;
  TellChanged(*this, Aspect::Items);
}

void ListBox::AddItem(Text item) {
  items_.push_back(std::move(item));
  TellChanged(*this, Aspect::Items);
}

const Text& ListBox::List(int index) const {
  if (!Has(index)) throw Fault(Fault::kSubscript);
  return items_[static_cast<std::size_t>(index)];
}

void ListBox::SelectItem(int index) {
  const int selected = Has(index) ? index : -1;
  if (selected != selected_) {
    selected_ = selected;
    TellChanged(*this, Aspect::Selection);
  }
  if (selected != -1) Click();
}

void ListBox::Selected(int index) {
  if (Has(index)) selected_ = index;
}

} // namespace quendra::forms
