#pragma once

#include "forms/win32/views/TextFieldView.h"

namespace quendra::forms::win32 {

/// A text box of one line.
class TextLineView : public TextFieldView {
 public:
  TextLineView(ViewContext& context, TextBox& box, HWND parent);

 protected:
  Area Room(Extent field) const override;
  void Apply(Aspect aspect) override;
};

} // namespace quendra::forms::win32
