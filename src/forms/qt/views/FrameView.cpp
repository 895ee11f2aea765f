#include "forms/qt/views/FrameView.h"

#include "forms/view/FrameLook.h"
#include "forms/view/Palette.h"

#include <QPainter>

namespace quendra::forms::qt {

void PlaceChildren(const Container& container) {
  for (const Control* child : container.Children())
    if (child->View()) child->View()->Changed(Aspect::Geometry);
}

FrameView::FrameView(ViewContext& context, Frame& frame, QWidget* parent)
    : QWidget(parent), WidgetView(context, frame, *this) {}

void FrameView::Apply(Aspect aspect) {
  if (Concerns(aspect, Aspect::Geometry)) PlaceChildren(TheFrame());
}

void FrameView::paintEvent(QPaintEvent* /*event*/) {
  if (!TheControl()) return;
  QPainter painter(this);
  painter.setRenderHint(QPainter::Antialiasing);
  const bool border = TheFrame().Border();
  const Text title = TitleOf(TheFrame());
  painter.setBrush(ToQColor(TheFrame().BackColour()));
  painter.setPen(border ? QPen(ToQColor(Palette::Border), 1) : QPen(Qt::NoPen));
  const double edge = border ? 0.5 : 0;
  const double top = BorderTop(title, fontMetrics().height()) + edge;
  const int corner = FrameCorner(Context().scale);
  painter.drawRoundedRect(QRectF(rect()).adjusted(edge, top, -edge, -edge), corner, corner);
  if (!title.empty()) PaintTitle(painter, title);
}

void FrameView::PaintTitle(QPainter& painter, const Text& title) const {
  const QString text = ToQString(title);
  const Extent letters{fontMetrics().horizontalAdvance(text), fontMetrics().height()};
  const QRect place = ToQRect(TitlePlace(letters, width(), Context().scale, ReadingDirection()));
  painter.fillRect(place, ToQColor(TheFrame().BackColour()));
  painter.setPen(ToQColor(TitleInk(TheFrame())));
  painter.setLayoutDirection(ToQt(DirectionOf(title)));
  painter.drawText(place, Qt::AlignCenter, text);
}

} // namespace quendra::forms::qt
