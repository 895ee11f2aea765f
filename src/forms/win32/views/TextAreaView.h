#pragma once

#include "forms/win32/views/TextFieldView.h"

namespace quendra::forms::win32 {

/// A text box of many lines. All are read in the direction of their first letter.
class TextAreaView : public TextFieldView {
 public:
  TextAreaView(ViewContext& context, TextBox& box, HWND parent);

 protected:
  Area Room(Extent field) const override;
  void Apply(Aspect aspect) override;
};

} // namespace quendra::forms::win32
