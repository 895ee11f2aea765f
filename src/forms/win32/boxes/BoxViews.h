#pragma once

#include "forms/win32/boxes/BoxForm.h"
#include "forms/win32/views/ViewFactory.h"

namespace quendra::forms::win32 {

class BoxSignView : public WindowView {
 public:
  BoxSignView(ViewContext& context, BoxSignControl& control, HWND parent);
  void Paint(Drawing& drawing) override;
  BoxSign Sign() const { return sign_; }

 private:
  BoxSign sign_;
};

class BoxTextView : public WindowView {
 public:
  BoxTextView(ViewContext& context, BoxTextControl& control, HWND parent);
  void Paint(Drawing& drawing) override;

 protected:
  /// With its marks of direction, which assistive technology knows what to do with.
  void TellName() override;
};

/// The views of a box; of its button and its field they are those of every form.
MadeView MakeBoxView(ViewContext& context, Control& control, HWND parent);

} // namespace quendra::forms::win32
