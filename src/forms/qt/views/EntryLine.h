#pragma once

#include "forms/qt/input/EntryKeys.h"

#include <QLineEdit>

namespace quendra::forms::qt {

/// A line of text that the user types into: a text box, or the field of a combo box.
class EntryLine : public QLineEdit {
 public:
  EntryLine(Dispatcher& dispatcher, const Control& control, TextEntry& entry, QWidget* parent);

  void ShowText();
  void ShowCaret();
  /// The control goes or is let go of.
  void Forget() { keys_.Release(); }

 protected:
  void keyPressEvent(QKeyEvent* event) override;
  void inputMethodEvent(QInputMethodEvent* event) override;
  void focusInEvent(QFocusEvent* event) override;
  void focusOutEvent(QFocusEvent* event) override;
  void contextMenuEvent(QContextMenuEvent* event) override;

 private:
  void TellSelection();

  EntryKeys keys_;
  bool showing_ = false;
};

} // namespace quendra::forms::qt
