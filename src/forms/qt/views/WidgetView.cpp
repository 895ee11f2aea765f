#include "forms/qt/views/WidgetView.h"

#include "forms/qt/input/MouseEvents.h"

#include <QAbstractScrollArea>

namespace quendra::forms::qt {

WidgetView::WidgetView(ViewContext& context, Control& control, QWidget& widget)
    : context_(context), control_(&control), widget_(widget), direction_(DirectionOf(control.OwnerForm())) {
  context_.mouse.Watch(widget_, *this);
}

void WidgetView::Release() {
  if (!control_) return;
  control_->Attach(nullptr);
  ControlGone();
}

void WidgetView::ControlGone() {
  context_.mouse.Forget(*this);
  control_ = nullptr;
}

void WidgetView::Changed(Aspect aspect) {
  if (!control_) return;
  if (aspect == Aspect::All) Identify();
  if (Concerns(aspect, Aspect::Geometry)) Place();
  if (Concerns(aspect, Aspect::Font)) widget_.setFont(ToQFont(control_->TextFont(), context_.scale));
  if (Concerns(aspect, Aspect::Enabled)) Enable();
  if (aspect == Aspect::Order) widget_.raise();
  Apply(aspect);
  if (Concerns(aspect, Aspect::Caption)) TellName();
  if (Concerns(aspect, Aspect::Visible)) Show();
  if (aspect != Aspect::Tag && aspect != Aspect::Visible) widget_.update();
}

// Not when the widget is made: assistive technology would be told at once and take it for the bare base that
// it still is.
void WidgetView::Identify() {
  widget_.setObjectName(ToQString(control_->Name()));
  widget_.setAccessibleDescription(ToQString(control_->Name()));
}

void WidgetView::TellName() { widget_.setAccessibleName(ToQString(AccessibleOf(*control_).name)); }

forms::Role WidgetView::Role() {
  if (control_) role_ = AccessibleOf(*control_).role;
  return role_;
}

void WidgetView::Enable() {
  widget_.setEnabled(control_->Enabled());
  // No handler is asked any more, so the hand of a button that was under the mouse would stay.
  if (!control_->Enabled()) widget_.unsetCursor();
}

void WidgetView::Place() { PlaceAt(control_->Position()); }

void WidgetView::Show() { widget_.setVisible(control_->Visible()); }

void WidgetView::PlaceAt(const Geometry& geometry) {
  const int container = control_->Parent()->Position().width;
  widget_.setGeometry(ToQRect(PlaceOf(geometry, container, context_.scale, PlacingOf(*control_))));
}

void WidgetView::Repaint() {
  // The toolkit leaves out what is opaque and not due itself, and what was just shown or moved is due only
  // once the loop runs.
  for (QWidget* held : widget_.findChildren<QWidget*>()) held->update();
  // What a scroll area shows is its viewport's.
  const auto* area = qobject_cast<QAbstractScrollArea*>(&widget_);
  (area ? *area->viewport() : widget_).repaint();
}

void WidgetView::Press() {
  context_.dispatcher.Dispatch([this] {
    if (control_ && control_->IsUsable()) control_->Click();
  });
}

} // namespace quendra::forms::qt
