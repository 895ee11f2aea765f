#pragma once

#include "forms/qt/views/WidgetView.h"

namespace quendra::forms::qt {

class LineView : public QWidget, public WidgetView {
 public:
  LineView(ViewContext& context, Line& line, QWidget* parent);

 protected:
  void Place() override;
  void paintEvent(QPaintEvent* event) override;

 private:
  const Line& TheLine() const { return static_cast<const Line&>(*TheControl()); }
};

} // namespace quendra::forms::qt
