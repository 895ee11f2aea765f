#include "forms/qt/input/MouseEvents.h"

#include <QApplication>
#include <QCursor>
#include <QMouseEvent>
#include <QWindow>

namespace quendra::forms::qt {

namespace {

int ButtonOf(Qt::MouseButtons buttons) {
  return (buttons & Qt::LeftButton ? kLeftButton : 0) | (buttons & Qt::RightButton ? kRightButton : 0);
}

bool IsMouseEvent(QEvent::Type type) {
  return type == QEvent::MouseMove || type == QEvent::MouseButtonPress ||
         type == QEvent::MouseButtonRelease || type == QEvent::MouseButtonDblClick;
}

} // namespace

int ShiftStateOf(Qt::KeyboardModifiers modifiers) {
  return (modifiers & Qt::ShiftModifier ? kShift : 0) | (modifiers & Qt::ControlModifier ? kCtrl : 0) |
         (modifiers & Qt::AltModifier ? kAlt : 0);
}

void MouseEvents::Watch(QWidget& widget, WidgetView& view) {
  views_.insert(&widget, &view);
  widget.setMouseTracking(true);
  widget.installEventFilter(this);
}

void MouseEvents::Forget(const WidgetView& view) {
  views_.removeIf([&](const auto& entry) { return entry.value() == &view; });
  if (pressed_ == &view) pressed_ = nullptr;
}

void MouseEvents::SetCursor(Qt::CursorShape shape) {
  cursorWasSet_ = true;
  QWidget* widget = moving_ ? moving_.data() : QApplication::widgetAt(QCursor::pos());
  if (widget) widget->setCursor(shape);
}

void MouseEvents::DragWindow(QWidget& window) {
  dragged_ = &window;
  grip_ = QCursor::pos() - window.pos();
  const bool managed = window.windowHandle() && window.windowHandle()->startSystemMove();
  drag_ = managed ? Drag::ByWindowManager : Drag::ByDesktop;
}

bool MouseEvents::Dragged(const QMouseEvent& event) {
  if (drag_ == Drag::None) return false;
  // A window manager keeps the mouse to itself, but moves from before it took over are still in the queue.
  // Were the move asked for again by one of them, the manager would go on moving behind the release.
  if (event.type() == QEvent::MouseMove && event.buttons() & Qt::LeftButton) {
    if (drag_ == Drag::ByDesktop && dragged_) dragged_->move(event.globalPosition().toPoint() - grip_);
    return true;
  }
  drag_ = Drag::None;
  return event.type() == QEvent::MouseButtonRelease;
}

bool MouseEvents::eventFilter(QObject* watched, QEvent* event) {
  if (!IsMouseEvent(event->type())) return false;
  WidgetView* view = views_.value(watched);
  if (!view) return false;
  const bool takes = view->TakesMouse();
  return Handle(*view, static_cast<QMouseEvent&>(*event)) || takes;
}

bool MouseEvents::Handle(WidgetView& view, QMouseEvent& event) {
  if (Dragged(event)) return true;
  if (!view.Widget().isEnabled()) return true;
  switch (event.type()) {
  case QEvent::MouseButtonPress: Pressed(view, event); break;
  case QEvent::MouseButtonDblClick: DoubleClicked(view, event); break;
  case QEvent::MouseButtonRelease: Released(view, event); break;
  default: Moved(view, event); break;
  }
  return false;
}

void MouseEvents::Raise(WidgetView& view, const Event<int, int, int, int>& raised, int button,
                        const QMouseEvent& event) {
  if (!raised) return;
  const QPointF place = view.Body().mapFromGlobal(event.globalPosition());
  const Spot twips =
      TwipsAt(place.x(), place.y(), view.Body().width(), view.Context().scale, view.ReadingDirection());
  dispatcher_.Dispatch([&] { raised(button, ShiftStateOf(event.modifiers()), twips.left, twips.top); });
}

void MouseEvents::Pressed(WidgetView& view, const QMouseEvent& event) {
  if (event.button() == Qt::LeftButton) pressed_ = &view;
  // Who takes the mouse in hand needs no focus ring any more.
  QWidget* window = view.Widget().window();
  window->setAttribute(Qt::WA_KeyboardFocusChange, false);
  if (QWidget* focused = window->focusWidget()) focused->update();
  view.Widget().update();
  Raise(view, view.TheControl()->MouseDown, ButtonOf(event.button()), event);
}

void MouseEvents::DoubleClicked(WidgetView& view, const QMouseEvent& event) {
  // Without a handler the second of two quick clicks is a click like the first.
  if (!view.TheControl()->DoubleClick || event.button() != Qt::LeftButton) return Pressed(view, event);
  dispatcher_.Dispatch([&] { view.TheControl()->DoubleClick(); });
}

void MouseEvents::Released(WidgetView& view, const QMouseEvent& event) {
  view.Widget().update();
  if (event.button() != Qt::LeftButton || std::exchange(pressed_, nullptr) != &view) return;
  if (view.Widget().rect().contains(event.position().toPoint())) view.Press();
}

void MouseEvents::Moved(WidgetView& view, const QMouseEvent& event) {
  QPointer<QWidget> widget = &view.Widget();
  cursorWasSet_ = false;
  moving_ = widget;
  Raise(view, view.TheControl()->MouseMove, ButtonOf(event.buttons()), event);
  moving_ = nullptr;
  if (!cursorWasSet_ && widget && widget->testAttribute(Qt::WA_SetCursor)) widget->unsetCursor();
}

} // namespace quendra::forms::qt
