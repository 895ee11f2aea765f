#pragma once

#include "forms/controls/TextBox.h"
#include "forms/win32/views/EditField.h"
#include "forms/win32/views/FieldView.h"
#include "forms/win32/views/FixedFont.h"

namespace quendra::forms::win32 {

/// What text boxes of one line and of many have in common.
class TextFieldView : public FieldView {
 public:
  TextFieldView(ViewContext& context, TextBox& box, HWND parent)
      : FieldView(context, box, parent), edit_(*this, box, box.MultiLine) {}
  void ControlGone() override;

 protected:
  /// Makes the window, in the constructor of the kind.
  void HoldEdit(DWORD style, DWORD extendedStyle = 0);
  std::optional<LRESULT> AnswerInner(UINT message, WPARAM wParam, LPARAM lParam) override;
  void Notified(int code) override;
  void FocusCame() override;
  void Apply(Aspect aspect) override;
  bool IsReadOnly() const override { return TheControl() && Box().ReadOnly(); }
  HFONT Letters() const override;
  const TextBox& Box() const { return static_cast<const TextBox&>(*TheControl()); }

 private:
  EditField edit_;
  mutable FixedFont fixed_;
};

} // namespace quendra::forms::win32
