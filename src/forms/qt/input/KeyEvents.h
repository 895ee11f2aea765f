#pragma once

#include "forms/loop/Dispatcher.h"
#include "forms/view/HeldKey.h"
#include "forms/view/Keyboard.h"

#include <QObject>

class QKeyEvent;

namespace quendra::forms::qt {

class FormView;

/// The code of the character that the key gives without modifiers in the active layout, upper case for Latin
/// letters; the platform's codes for Enter, Escape and the like; 0 for a key that has neither.
int KeyCodeOf(const QKeyEvent& event);
KeyPress PressOf(const QKeyEvent& event);

/// Gives keys to forms before the control that has the focus, and those that no control took to the form's
/// Default and Cancel controls.
class KeyEvents : public QObject {
 public:
  explicit KeyEvents(Dispatcher& dispatcher) : dispatcher_(dispatcher) {}

 protected:
  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  void Preview(FormView& view, const QWidget& widget, const QKeyEvent& event);
  bool Press(FormView& view, const QKeyEvent& event);

  Dispatcher& dispatcher_;
  HeldKey held_;
};

} // namespace quendra::forms::qt
