#pragma once

#include "forms/controls/ComboBox.h"
#include "forms/qt/views/WidgetView.h"

#include <QComboBox>

namespace quendra::forms::qt {

class ComboBoxView : public QComboBox, public WidgetView {
 public:
  ComboBoxView(ViewContext& context, ComboBox& combo, QWidget* parent);
  bool TakesMouse() const override { return false; }

 protected:
  void Apply(Aspect aspect) override;
  void wheelEvent(QWheelEvent* event) override;

 private:
  ComboBox& Combo() const { return static_cast<ComboBox&>(*TheControl()); }
  void FillItems();
};

} // namespace quendra::forms::qt
