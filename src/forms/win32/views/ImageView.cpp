#include "forms/win32/views/ImageView.h"

namespace quendra::forms::win32 {

ImageView::ImageView(ViewContext& context, Image& image, HWND parent) : WindowView(context, image) {
  Create(parent);
}

void ImageView::Paint(Drawing& drawing) {
  if (!TheControl()) return;
  const Area whole{{}, WindowPlace().extent};
  const Picture& contents = static_cast<const Image&>(*TheControl()).Contents();
  drawing.Picture(Context().pictures.BitmapOf(contents, whole.extent), whole);
}

} // namespace quendra::forms::win32
