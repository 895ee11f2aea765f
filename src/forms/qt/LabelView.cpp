#include "forms/qt/LabelView.h"

#include "forms/qt/Palette.h"

#include <QApplication>
#include <QKeyEvent>
#include <QPainter>

namespace quendra::forms::qt {

LabelView::LabelView(ViewContext& context, Label& label, QWidget* parent)
    : QWidget(parent), WidgetView(context, label, *this) {
  setAttribute(Qt::WA_Hover);
}

bool LabelView::IsButton() const { return TheControl() && TheControl()->Click; }

void LabelView::Apply(Aspect /*aspect*/) { setFocusPolicy(IsButton() ? Qt::TabFocus : Qt::NoFocus); }

QString LabelView::AccessibleName() const {
  const Text& caption = TheLabel()->Caption();
  return VisibleText(caption.empty() ? TheLabel()->Description : caption, LineBreaks::Keep);
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
    if (!TheLabel()->Transparent()) painter.fillRect(rect(), ToQColor(TheLabel()->BackColour()));
    return;
  }
  QColor face = TheLabel()->Transparent() ? palette::kPage : ToQColor(TheLabel()->BackColour());
  if (isEnabled() && underMouse()) face = face.darker(IsHeldDown() ? 115 : 105);
  painter.setPen(QPen(palette::kStrongBorder, 1));
  painter.setBrush(face);
  painter.drawRoundedRect(QRectF(rect()).adjusted(0.5, 0.5, -0.5, -0.5), 6, 6);
}

QColor LabelView::InkColour() const {
  if (!isEnabled()) return palette::kQuietInk;
  const Colour colour = TheLabel()->ForeColour();
  if (colour != kBlack) return ToQColor(colour);
  return TheLabel()->Style() == Label::Look::Link ? palette::kLink : palette::kInk;
}

void LabelView::PaintText(QPainter& painter) const {
  const QString text = VisibleText(TheLabel()->Caption(), LineBreaks::Keep);
  if (text.isEmpty()) return;
  const Label::Look look = TheLabel()->Style();
  QFont drawn = font();
  if (look == Label::Look::Link) drawn.setUnderline(true);
  painter.setFont(drawn);
  painter.setPen(InkColour());
  painter.setLayoutDirection(DirectionOf(text));
  const bool wraps = TheLabel()->WordWrap() || text.contains(u'\n');
  const Alignment align = look == Label::Look::Button ? Alignment::Centre : TheLabel()->Align();
  const bool top = wraps && look != Label::Look::Button;
  const auto flags = SideOf(align, ReadsFromRightToLeft()) | (top ? Qt::AlignTop : Qt::AlignVCenter);
  if (wraps) return painter.drawText(rect(), static_cast<int>(flags) | Qt::TextWordWrap, text);
  painter.drawText(rect(), static_cast<int>(flags) | Qt::TextSingleLine,
                   painter.fontMetrics().elidedText(text, Qt::ElideRight, width()));
}

void LabelView::PaintFocus(QPainter& painter) const {
  painter.setPen(QPen(palette::kFocus, 2));
  painter.setBrush(Qt::NoBrush);
  painter.drawRoundedRect(QRectF(rect()).adjusted(1, 1, -1, -1), 5, 5);
  // The light line within sets the ring off from dark faces and pictures.
  painter.setPen(QPen(palette::kPage, 1));
  painter.drawRoundedRect(QRectF(rect()).adjusted(2.5, 2.5, -2.5, -2.5), 4, 4);
}

} // namespace quendra::forms::qt
