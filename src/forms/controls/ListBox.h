#pragma once

#include "forms/controls/Control.h"

namespace quendra::forms {

/// A list of texts with one selected item or none, all in sight as far as there is room. Items are numbered
/// from 0.
class ListBox : public Control {
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

  /// What assistive technology says of the list. Empty where a label before it says that.
  Text Description;

  // What views tell.

  /// The user's mouse has selected the item, as the view shows already; the click itself follows.
  void Selected(int index);

 private:
  bool Has(int index) const { return index >= 0 && index < ListCount(); }

  std::vector<Text> items_;
  int selected_ = -1;
};

} // namespace quendra::forms
