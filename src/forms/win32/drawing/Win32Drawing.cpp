#include "forms/win32/drawing/Win32Drawing.h"

#include "forms/view/DrawingUnits.h"
#include "forms/view/VisibleText.h"
#include "forms/view/paint/Stretch.h"
#include "forms/view/png/PngReader.h"

namespace quendra::forms::win32 {

namespace {

PictureBoxView* ViewOf(const PictureBox& box) { return static_cast<PictureBoxView*>(box.View()); }

/// Letters on a surface, white on black, as a colour of which each pixel gets as much as it is light.
void BlendLetters(Raster& raster, Surface& letters, Spot corner, Colour colour) {
  const auto pixels = letters.Pixels();
  const Area part = CommonPart({corner, letters.Size()}, raster.Clip());
  for (int y = part.corner.top; y < part.Bottom(); ++y)
    for (int x = part.corner.left; x < part.Right(); ++x) {
      const std::uint32_t light =
          pixels[static_cast<std::size_t>((y - corner.top) * letters.Size().width + (x - corner.left))];
      const unsigned covered = ((light >> 16 & 0xFF) + 2 * (light >> 8 & 0xFF) + (light & 0xFF)) / 4;
      if (covered) raster.Blend(x, y, ArgbOf(colour), covered);
    }
}

} // namespace

int Win32Drawing::WidthInPixels(const PictureBox& box, TextView text) const {
  return MeasureText(VisibleText(text), FontOf(box)).width;
}

int Win32Drawing::LineHeight(const PictureBox& box) const { return fonts_.LineHeight(FontOf(box)); }

void Win32Drawing::DropDrawings(PictureBox& box) {
  PictureBoxView* view = ViewOf(box);
  if (!view) return;
  view->ClearDrawings();
  view->Invalidate();
}

void Win32Drawing::FillBox(PictureBox& box, int x1, int y1, int x2, int y2, Colour colour) {
  if (PictureBoxView* view = ViewOf(box))
    Raster(view->Drawings()).Fill(DrawingUnits(box, scale_).FilledBox(x1, y1, x2, y2), colour);
}

void Win32Drawing::PrintLine(PictureBox& box, TextView text, const Area& place) {
  PictureBoxView* view = ViewOf(box);
  if (!view) return;
  Raster raster(view->Drawings());
  // Letters may reach out of their line, and a line out of its box.
  const Area around{{0, place.corner.top - place.extent.height},
                    {raster.Clip().extent.width, 3 * place.extent.height}};
  const Area part = CommonPart(around, raster.Clip());
  if (part.extent.width == 0 || part.extent.height == 0) return;
  Surface letters(part.extent);
  TextSetting setting;
  setting.direction = DirectionOf(box.OwnerForm());
  setting.side = SideOf(Alignment::Leading, setting.direction);
  setting.fromTop = true;
  setting.cuts = false;
  Drawing(letters, {-part.corner.left, -part.corner.top}, part)
      .Text(VisibleText(text), place, FontOf(box), kWhite, setting);
  BlendLetters(raster, letters, part.corner, box.ForeColour());
}

void Win32Drawing::BitBlt(PictureBox& target, int x, int y, int width, int height, const PictureBox& source,
                          int sourceX, int sourceY) {
  PictureBoxView* to = ViewOf(target);
  const PictureBoxView* from = ViewOf(source);
  if (!to || !from || to == from) return;
  Bitmap& drawings = to->Drawings();
  Raster raster(drawings.argb, {drawings.width, drawings.height}, {}, {{x, y}, {width, height}},
                Ground::SeeThrough);
  // What lies outside the source has nothing to give: its layers end with it.
  raster.Put(from->Layers(Ground::Opaque), {x - sourceX, y - sourceY});
}

void Win32Drawing::Refresh(PictureBox& box) {
  if (PictureBoxView* view = ViewOf(box)) view->Invalidate();
}

bool Win32Drawing::DrawIconEx(PictureBox& box, int x, int y, const std::vector<std::uint8_t>& image,
                              int width, int height) {
  PictureBoxView* view = ViewOf(box);
  constexpr int kLargestSide = 2048;
  if (!view || width <= 0 || height <= 0 || width > kLargestSide || height > kLargestSide) return false;
  auto icon = ReadPng(image);
  if (!icon) return false;
  const Extent size = FittedInto({icon->width, icon->height}, {width, height});
  if (size != Extent{icon->width, icon->height}) *icon = Stretched(*icon, size);
  const DrawingUnits units(box, scale_);
  Raster(view->Drawings())
      .Put(*icon,
           {units.PixelsX(x) + (width - size.width) / 2, units.PixelsY(y) + (height - size.height) / 2});
  return true;
}

Picture Win32Drawing::ImageOf(const PictureBox& box) const {
  const PictureBoxView* view = ViewOf(box);
  // Without the ground colour: an icon drawn in a box then sits well on a selected row, too.
  return view ? Picture::Of(view->Layers(Ground::SeeThrough)) : box.Contents();
}

} // namespace quendra::forms::win32
