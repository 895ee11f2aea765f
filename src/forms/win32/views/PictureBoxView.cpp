#include "forms/win32/views/PictureBoxView.h"

#include "forms/view/Palette.h"

#include <algorithm>

namespace quendra::forms::win32 {

namespace {

Bitmap SeeThrough(Extent extent) {
  return {extent.width, extent.height,
          std::vector<std::uint32_t>(static_cast<std::size_t>(extent.width) *
                                     static_cast<std::size_t>(extent.height))};
}

} // namespace

PictureBoxView::PictureBoxView(ViewContext& context, PictureBox& box, HWND parent)
    : WindowView(context, box) {
  Create(parent);
}

Extent PictureBoxView::LaidOutSize() const {
  if (!TheControl()) return {1, 1};
  const Extent extent = ExtentOf(Box().Position(), Context().scale.Unzoomed());
  return {std::max(1, extent.width), std::max(1, extent.height)};
}

Bitmap& PictureBoxView::Drawings() {
  if (drawings_.argb.empty()) drawings_ = SeeThrough(LaidOutSize());
  return drawings_;
}

void PictureBoxView::Apply(Aspect aspect) {
  // A new size or picture drops the drawings, as the ground that they were made for is gone.
  if (Concerns(aspect, Aspect::Picture) || Extent{drawings_.width, drawings_.height} != LaidOutSize())
    ClearDrawings();
  if (Concerns(aspect, Aspect::Geometry)) PlaceChildren(Box());
}

Bitmap PictureBoxView::Layers(Ground ground) const {
  const Extent size = LaidOutSize();
  Bitmap layers = SeeThrough(size);
  Raster raster(layers);
  if (ground == Ground::Opaque) raster.Fill({{}, size}, Box().BackColour());
  raster.Put(Context().pictures.BitmapOf(Box().Contents(), size), {});
  raster.Put(drawings_, {});
  return layers;
}

void PictureBoxView::Paint(Drawing& drawing) {
  if (!TheControl()) return;
  const Area whole{{}, WindowPlace().extent};
  drawing.Fill(whole, Box().BackColour());
  drawing.Picture(Context().pictures.BitmapOf(Box().Contents(), whole.extent), whole);
  drawing.Picture(drawings_, whole);
  if (!Box().Border()) return;
  const Spot last{whole.Right() - 1, whole.Bottom() - 1};
  drawing.Line({}, {last.left, 0}, Palette::Border, 1);
  drawing.Line({0, last.top}, last, Palette::Border, 1);
  drawing.Line({}, {0, last.top}, Palette::Border, 1);
  drawing.Line({last.left, 0}, last, Palette::Border, 1);
}

} // namespace quendra::forms::win32
