#pragma once

#include "forms/qt/views/WidgetView.h"
#include "forms/view/LabelLook.h"

namespace quendra::forms::qt {

class LabelView : public QWidget, public WidgetView {
 public:
  LabelView(ViewContext& context, Label& label, QWidget* parent);

  bool IsButton() const { return TheControl() && TheLabel()->IsButton(); }

 protected:
  void Apply(Aspect aspect) override;
  void Place() override;

  bool event(QEvent* event) override;
  void keyPressEvent(QKeyEvent* event) override;
  void paintEvent(QPaintEvent* event) override;

 private:
  const Label* TheLabel() const { return static_cast<const Label*>(TheControl()); }
  LabelState State() const;
  /// Where the control lies. A link's widget reaches beyond it, with room for its ring.
  Area LabelPlace() const;
  void PaintFace(QPainter& painter, const LabelState& state) const;
  void PaintText(QPainter& painter, const LabelState& state) const;
  void PaintRings(QPainter& painter, const LabelState& state) const;
};

} // namespace quendra::forms::qt
