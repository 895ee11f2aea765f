#pragma once

#include "forms/qt/views/WidgetView.h"
#include "forms/view/MouseRules.h"
#include "forms/view/WindowDrag.h"

#include <QHash>
#include <QObject>
#include <QPointer>

class QMouseEvent;

namespace quendra::forms::qt {

/// State of the modifier keys as handlers get it, a sum of ShiftState.
int ShiftStateOf(Qt::KeyboardModifiers modifiers);

/// Turns the toolkit's mouse events into those of the controls, holds the cursor that handlers set, and drags
/// windows.
class MouseEvents : public QObject {
 public:
  explicit MouseEvents(Dispatcher& dispatcher) : dispatcher_(dispatcher) {}

  /// Events of this widget become events of the view's control.
  void Watch(QWidget& widget, WidgetView& view);
  void Forget(const WidgetView& view);

  /// Sets the cursor over the control whose event is being handled, else over the one under the mouse. It
  /// stays until the mouse moves over a control whose handler sets none.
  void SetCursor(Qt::CursorShape shape);
  /// The pressed control gets no click any more.
  void ReleaseCapture() { rules_.ReleaseCapture(); }
  /// Moves the window with the mouse until its button is let go: by the window manager, or by the desktop
  /// itself where none is or it doesn't. Controls hear nothing of the mouse meanwhile.
  void DragWindow(QWidget& window);

 protected:
  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  /// True for an event that belongs to a window being dragged.
  bool Dragged(const QMouseEvent& event);
  bool Handle(WidgetView& view, QMouseEvent& event);
  void Pressed(WidgetView& view, const QMouseEvent& event);
  void DoubleClicked(WidgetView& view, const QMouseEvent& event);
  void Released(WidgetView& view, const QMouseEvent& event);
  void Act(WidgetView& view, const QMouseEvent& event, MouseRules::Meaning meaning);
  static void HideRing(const WidgetView& view);
  void Moved(WidgetView& view, const QMouseEvent& event);
  void Raise(WidgetView& view, const Event<int, int, int, int>& raised, int button, const QMouseEvent& event);

  Dispatcher& dispatcher_;
  QHash<QObject*, WidgetView*> views_;
  MouseRules rules_;
  CursorRules cursor_;
  QPointer<QWidget> moving_;
  WindowDrag drag_;
  QPointer<QWidget> dragged_;
};

} // namespace quendra::forms::qt
