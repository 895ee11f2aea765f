#pragma once

#include "forms/controls/TextEntry.h"

namespace quendra::forms {

/// A drop-down list of texts with one selected item or none, and with a field above it that holds the
/// selected item's text. Items are numbered from 0.
class ComboBox : public Control, public TextEntry {
 public:
  ComboBox(Container& parent, Text name)
      : Control(parent, std::move(name)), TextEntry(*static_cast<Control*>(this)) {}
  void Accept(ControlVisitor& visitor) override { visitor.Visit(*this); }
  bool TakesFocus() const override { return true; }

  /// The user, and logic, may put any text into the field. Then no item is the selected one. Read when the
  /// form is loaded.
  bool FreeText = false;

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

 protected:
  bool TakesText() const override { return FreeText; }
  void TextChanged() override;

 private:
  std::vector<Text> items_;
  int selected_ = -1;
};

} // namespace quendra::forms
