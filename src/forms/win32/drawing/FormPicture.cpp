#include "forms/win32/drawing/FormPicture.h"

#include "forms/view/paint/Raster.h"

namespace quendra::forms::win32 {

void FormPicture::Bring(Area part, Extent size, const Painter& paint) {
  const Area whole{{}, size};
  if (!surface_ || surface_->Size() != size) {
    surface_.reset();
    surface_.emplace(size);
    due_.Add(whole);
  }
  for (const Area& due : due_.TakeThoseIn(part)) {
    Drawing drawing(*surface_, {}, CommonPart(due, whole));
    if (drawing.Clip().extent.width > 0 && drawing.Clip().extent.height > 0) paint(drawing);
  }
}

} // namespace quendra::forms::win32
