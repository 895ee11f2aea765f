#include "forms/qt/views/FrameView.h"

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

QString FrameView::AccessibleName() const { return ShownText(TheFrame().Caption()).trimmed(); }

void FrameView::paintEvent(QPaintEvent* /*event*/) {
  if (!TheControl()) return;
  QPainter painter(this);
  painter.setRenderHint(QPainter::Antialiasing);
  const bool border = TheFrame().Border();
  const QString caption = ShownText(TheFrame().Caption()).trimmed();
  const bool titled = border && !caption.isEmpty();
  // The border runs through the middle of its caption.
  const double top = titled ? fontMetrics().height() / 2.0 : 0;
  painter.setBrush(ToQColor(TheFrame().BackColour()));
  painter.setPen(border ? QPen(ToQColor(Palette::Border), 1) : QPen(Qt::NoPen));
  const double edge = border ? 0.5 : 0;
  const int round = Context().scale.Pixels(8);
  painter.drawRoundedRect(QRectF(rect()).adjusted(edge, top + edge, -edge, -edge), round, round);
  if (!titled) return;
  const int inset = Context().scale.Pixels(12);
  const int textWidth = fontMetrics().horizontalAdvance(caption) + inset;
  const int left = ReadingDirection() == Direction::RightToLeft ? width() - inset - textWidth : inset;
  const QRect title(left, 0, textWidth, fontMetrics().height());
  painter.fillRect(title, ToQColor(TheFrame().BackColour()));
  painter.setPen(TheFrame().ForeColour() == kBlack ? ToQColor(Palette::QuietInk)
                                                   : ToQColor(TheFrame().ForeColour()));
  painter.setLayoutDirection(ToQt(DirectionOf(TheFrame().Caption())));
  painter.drawText(title, Qt::AlignCenter, caption);
}

} // namespace quendra::forms::qt
