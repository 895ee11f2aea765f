#pragma once

#include "forms/controls/ComboBox.h"
#include "forms/qt/views/EntryLine.h"
#include "forms/qt/views/WidgetView.h"

#include <QComboBox>

namespace quendra::forms::qt {

class ComboBoxView : public QComboBox, public WidgetView {
 public:
  ComboBoxView(ViewContext& context, ComboBox& combo, QWidget* parent);
  bool TakesMouse() const override { return false; }
  void ControlGone() override;

 protected:
  void Apply(Aspect aspect) override;
  bool event(QEvent* event) override;
  void paintEvent(QPaintEvent* event) override;
  void wheelEvent(QWheelEvent* event) override;

 private:
  ComboBox& Combo() const { return static_cast<ComboBox&>(*TheControl()); }
  void TakeFreeText();
  void FillItems();

  EntryLine* field_ = nullptr; ///< of a list with free text
};

} // namespace quendra::forms::qt
