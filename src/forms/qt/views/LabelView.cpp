#include "forms/qt/views/LabelView.h"

#include "forms/qt/input/KeyEvents.h"
#include "forms/view/LabelLook.h"

#include <QApplication>
#include <QKeyEvent>
#include <QPainter>

namespace quendra::forms::qt {

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
  setGeometry(ToQRect(ToArea(geometry()).GrownBy(RingRoom(*TheLabel()))));
}

bool LabelView::event(QEvent* event) {
  // Handlers and descriptions are plain members: what was set after the view came counts from the first
  // showing on.
  if (event->type() == QEvent::Show && TheControl()) {
    Apply(Aspect::All);
    TellName();
  }
  return QWidget::event(event);
}

void LabelView::keyPressEvent(QKeyEvent* event) {
  if (!TheControl() || !PressesLabel(*TheLabel(), PressOf(*event))) return event->ignore();
  Press();
}

void LabelView::paintEvent(QPaintEvent* /*event*/) {
  if (!TheControl()) return;
  QPainter painter(this);
  painter.setRenderHint(QPainter::Antialiasing);
  const LabelState state = State();
  PaintFace(painter, state);
  PaintText(painter, state);
  PaintRings(painter, state);
}

LabelState LabelView::State() const {
  LabelState state;
  state.enabled = isEnabled();
  state.underMouse = underMouse();
  state.heldDown = underMouse() && QApplication::mouseButtons() & Qt::LeftButton;
  state.hasFocus = hasFocus();
  state.usesKeys = window()->testAttribute(Qt::WA_KeyboardFocusChange);
  return state;
}

Area LabelView::LabelPlace() const { return ToArea(rect()).GrownBy(-RingRoom(*TheLabel())); }

void LabelView::PaintFace(QPainter& painter, const LabelState& state) const {
  const LabelFace face = FaceOf(*TheLabel(), state);
  if (!face.fill) return;
  if (!face.border) return painter.fillRect(ToQRect(LabelPlace()), ToQColor(*face.fill));
  painter.setPen(QPen(ToQColor(*face.border), 1));
  painter.setBrush(ToQColor(*face.fill));
  painter.drawRoundedRect(QRectF(rect()).adjusted(0.5, 0.5, -0.5, -0.5), face.corner, face.corner);
}

void LabelView::PaintText(QPainter& painter, const LabelState& state) const {
  const LabelText set = TextOf(*TheLabel());
  if (set.text.empty()) return;
  const QString text = ToQString(set.text);
  QFont drawn = font();
  drawn.setUnderline(set.underlined);
  painter.setFont(drawn);
  painter.setPen(ToQColor(InkOf(*TheLabel(), state)));
  painter.setLayoutDirection(ToQt(set.direction));
  const int inset = TextInset(*TheLabel());
  const QRect place = ToQRect(LabelPlace()).adjusted(inset, 0, -inset, 0);
  const auto flags =
      ToQt(SideOf(set.align, ReadingDirection())) | (set.fromTop ? Qt::AlignTop : Qt::AlignVCenter);
  if (set.wraps) return painter.drawText(place, static_cast<int>(flags) | Qt::TextWordWrap, text);
  painter.drawText(place, static_cast<int>(flags) | Qt::TextSingleLine,
                   painter.fontMetrics().elidedText(text, Qt::ElideRight, place.width()));
}

void LabelView::PaintRings(QPainter& painter, const LabelState& state) const {
  const std::vector<Ring> rings = RingsOf(*TheLabel(), state);
  if (rings.empty()) return;
  const QFontMetrics metrics(font());
  const Extent letters{metrics.horizontalAdvance(ShownText(TheLabel()->Caption(), LineBreaks::Keep)),
                       metrics.height()};
  const QRectF ringed = ToQRect(RingedArea(*TheLabel(), LabelPlace(), letters, ReadingDirection()));
  painter.setBrush(Qt::NoBrush);
  for (const Ring& ring : rings) {
    painter.setPen(QPen(ToQColor(ring.colour), ring.width));
    painter.drawRoundedRect(ringed.adjusted(ring.inset, ring.inset, -ring.inset, -ring.inset), ring.corner,
                            ring.corner);
  }
}

} // namespace quendra::forms::qt
