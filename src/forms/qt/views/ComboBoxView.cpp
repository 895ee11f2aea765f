#include "forms/qt/views/ComboBoxView.h"

#include <QSignalBlocker>
#include <QWheelEvent>

namespace quendra::forms::qt {

ComboBoxView::ComboBoxView(ViewContext& context, ComboBox& combo, QWidget* parent)
    : QComboBox(parent), WidgetView(context, combo, *this) {
  setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
  connect(this, &QComboBox::activated, this, [this](int index) {
    Context().dispatcher.Dispatch([&] {
      if (TheControl()) Combo().SelectItem(index);
    });
  });
}

void ComboBoxView::Apply(Aspect aspect) {
  const QSignalBlocker silence(this);
  if (Concerns(aspect, Aspect::Items)) FillItems();
  if (Concerns(aspect, Aspect::Items) || aspect == Aspect::Selection) setCurrentIndex(Combo().ListIndex());
}

void ComboBoxView::FillItems() {
  // Items only grow until they are cleared, so the ones that stand here already are right.
  if (count() > Combo().ListCount() || Combo().ListCount() == 0) clear();
  for (int i = count(); i < Combo().ListCount(); ++i) {
    const Text visible = VisibleText(Combo().List(i));
    const QString text = ToQString(visible);
    addItem(ToQString(Isolated(visible)));
    setItemData(i, text.toHtmlEscaped(), Qt::ToolTipRole);
    setItemData(i, text, Qt::AccessibleTextRole);
  }
}

// Turning the wheel over a closed list would switch what it stands for by accident.
void ComboBoxView::wheelEvent(QWheelEvent* event) { event->ignore(); }

} // namespace quendra::forms::qt
