#include "forms/win32/views/FrameView.h"

#include "forms/view/FrameLook.h"
#include "forms/view/Palette.h"
#include "forms/view/VisibleText.h"

namespace quendra::forms::win32 {

FrameView::FrameView(ViewContext& context, Frame& frame, HWND parent) : WindowView(context, frame) {
  Create(parent);
}

void FrameView::Apply(Aspect aspect) {
  if (Concerns(aspect, Aspect::Geometry)) PlaceChildren(TheFrame());
}

void FrameView::Paint(Drawing& drawing) {
  if (!TheControl()) return;
  const Text title = TitleOf(TheFrame());
  const HFONT font = Context().fonts.FontOf(TheFrame().TextFont(), Context().scale);
  const bool border = TheFrame().Border();
  RoundBox box = RoundBox::Of({{}, WindowPlace().extent}, FrameCorner(Context().scale), border ? 0.5 : 0);
  box.top += BorderTop(title, Context().fonts.LineHeight(font));
  drawing.Fill(box, TheFrame().BackColour());
  if (border) drawing.Stroke(box, Palette::Border);
  if (!title.empty()) PaintTitle(drawing, title, font);
}

void FrameView::PaintTitle(Drawing& drawing, TextView title, HFONT font) const {
  const Extent letters{MeasureText(title, font).width, Context().fonts.LineHeight(font)};
  const Area place = TitlePlace(letters, WindowPlace().extent.width, Context().scale, ReadingDirection());
  drawing.Fill(place, TheFrame().BackColour());
  TextSetting setting;
  setting.direction = DirectionOf(title);
  setting.side = Side::Middle;
  setting.cuts = false;
  drawing.Text(title, place, font, TitleInk(TheFrame()), setting);
}

} // namespace quendra::forms::win32
