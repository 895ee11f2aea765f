#pragma once

#include "forms/win32/views/TextFieldView.h"

namespace quendra::forms::win32 {

/// A text box of many lines. On which side all begin is decided by the first letter of them all; so is the
/// direction of lines that can be edited, where each of the others has its own.
class TextAreaView : public TextFieldView {
 public:
  TextAreaView(ViewContext& context, TextBox& box, HWND parent);

 protected:
  Area Room(Extent field) const override;
  void Apply(Aspect aspect) override;
};

} // namespace quendra::forms::win32
