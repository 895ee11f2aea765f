#pragma once

#include "forms/controls/TextBox.h"
#include "forms/qt/views/WidgetView.h"

#include <QPlainTextEdit>

namespace quendra::forms::qt {

/// A text box of many lines.
class TextAreaView : public QPlainTextEdit, public WidgetView {
 public:
  TextAreaView(ViewContext& context, TextBox& box, QWidget* parent);
  bool TakesMouse() const override { return false; }

 protected:
  void Apply(Aspect aspect) override;

 private:
  TextBox& Box() const { return static_cast<TextBox&>(*TheControl()); }
};

} // namespace quendra::forms::qt
