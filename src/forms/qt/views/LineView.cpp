#include "forms/qt/views/LineView.h"

#include <QPainter>

namespace quendra::forms::qt {

LineView::LineView(ViewContext& context, Line& line, QWidget* parent)
    : QWidget(parent), WidgetView(context, line, *this) {
  setAttribute(Qt::WA_TransparentForMouseEvents);
}

void LineView::Place() {
  PlaceAt(BoundsOf(TheLine().Ends()));
  const int margin = StrokeRoom(TheLine().BorderWidth());
  setGeometry(geometry().adjusted(-margin, -margin, margin, margin));
}

void LineView::paintEvent(QPaintEvent* /*event*/) {
  if (!TheControl()) return;
  const int margin = StrokeRoom(TheLine().BorderWidth());
  const QRect box = rect().adjusted(margin, margin, -margin, -margin);
  const int right = box.left() + box.width();
  const int bottom = box.top() + box.height();
  const Stroke stroke = StrokeOf(TheLine().Ends(), PlacingOf(TheLine()));
  QPainter painter(this);
  painter.setPen(QPen(ToQColor(TheLine().ForeColour()), TheLine().BorderWidth()));
  painter.setRenderHint(QPainter::Antialiasing, stroke != Stroke::Straight);
  if (stroke == Stroke::Rising)
    painter.drawLine(box.left(), bottom, right, box.top());
  else
    painter.drawLine(box.left(), box.top(), right, bottom);
}

} // namespace quendra::forms::qt
