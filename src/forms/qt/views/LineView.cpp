#include "forms/qt/views/LineView.h"

#include <QPainter>

#include <algorithm>
#include <cstdlib>

namespace quendra::forms::qt {

LineView::LineView(ViewContext& context, Line& line, QWidget* parent)
    : QWidget(parent), WidgetView(context, line, *this) {
  setAttribute(Qt::WA_TransparentForMouseEvents);
}

/// Room around the ends for half of a thick stroke.
int LineView::Margin() const { return std::clamp(TheLine().BorderWidth(), 1, 32); }

void LineView::Place() {
  const LineEnds ends = TheLine().Ends();
  PlaceAt({std::min(ends.x1, ends.x2), std::min(ends.y1, ends.y2), std::abs(ends.x2 - ends.x1),
           std::abs(ends.y2 - ends.y1)});
  const int margin = Margin();
  setGeometry(geometry().adjusted(-margin, -margin, margin, margin));
}

void LineView::paintEvent(QPaintEvent* /*event*/) {
  if (!TheControl()) return;
  const LineEnds ends = TheLine().Ends();
  const int margin = Margin();
  const QRect box = rect().adjusted(margin, margin, -margin, -margin);
  const int right = box.left() + box.width();
  const int bottom = box.top() + box.height();
  bool falls = (ends.x1 < ends.x2) == (ends.y1 < ends.y2);
  if (ReadsFromRightToLeft()) falls = !falls;
  QPainter painter(this);
  painter.setPen(QPen(ToQColor(TheLine().ForeColour()), TheLine().BorderWidth()));
  const bool straight = ends.x1 == ends.x2 || ends.y1 == ends.y2;
  painter.setRenderHint(QPainter::Antialiasing, !straight);
  if (straight || falls)
    painter.drawLine(box.left(), box.top(), right, bottom);
  else
    painter.drawLine(box.left(), bottom, right, box.top());
}

} // namespace quendra::forms::qt
