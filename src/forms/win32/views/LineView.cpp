#include "forms/win32/views/LineView.h"

namespace quendra::forms::win32 {

LineView::LineView(ViewContext& context, Line& line, HWND parent) : WindowView(context, line) {
  Create(parent);
}

std::optional<LRESULT> LineView::Answer(UINT message, WPARAM /*wParam*/, LPARAM /*lParam*/) {
  if (message == WM_NCHITTEST) return HTTRANSPARENT;
  return std::nullopt;
}

void LineView::PutInPlace() {
  const Area place = PlaceOf(BoundsOf(TheLine().Ends()), TheLine().Parent()->Position().width,
                             Context().scale, PlacingOf(TheLine()));
  MoveTo(place.GrownBy(StrokeRoom(TheLine().BorderWidth())));
}

void LineView::Paint(Drawing& drawing) {
  if (!TheControl()) return;
  const int width = TheLine().BorderWidth();
  const Area box = Area{{}, WindowPlace().extent}.GrownBy(-StrokeRoom(width));
  const auto [left, top] = box.corner;
  const Colour ink = TheLine().ForeColour();
  if (StrokeOf(TheLine().Ends(), PlacingOf(TheLine())) == Stroke::Rising)
    drawing.Line({left, box.Bottom()}, {box.Right(), top}, ink, width);
  else
    drawing.Line({left, top}, {box.Right(), box.Bottom()}, ink, width);
}

} // namespace quendra::forms::win32
