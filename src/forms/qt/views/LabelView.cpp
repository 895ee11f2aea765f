#include "forms/qt/views/LabelView.h"

#include "forms/view/Palette.h"

#include <QApplication>
#include <QKeyEvent>
#include <QPainter>
#include <QStyle>

#include <algorithm>

namespace quendra::forms::qt {

namespace {

/// Pixels that a link's widget reaches beyond its label on each side: a ring within would cover letters,
/// since a link is as wide as its text.
constexpr int kRingRoom = 4;

} // namespace

LabelView::LabelView(ViewContext& context, Label& label, QWidget* parent)
    : QWidget(parent), WidgetView(context, label, *this) {
  setAttribute(Qt::WA_Hover);
}

void LabelView::Apply(Aspect aspect) {
  setFocusPolicy(IsButton() ? Qt::TabFocus : Qt::NoFocus);
  if (aspect == Aspect::Look) Place();
}

void LabelView::Place() {
  WidgetView::Place();
  setGeometry(geometry().adjusted(-RingRoom(), -RingRoom(), RingRoom(), RingRoom()));
}

QString LabelView::AccessibleName() const {
  const Text& caption = TheLabel()->Caption();
  return ShownText(caption.empty() ? TheLabel()->Description : caption, LineBreaks::Keep);
}

bool LabelView::event(QEvent* event) {
  // Handlers and descriptions are plain members: what was set after the view came counts from the first
  // showing on.
  if (event->type() == QEvent::Show && TheControl()) {
    Apply(Aspect::All);
    setAccessibleName(AccessibleName());
  }
  return QWidget::event(event);
}

void LabelView::keyPressEvent(QKeyEvent* event) {
  const bool presses =
      event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter || event->key() == Qt::Key_Space;
  if (!presses || !IsButton() || event->isAutoRepeat()) return event->ignore();
  Press();
}

void LabelView::paintEvent(QPaintEvent* /*event*/) {
  if (!TheControl()) return;
  QPainter painter(this);
  painter.setRenderHint(QPainter::Antialiasing);
  PaintFace(painter);
  PaintText(painter);
  // A window gives the focus to its first control when it comes up; the ring is for those who use the keys.
  if (hasFocus() && window()->testAttribute(Qt::WA_KeyboardFocusChange)) PaintFocus(painter);
}

bool LabelView::IsHeldDown() const { return underMouse() && QApplication::mouseButtons() & Qt::LeftButton; }

void LabelView::PaintFace(QPainter& painter) const {
  const bool isFace = TheLabel()->Style() == Label::Look::Button;
  if (!isFace) {
    if (!TheLabel()->Transparent()) painter.fillRect(LabelRect(), ToQColor(TheLabel()->BackColour()));
    return;
  }
  painter.setPen(QPen(isEnabled() ? ToQColor(Palette::StrongBorder) : ToQColor(Palette::Border), 1));
  painter.setBrush(FaceColour());
  painter.drawRoundedRect(QRectF(rect()).adjusted(0.5, 0.5, -0.5, -0.5), 6, 6);
}

QColor LabelView::FaceColour() const {
  if (!isEnabled()) return ToQColor(Palette::QuietPage);
  const QColor face =
      TheLabel()->Transparent() ? ToQColor(Palette::Page) : ToQColor(TheLabel()->BackColour());
  return underMouse() ? face.darker(IsHeldDown() ? 115 : 105) : face;
}

QColor LabelView::InkColour() const {
  if (!isEnabled()) return ToQColor(Palette::QuietInk);
  const Colour colour = TheLabel()->ForeColour();
  if (colour != kBlack) return ToQColor(colour);
  return TheLabel()->Style() == Label::Look::Link ? ToQColor(Palette::Link) : ToQColor(Palette::Ink);
}

int LabelView::RingRoom() const { return TheLabel()->Style() == Label::Look::Link ? kRingRoom : 0; }

QRect LabelView::LabelRect() const {
  return rect().adjusted(RingRoom(), RingRoom(), -RingRoom(), -RingRoom());
}

void LabelView::PaintText(QPainter& painter) const {
  const QString text = ShownText(TheLabel()->Caption(), LineBreaks::Keep);
  if (text.isEmpty()) return;
  const Label::Look look = TheLabel()->Style();
  QFont drawn = font();
  if (look == Label::Look::Link) drawn.setUnderline(true);
  painter.setFont(drawn);
  painter.setPen(InkColour());
  painter.setLayoutDirection(ToQt(DirectionOf(TheLabel()->Caption())));
  const QRect place = LabelRect();
  const bool wraps = TheLabel()->WordWrap() || text.contains(u'\n');
  const Alignment align = look == Label::Look::Button ? Alignment::Centre : TheLabel()->Align();
  const bool top = wraps && look != Label::Look::Button;
  const auto flags = ToQt(SideOf(align, ReadingDirection())) | (top ? Qt::AlignTop : Qt::AlignVCenter);
  if (wraps) return painter.drawText(place, static_cast<int>(flags) | Qt::TextWordWrap, text);
  painter.drawText(place, static_cast<int>(flags) | Qt::TextSingleLine,
                   painter.fontMetrics().elidedText(text, Qt::ElideRight, place.width()));
}

/// Round its letters, which may take up a small part of the label.
QRectF LabelView::RingOfLink() const {
  const QFontMetrics metrics(font());
  const int width = metrics.horizontalAdvance(ShownText(TheLabel()->Caption(), LineBreaks::Keep));
  const QRect label = LabelRect();
  const QSize letters(std::min(width, label.width()), std::min(metrics.height(), label.height()));
  const auto flags = ToQt(SideOf(TheLabel()->Align(), ReadingDirection())) | Qt::AlignVCenter;
  return QRectF(QStyle::alignedRect(Qt::LeftToRight, flags, letters, label)).adjusted(-2, -2, 2, 2);
}

void LabelView::PaintFocus(QPainter& painter) const {
  painter.setPen(QPen(ToQColor(Palette::Focus), 2));
  painter.setBrush(Qt::NoBrush);
  if (TheLabel()->Style() == Label::Look::Link) {
    painter.drawRoundedRect(RingOfLink(), 4, 4);
    return;
  }
  painter.drawRoundedRect(QRectF(rect()).adjusted(1, 1, -1, -1), 5, 5);
  // The light line within sets the ring off from dark faces and pictures.
  painter.setPen(QPen(ToQColor(Palette::Page), 1));
  painter.drawRoundedRect(QRectF(rect()).adjusted(2.5, 2.5, -2.5, -2.5), 4, 4);
}

} // namespace quendra::forms::qt
