#pragma once

#include "forms/controls/Image.h"
#include "forms/win32/views/WindowView.h"

namespace quendra::forms::win32 {

class ImageView : public WindowView {
 public:
  ImageView(ViewContext& context, Image& image, HWND parent);

  void Paint(Drawing& drawing) override;
};

} // namespace quendra::forms::win32
