#pragma once

#include "forms/controls/TextBox.h"
#include "forms/win32/views/EditField.h"
#include "forms/win32/views/FieldView.h"
#include "forms/win32/views/FixedFont.h"

namespace quendra::forms::win32 {

/// What text boxes of one line and of many have in common.
class TextFieldView : public FieldView {
 public:
  TextFieldView(ViewContext& context, TextBox& box, HWND parent);
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
  void ReadFrom(Direction direction);
  void Turn() override;

  EditField edit_;
  Direction reading_; ///< of the text
  Direction held_;    ///< of the window
  DWORD style_ = 0;
  DWORD extendedStyle_ = 0;
  mutable FixedFont fixed_;
};

} // namespace quendra::forms::win32
