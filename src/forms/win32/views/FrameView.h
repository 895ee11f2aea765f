#pragma once

#include "forms/controls/Frame.h"
#include "forms/win32/views/WindowView.h"

namespace quendra::forms::win32 {

class FrameView : public WindowView {
 public:
  FrameView(ViewContext& context, Frame& frame, HWND parent);

  void Paint(Drawing& drawing) override;

 protected:
  void Apply(Aspect aspect) override;

 private:
  const Frame& TheFrame() const { return static_cast<const Frame&>(*TheControl()); }
  void PaintTitle(Drawing& drawing, TextView title, HFONT font) const;
};

} // namespace quendra::forms::win32
