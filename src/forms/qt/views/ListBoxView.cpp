#include "forms/qt/views/ListBoxView.h"

#include "forms/qt/drawing/FieldPainting.h"
#include "forms/qt/input/KeyEvents.h"
#include "forms/qt/input/MouseEvents.h"
#include "forms/view/Keyboard.h"

#include <QKeyEvent>

#include <utility>

namespace quendra::forms::qt {

namespace {
constexpr int kEdge = 4;
}

ListBoxView::ListBoxView(ViewContext& context, ListBox& list, QWidget* parent)
    : QListWidget(parent), WidgetView(context, list, *this) {
  // Never drawn: the room of the field's edge and ring.
  setFrameStyle(QFrame::Box | QFrame::Plain);
  setLineWidth(kEdge);
  setSelectionMode(QAbstractItemView::SingleSelection);
  setEditTriggers(QAbstractItemView::NoEditTriggers);
  setTabKeyNavigation(false);
  setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
  setTextElideMode(Qt::ElideRight);
  setUniformItemSizes(true);
  BareField(*viewport());
  viewport()->setAutoFillBackground(false);
  Context().mouse.Watch(*viewport(), *this);
}

void ListBoxView::Apply(Aspect aspect) {
  if (Concerns(aspect, Aspect::Items)) FillItems();
  if (Concerns(aspect, Aspect::Items) || aspect == Aspect::Selection) ShowSelection();
}

void ListBoxView::FillItems() {
  const bool before = std::exchange(showing_, true);
  // Items only grow until they are cleared, so the ones that stand here already are right.
  if (count() > List().ListCount() || List().ListCount() == 0) clear();
  for (int i = count(); i < List().ListCount(); ++i) {
    const Text visible = VisibleText(List().List(i));
    const QString text = ToQString(visible);
    auto* item = new QListWidgetItem(ToQString(Isolated(visible)), this);
    item->setToolTip(text.toHtmlEscaped());
    item->setData(Qt::AccessibleTextRole, text);
  }
  showing_ = before;
}

void ListBoxView::ShowSelection() {
  const bool before = std::exchange(showing_, true);
  setCurrentRow(List().ListIndex());
  showing_ = before;
}

bool ListBoxView::event(QEvent* event) {
  // A plain member, as with labels: what was set after the view came counts from the first showing on.
  if (event->type() == QEvent::Show && TheControl()) TellName();
  if (event->type() == QEvent::Paint) {
    PaintField(*this, StateOfField(*this, false));
    return true;
  }
  return QListWidget::event(event);
}

void ListBoxView::keyPressEvent(QKeyEvent* event) {
  if (!TheControl() || PassesList(ShiftStateOf(event->modifiers()), !event->text().isEmpty()))
    return event->ignore();
  if (const auto item = ItemReachedBy(List(), PressOf(*event))) {
    if (*item == List().ListIndex()) return;
    return Context().dispatcher.Dispatch([&] { List().SelectItem(*item); });
  }
  const bool before = std::exchange(byKeys_, true);
  QListWidget::keyPressEvent(event);
  byKeys_ = before;
}

void ListBoxView::focusInEvent(QFocusEvent* event) {
  // The toolkit would make its first item the current one.
  const bool before = std::exchange(showing_, true);
  QListWidget::focusInEvent(event);
  showing_ = before;
  if (TheControl()) ShowSelection();
  update();
}

void ListBoxView::focusOutEvent(QFocusEvent* event) {
  QListWidget::focusOutEvent(event);
  update();
}

// With Ctrl the toolkit would take the selection back, while the list box keeps its choice.
QItemSelectionModel::SelectionFlags ListBoxView::selectionCommand(const QModelIndex& index,
                                                                  const QEvent* event) const {
  return index.isValid() ? QItemSelectionModel::ClearAndSelect : QListWidget::selectionCommand(index, event);
}

void ListBoxView::currentChanged(const QModelIndex& current, const QModelIndex& previous) {
  QListWidget::currentChanged(current, previous);
  if (showing_ || !TheControl() || !current.isValid()) return;
  if (!byKeys_) return List().Selected(current.row());
  Context().dispatcher.Dispatch([&] { List().SelectItem(current.row()); });
}

} // namespace quendra::forms::qt
