#include "forms/view/Palette.h"
#include "forms/win32/views/list/ListViewView.h"

#include <algorithm>
#include <utility>

// How a list's windows are drawn: a row or the headers at once, put together before they are shown.

namespace quendra::forms::win32 {

namespace {

/// A paint of the system's, from its begin to its end, in the places of the screen: the system would show
/// what goes into a mirrored window as in a mirror.
class PlainPainting {
 public:
  explicit PlainPainting(HWND window) : window_(window), device_(::BeginPaint(window, &paint_)) {
    ::SetLayout(device_, 0);
  }
  ~PlainPainting() { ::EndPaint(window_, &paint_); }
  PlainPainting(const PlainPainting&) = delete;
  PlainPainting& operator=(const PlainPainting&) = delete;

  const RECT& Due() const { return paint_.rcPaint; }
  /// Whether any part of a place is due.
  bool IsDue(Area place) const {
    const RECT line{place.corner.left, place.corner.top, place.Right(), place.Bottom()};
    return ::RectVisible(device_, &line) != 0;
  }
  void Show(const Surface& surface, int top) const {
    ::SetViewportOrgEx(device_, 0, top, nullptr);
    surface.ShowOn(device_, {{}, surface.Size()});
    ::SetViewportOrgEx(device_, 0, 0, nullptr);
  }

 private:
  HWND window_;
  PAINTSTRUCT paint_{};
  HDC device_;
};

LONG LeftOnScreen(HWND window) {
  RECT inside{};
  ::GetClientRect(window, &inside);
  ::MapWindowPoints(window, nullptr, reinterpret_cast<POINT*>(&inside), 2);
  return inside.left;
}

} // namespace

void ListViewView::RedrawIfScrolled() {
  const Spot now{::GetScrollPos(Inner().Window(), SB_HORZ), TopRow()};
  if (std::exchange(scrolled_, now) != now) Inner().Redraw();
}

void ListViewView::PaintRows() {
  const PlainPainting painting(Inner().Window());
  const int height = painter_.RowHeight();
  const int header = painter_.HeaderHeight();
  const Area place{{}, {Inner().Inside().width, height}};
  if (!canvas_ || canvas_->Size() != place.extent) canvas_.emplace(place.extent);
  const auto cells = columns_->CellsOf(static_cast<int>(List().Columns().size()), height, ReadingDirection());
  const int topRow = TopRow();
  const int from = std::max(0, static_cast<int>(painting.Due().top) - header) / height;
  for (int line = from; header + line * height < painting.Due().bottom; ++line) {
    if (!painting.IsDue({{0, header + line * height}, place.extent})) continue;
    Drawing drawing(*canvas_, {}, place);
    painter_.PaintRow(drawing, topRow + line, place, cells);
    PaintRing(drawing, line * height);
    painting.Show(*canvas_, header + line * height);
  }
}

Text ListViewView::TipAt(HWND window, Spot place) const {
  const int count = static_cast<int>(List().Columns().size());
  const auto cells = columns_->CellsOf(count, painter_.RowHeight(), ReadingDirection());
  const bool ofHeader = window == Header();
  // The header's window is moved with what is scrolled.
  if (ofHeader) place.left += static_cast<int>(LeftOnScreen(window) - LeftOnScreen(Inner().Window()));
  const int row = TopRow() + (place.top - painter_.HeaderHeight()) / painter_.RowHeight();
  for (int column = 0; column < count; ++column) {
    const Area& cell = cells[static_cast<std::size_t>(column)];
    if (place.left < cell.corner.left || place.left >= cell.Right()) continue;
    if (ofHeader) return painter_.CutText(List().Columns()[static_cast<std::size_t>(column)], cell);
    if (place.top < painter_.HeaderHeight() || row >= List().Count()) return {};
    const ListRow& shown = List().Row(row + 1);
    return column <= shown.CellCount() ? painter_.CutText(shown, column, cell) : Text();
  }
  return {};
}

/// The part of the ring round all rows that lies `top` pixels below the first.
void ListViewView::PaintRing(Drawing& drawing, int top) const {
  const auto ring = RingOfList(HasFocus(), UsesKeys());
  if (!ring) return;
  const Extent inside = Inner().Inside();
  const Area rows{{0, -top}, {inside.width, inside.height - painter_.HeaderHeight()}};
  drawing.Stroke(RoundBox::Of(rows, ring->corner, ring->inset), ring->colour, ring->width);
}

void ListViewView::PaintHeaders() {
  const PlainPainting painting(header_->Window());
  const Extent inside = header_->Inside();
  const Area whole{{}, inside};
  Surface surface(inside);
  Drawing drawing(surface, {}, whole);
  const int count = static_cast<int>(List().Columns().size());
  painter_.PaintHeader(drawing, count, whole);
  // The header's window is moved with what is scrolled, so its places are those of a list that isn't.
  int place = 0;
  for (int column = 0; column < count; ++column) {
    const int width = columns_->WidthOf(column);
    const int left = ReadingDirection() == Direction::RightToLeft ? inside.width - place - width : place;
    if (width > 0) painter_.PaintHeader(drawing, column, {{left, 0}, {width, inside.height}});
    place += width;
  }
  painting.Show(surface, 0);
}

} // namespace quendra::forms::win32
