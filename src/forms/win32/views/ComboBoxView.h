#pragma once

#include "forms/controls/ComboBox.h"
#include "forms/win32/views/EditField.h"
#include "forms/win32/views/FieldView.h"

namespace quendra::forms::win32 {

/// A list that hangs down. One with free text has an EDIT window of ours over it: the system's own could not
/// turn to the direction of what stands in it.
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
  void TellName() override;
  HWND KeyWindow() const override;
  void FocusCame() override;
  Area Room(Extent field) const override;
  void Arrange() override;
  void Apply(Aspect aspect) override;

 private:
  ComboBox& Combo() const { return static_cast<ComboBox&>(*TheControl()); }
  void MakeEdit();
  void ReadFrom(Direction direction);
  void Turn() override;
  std::optional<LRESULT> AnswerEdit(UINT message, WPARAM wParam, LPARAM lParam);
  void FillItems() const;
  void ShowSelection();
  bool IsDropped() const { return Inner().Send(CB_GETDROPPEDSTATE) != 0; }
  LRESULT PressClosed(UINT message, WPARAM wParam, LPARAM lParam);
  void Drop();
  bool PassesToList(UINT message, WPARAM wParam, LPARAM lParam);
  int RowHeight() const;
  /// The user has chosen: told once the system's window is through with it.
  void Choose();
  LRESULT TellChoice();
  void PaintClosed() const;
  void PlaceEdit() const;
  Area TextRoom(Extent inside) const;

  std::optional<EditField> field_; ///< of a list with free text
  std::unique_ptr<InnerWindow> editName_;
  std::unique_ptr<InnerWindow> edit_;
  Direction reading_; ///< of the text
  Direction held_;    ///< of the window
  bool showing_ = false;
  bool chosen_ = false; ///< an item of the list that hangs down, not yet closed
  bool telling_ = false;
};

} // namespace quendra::forms::win32
