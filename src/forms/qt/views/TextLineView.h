#pragma once

#include "forms/controls/TextBox.h"
#include "forms/qt/views/WidgetView.h"

#include <QLineEdit>

namespace quendra::forms::qt {

/// A text box of one line.
class TextLineView : public QLineEdit, public WidgetView {
 public:
  TextLineView(ViewContext& context, TextBox& box, QWidget* parent);
  bool TakesMouse() const override { return false; }

 protected:
  void Apply(Aspect aspect) override;

 private:
  TextBox& Box() const { return static_cast<TextBox&>(*TheControl()); }
};

} // namespace quendra::forms::qt
