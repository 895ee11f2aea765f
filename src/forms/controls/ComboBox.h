#pragma once

#include "forms/controls/Control.h"

namespace quendra::forms {

/// A drop-down list of texts with one selected item or none. Items are numbered from 0.
class ComboBox : public Control {
 public:
  using Control::Control;
  void Accept(ControlVisitor& visitor) override { visitor.Visit(*this); }
  bool TakesFocus() const override { return true; }

  void Clear();
  void AddItem(Text item);
  int ListCount() const { return static_cast<int>(items_.size()); }
  /// The text of an item. Fault 9 for an index outside the list.
  const Text& List(int index) const;

  /// The selected item, -1 for none.
  int ListIndex() const { return selected_; }
  /// Selects and raises Click, also when the item was the selected one already. An index that the list lacks
  /// selects nothing and raises nothing.
  void SelectItem(int index);
  /// The selected item's text, empty for none.
  Text SelectedText() const;

 private:
  std::vector<Text> items_;
  int selected_ = -1;
};

} // namespace quendra::forms
