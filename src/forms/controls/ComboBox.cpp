#include "forms/controls/ComboBox.h"

#include "runtime/Fault.h"

namespace quendra::forms {

void ComboBox::Clear() {
  if (items_.empty()) return;
  items_.clear();
  selected_ = -1;
  ReplaceText({});
  TellChanged(*this, Aspect::Items);
}

void ComboBox::AddItem(Text item) {
  items_.push_back(std::move(item));
  TellChanged(*this, Aspect::Items);
}

const Text& ComboBox::List(int index) const {
  if (index < 0 || index >= ListCount()) throw Fault(Fault::kSubscript);
  return items_[static_cast<std::size_t>(index)];
}

void ComboBox::SelectItem(int index) {
  const bool there = index >= 0 && index < ListCount();
  const int selected = there ? index : -1;
  if (selected != selected_) {
    selected_ = selected;
    ReplaceText(SelectedText());
    TellChanged(*this, Aspect::Selection);
  }
  if (there) Click();
}

void ComboBox::TextChanged() {
  if (std::exchange(selected_, -1) != -1) TellChanged(*this, Aspect::Selection);
}

Text ComboBox::SelectedText() const { return selected_ < 0 ? Text{} : List(selected_); }

} // namespace quendra::forms
