#pragma once

#include "forms/controls/TextBox.h"
#include "forms/qt/views/EntryLine.h"
#include "forms/qt/views/WidgetView.h"

namespace quendra::forms::qt {

/// A text box of one line.
class TextLineView : public EntryLine, public WidgetView {
 public:
  TextLineView(ViewContext& context, TextBox& box, QWidget* parent);
  bool TakesMouse() const override { return false; }
  void ControlGone() override;

 protected:
  void Apply(Aspect aspect) override;
  bool event(QEvent* event) override;
  void paintEvent(QPaintEvent* event) override;

 private:
  const TextBox& Box() const { return static_cast<const TextBox&>(*TheControl()); }
};

} // namespace quendra::forms::qt
