#pragma once

#include "forms/controls/ComboBox.h"
#include "forms/win32/views/EditField.h"
#include "forms/win32/views/FieldView.h"

namespace quendra::forms::win32 {

class ComboBoxView : public FieldView {
 public:
  ComboBoxView(ViewContext& context, ComboBox& combo, HWND parent);
  void ControlGone() override;
  KeyUse Use(const KeyPress& key) override;
  Text TipAt(HWND window, Spot place) const override;

 protected:
  std::optional<LRESULT> Answer(UINT message, WPARAM wParam, LPARAM lParam) override;
  std::optional<LRESULT> AnswerInner(UINT message, WPARAM wParam, LPARAM lParam) override;
  void Notified(int code) override;
  HWND KeyWindow() const override;
  void FocusCame() override;
  Area Room(Extent field) const override;
  void Arrange() override;
  void Apply(Aspect aspect) override;

 private:
  ComboBox& Combo() const { return static_cast<ComboBox&>(*TheControl()); }
  void TakeFreeText();
  std::optional<LRESULT> AnswerEdit(UINT message, WPARAM wParam, LPARAM lParam);
  void FillItems() const;
  void ShowSelection();
  bool IsDropped() const { return Inner().Send(CB_GETDROPPEDSTATE) != 0; }
  void Drop();
  int RowHeight() const;
  /// The user has chosen: told once the system's window is through with it.
  void Choose();
  LRESULT TellChoice();
  void PaintClosed() const;
  void PlaceEdit() const;
  Area TextRoom(Extent inside) const;

  std::optional<InnerWindow> edit_;
  std::optional<EditField> field_; ///< of a list with free text
  bool showing_ = false;
  bool chosen_ = false; ///< an item of the list that hangs down, not yet closed
  bool telling_ = false;
};

} // namespace quendra::forms::win32
