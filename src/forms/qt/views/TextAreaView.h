#pragma once

#include "forms/controls/TextBox.h"
#include "forms/qt/input/EntryKeys.h"
#include "forms/qt/views/WidgetView.h"

#include <QPlainTextEdit>

namespace quendra::forms::qt {

/// A text box of many lines. Each line is read in its own direction.
class TextAreaView : public QPlainTextEdit, public WidgetView {
 public:
  TextAreaView(ViewContext& context, TextBox& box, QWidget* parent);
  bool TakesMouse() const override { return false; }
  void ControlGone() override;

 protected:
  void Apply(Aspect aspect) override;
  bool event(QEvent* event) override;
  void keyPressEvent(QKeyEvent* event) override;
  void inputMethodEvent(QInputMethodEvent* event) override;
  void focusInEvent(QFocusEvent* event) override;
  void focusOutEvent(QFocusEvent* event) override;
  void contextMenuEvent(QContextMenuEvent* event) override;

 private:
  const TextBox& Box() const { return static_cast<const TextBox&>(*TheControl()); }
  void SetLetters();
  void AlignLines();
  void ShowText();
  void ShowCaret();
  void TellSelection();

  EntryKeys keys_;
  bool showing_ = false;
};

} // namespace quendra::forms::qt
