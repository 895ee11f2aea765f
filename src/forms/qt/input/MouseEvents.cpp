#include "forms/qt/input/MouseEvents.h"

#include "forms/view/Keyboard.h"

#include <QApplication>
#include <QCursor>
#include <QMouseEvent>
#include <QWindow>

#include <optional>

namespace quendra::forms::qt {

namespace {

int ButtonsOf(Qt::MouseButtons buttons) {
  return ButtonSum(buttons & Qt::LeftButton, buttons & Qt::RightButton);
}

std::optional<WindowDrag::MouseEvent> KindOf(QEvent::Type type) {
  switch (type) {
  case QEvent::MouseMove: return WindowDrag::MouseEvent::Move;
  case QEvent::MouseButtonPress:
  case QEvent::MouseButtonDblClick: return WindowDrag::MouseEvent::Press;
  case QEvent::MouseButtonRelease: return WindowDrag::MouseEvent::Release;
  default: return std::nullopt;
  }
}

} // namespace

int ShiftStateOf(Qt::KeyboardModifiers modifiers) {
  return ShiftSum(modifiers & Qt::ShiftModifier, modifiers & Qt::ControlModifier,
                  modifiers & Qt::AltModifier);
}

void MouseEvents::Watch(QWidget& widget, WidgetView& view) {
  views_.insert(&widget, &view);
  widget.setMouseTracking(true);
  widget.installEventFilter(this);
}

void MouseEvents::Forget(const WidgetView& view) {
  views_.removeIf([&](const auto& entry) { return entry.value() == &view; });
  if (view.TheControl()) rules_.Forget(*view.TheControl());
}

void MouseEvents::SetCursor(Qt::CursorShape shape) {
  cursor_.Set();
  QWidget* widget = moving_ ? moving_.data() : QApplication::widgetAt(QCursor::pos());
  if (widget) widget->setCursor(shape);
}

void MouseEvents::DragWindow(QWidget& window) {
  dragged_ = &window;
  const Spot mouse = ToSpot(QCursor::pos());
  const Spot corner = ToSpot(window.pos());
  const bool managed = window.windowHandle() && window.windowHandle()->startSystemMove();
  drag_.Start(managed ? WindowDrag::By::WindowManager : WindowDrag::By::Desktop, mouse, corner);
}

bool MouseEvents::Dragged(const QMouseEvent& event) {
  const bool held = event.buttons() & Qt::LeftButton;
  if (!drag_.Takes(*KindOf(event.type()), held)) return false;
  if (held && drag_.MovesWindow() && dragged_)
    dragged_->move(ToQPoint(drag_.WindowAt(ToSpot(event.globalPosition().toPoint()))));
  return true;
}

bool MouseEvents::eventFilter(QObject* watched, QEvent* event) {
  if (!KindOf(event->type())) return false;
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
  Act(view, event, rules_.Pressed(*view.TheControl(), ButtonsOf(event.button())));
}

void MouseEvents::DoubleClicked(WidgetView& view, const QMouseEvent& event) {
  Act(view, event, rules_.PressedAgain(*view.TheControl(), ButtonsOf(event.button())));
}

void MouseEvents::Released(WidgetView& view, const QMouseEvent& event) {
  view.Widget().update();
  const bool inside = view.Widget().rect().contains(event.position().toPoint());
  Act(view, event, rules_.Released(*view.TheControl(), ButtonsOf(event.button()), inside));
}

void MouseEvents::Act(WidgetView& view, const QMouseEvent& event, MouseRules::Meaning meaning) {
  switch (meaning) {
  case MouseRules::Meaning::Nothing: break;
  case MouseRules::Meaning::Click: view.Press(); break;
  case MouseRules::Meaning::DoubleClick:
    dispatcher_.Dispatch([&] { view.TheControl()->DoubleClick(); });
    break;
  case MouseRules::Meaning::Press:
    HideRing(view);
    Raise(view, view.TheControl()->MouseDown, ButtonsOf(event.button()), event);
    break;
  }
}

// Who takes the mouse in hand needs no focus ring any more.
void MouseEvents::HideRing(const WidgetView& view) {
  QWidget* window = view.Widget().window();
  window->setAttribute(Qt::WA_KeyboardFocusChange, false);
  if (QWidget* focused = window->focusWidget()) focused->update();
  view.Widget().update();
}

void MouseEvents::Moved(WidgetView& view, const QMouseEvent& event) {
  QPointer<QWidget> widget = &view.Widget();
  cursor_.MoveBegins();
  moving_ = widget;
  Raise(view, view.TheControl()->MouseMove, ButtonsOf(event.buttons()), event);
  moving_ = nullptr;
  if (cursor_.MoveEndsIt() && widget && widget->testAttribute(Qt::WA_SetCursor)) widget->unsetCursor();
}

} // namespace quendra::forms::qt
