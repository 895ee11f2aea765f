#include "forms/qt/views/ComboBoxView.h"

#include "forms/qt/drawing/FieldPainting.h"

#include <QSignalBlocker>
#include <QStylePainter>
#include <QWheelEvent>

namespace quendra::forms::qt {

namespace {
constexpr int kArrow = 14;
/// What keeps a text from the ring, beside the toolkit's own room.
constexpr int kAside = 3;
} // namespace

ComboBoxView::ComboBoxView(ViewContext& context, ComboBox& combo, QWidget* parent)
    : QComboBox(parent), WidgetView(context, combo, *this) {
  setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
  connect(this, &QComboBox::activated, this, [this](int index) {
    Context().dispatcher.Dispatch([&] {
      if (TheControl()) Combo().SelectItem(index);
    });
    // The toolkit has put the item there as it stands in the list.
    if (field_ && TheControl()) field_->ShowText();
  });
  if (combo.FreeText) TakeFreeText();
}

void ComboBoxView::TakeFreeText() {
  field_ = new EntryLine(Context().dispatcher, Combo(), Combo(), this);
  setEditable(true);
  setLineEdit(field_);
  setInsertPolicy(QComboBox::NoInsert);
  setCompleter(nullptr);
  BareField(*field_);
}

void ComboBoxView::ControlGone() {
  WidgetView::ControlGone();
  if (field_) field_->Forget();
}

bool ComboBoxView::event(QEvent* event) {
  // A plain member, as with labels: what was set after the view came counts from the first showing on.
  if (event->type() == QEvent::Show && TheControl()) TellName();
  return QComboBox::event(event);
}

void ComboBoxView::Apply(Aspect aspect) {
  const QSignalBlocker silence(this);
  if (Concerns(aspect, Aspect::Items)) FillItems();
  if (Concerns(aspect, Aspect::Items) || aspect == Aspect::Selection) setCurrentIndex(Combo().ListIndex());
  if (!field_) return;
  if (Concerns(aspect, Aspect::Items) || aspect == Aspect::Selection || aspect == Aspect::Entry)
    field_->ShowText();
  if (aspect == Aspect::Caret) field_->ShowCaret();
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

// The face of all fields, on which the toolkit puts what tells a list: its arrow and the text of the selected
// item.
void ComboBoxView::paintEvent(QPaintEvent* /*event*/) {
  PaintField(*this, StateOfField(*this, false));
  QStylePainter painter(this);
  QStyleOptionComboBox option;
  initStyleOption(&option);
  const QRect button = style()->subControlRect(QStyle::CC_ComboBox, &option, QStyle::SC_ComboBoxArrow, this);
  option.rect.adjust(kAside, 0, -kAside, 0);
  if (!field_) painter.drawControl(QStyle::CE_ComboBoxLabel, option);
  option.rect = QRect(0, 0, kArrow, kArrow);
  option.rect.moveCenter(button.center());
  painter.drawPrimitive(QStyle::PE_IndicatorArrowDown, option);
}

// Turning the wheel over a closed list would switch what it stands for by accident.
void ComboBoxView::wheelEvent(QWheelEvent* event) { event->ignore(); }

} // namespace quendra::forms::qt
