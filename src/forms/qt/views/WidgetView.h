#pragma once

#include "forms/Desktop.h"
#include "forms/loop/Dispatcher.h"
#include "forms/loop/TimerView.h"
#include "forms/qt/drawing/Conversion.h"
#include "forms/qt/drawing/PictureStore.h"
#include "forms/view/Accessible.h"
#include "forms/view/ActiveForm.h"
#include "forms/view/View.h"

#include <QWidget>

namespace quendra::forms::qt {

class MouseEvents;

/// What every view of a desktop needs of it.
struct ViewContext {
  Desktop& desktop;
  Dispatcher& dispatcher;
  /// That of the form; without a form, that of the screen.
  const Scale& scale;
  PictureStore& pictures;
  MouseEvents& mouse;
  const TimerStarter& startTimer;
  ActiveForm& active;
};

/// What all widgets that stand for a control have in common. Made as the second base of the widget itself.
class WidgetView : public View {
 public:
  WidgetView(ViewContext& context, Control& control, QWidget& widget);

  void Changed(Aspect aspect) override;
  void Release() override;
  void ControlGone() override;

  /// nullptr once released.
  Control* TheControl() const { return control_; }
  QWidget& Widget() const { return widget_; }
  /// The widget in which places in the control are told.
  virtual QWidget& Body() const { return widget_; }
  ViewContext& Context() const { return context_; }
  Direction ReadingDirection() const { return direction_; }

  /// Draws the control and what it holds at once.
  void Repaint();
  /// A press by the mouse, a key or assistive technology.
  void Press();
  /// False for widgets that need mouse events for themselves, too.
  virtual bool TakesMouse() const { return true; }
  /// What assistive technology takes the control for; the last one once released.
  forms::Role Role();

 protected:
  /// The parts of the state that only this kind of control has.
  virtual void Apply(Aspect /*aspect*/) {}
  virtual void Place();
  virtual void Show();
  /// Gives assistive technology the name that the control has now.
  void TellName();
  /// Moves the widget to a place in its container, mirrored where the form reads from right to left.
  void PlaceAt(const Geometry& geometry);
  static bool Concerns(Aspect told, Aspect wanted) { return told == wanted || told == Aspect::All; }

 private:
  void Identify();
  void Enable();

  ViewContext& context_;
  Control* control_;
  QWidget& widget_;
  Direction direction_;
  forms::Role role_ = forms::Role::Toolkits;
};

/// Gives the names and roles of the views to assistive technology. Once a process.
void InstallAccessibility();

} // namespace quendra::forms::qt
