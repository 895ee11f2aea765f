#pragma once

#include "forms/qt/views/WidgetView.h"

namespace quendra::forms::qt {

class LabelView : public QWidget, public WidgetView {
 public:
  LabelView(ViewContext& context, Label& label, QWidget* parent);

  bool IsButton() const { return TheControl() && TheLabel()->IsButton(); }
  QAccessible::Role Role() const override {
    return IsButton() ? QAccessible::Button : QAccessible::StaticText;
  }

 protected:
  void Apply(Aspect aspect) override;
  QString AccessibleName() const override;
  void Place() override;

  bool event(QEvent* event) override;
  void keyPressEvent(QKeyEvent* event) override;
  void paintEvent(QPaintEvent* event) override;

 private:
  const Label* TheLabel() const { return static_cast<const Label*>(TheControl()); }
  void PaintFace(QPainter& painter) const;
  void PaintText(QPainter& painter) const;
  void PaintFocus(QPainter& painter) const;
  /// Where the control lies. A link's widget reaches beyond it, with room for its ring.
  QRect LabelRect() const;
  int RingRoom() const;
  QRectF RingOfLink() const;
  QColor FaceColour() const;
  QColor InkColour() const;
  bool IsHeldDown() const;
};

} // namespace quendra::forms::qt
