#include "forms/qt/views/ListViewView.h"

#include "forms/qt/input/MouseEvents.h"
#include "forms/qt/views/ListDelegate.h"
#include "forms/qt/views/ListHeader.h"
#include "forms/view/Keyboard.h"
#include "forms/view/ListLayout.h"

#include <QAccessible>
#include <QKeyEvent>
#include <QPainter>
#include <QScrollBar>

namespace quendra::forms::qt {

ListViewView::ListViewView(ViewContext& context, ListView& list, QWidget* parent)
    : QTreeView(parent), WidgetView(context, list, *this), model_(list, context.pictures) {
  setRootIsDecorated(false);
  setItemsExpandable(false);
  setUniformRowHeights(true);
  setAlternatingRowColors(true);
  setTabKeyNavigation(false);
  setEditTriggers(QAbstractItemView::NoEditTriggers);
  setSelectionMode(QAbstractItemView::SingleSelection);
  setVerticalScrollMode(QAbstractItemView::ScrollPerItem);
  setHorizontalScrollMode(QAbstractItemView::ScrollPerPixel);
  setTextElideMode(Qt::ElideRight);
  auto* header = new ListHeader(model_, context.scale, ReadingDirection(), this);
  setHeader(header);
  header->setSectionsClickable(true); // setHeader takes it away
  connect(header, &QHeaderView::sectionClicked, this, [this](int section) { HeaderClicked(section); });
  connect(header, &QHeaderView::sectionResized, this,
          [this] { sizedByHand_ = sizedByHand_ || !(sizing_ || quiet_); });
  setItemDelegate(new ListDelegate(model_, context.scale, ReadingDirection(), this));
  setModel(&model_);
  Context().mouse.Watch(*viewport(), *this);
  list.Observe(this);
}

void ListViewView::Release() {
  if (!TheControl()) return;
  List().Observe(nullptr);
  WidgetView::Release();
}

void ListViewView::ControlGone() {
  WidgetView::ControlGone();
  Quietly([this] { model_.Release(); });
}

template <typename Change> void ListViewView::Quietly(Change change) {
  const bool before = std::exchange(quiet_, true);
  change();
  quiet_ = before;
}

void ListViewView::Apply(Aspect aspect) {
  if (aspect == Aspect::All) ColumnsChanged();
  if (aspect == Aspect::Geometry) FitColumns();
  if (aspect == Aspect::Font && isVisible()) FitRows();
  if (Concerns(aspect, Aspect::Selection)) ShowSelection();
}

void ListViewView::RowAdded(int index) {
  Quietly([&] { model_.RowAdded(index); });
}

void ListViewView::RowRemoved(int index) {
  Quietly([&] { model_.RowRemoved(index); });
  ShowSelection();
}

void ListViewView::RowsCleared() {
  Quietly([&] { model_.Reset(); });
}

// The view asks for texts when it draws and keeps none, so a change costs no more than the cell's place on
// the screen. The toolkit's own road looks the row up, which takes a walk over all rows for each of some
// thousand cells.
void ListViewView::RowChanged(int index, int cell) {
  if (QAccessible::isActive()) model_.TellCellChanged(index, cell);
  if (cell >= model_.columnCount() || !isVisible()) return;
  const int height = RowHeight();
  const int top = (index - 1 - verticalScrollBar()->value()) * height;
  if (top + height < 0 || top > viewport()->height()) return;
  viewport()->update(columnViewportPosition(cell), top, columnWidth(cell), height);
}

void ListViewView::RowsMoved() {
  if (QAccessible::isActive()) Quietly([&] { model_.TellRowsMoved(); });
  ShowSelection();
  viewport()->update();
  header()->viewport()->update();
}

void ListViewView::ColumnsChanged() {
  Quietly([&] { model_.Reset(); });
  SizeColumns();
  ShowSelection();
}

void ListViewView::SizeColumns() {
  sizedByHand_ = false;
  std::vector<int> told;
  for (const ColumnHeader& column : List().Columns()) told.push_back(Context().scale.PixelsX(column.width));
  const bool before = std::exchange(sizing_, true);
  int section = 0;
  for (const int width : ColumnWidths(told, viewport()->width())) {
    header()->setSectionHidden(section, width < 1);
    if (width >= 1) header()->resizeSection(section, width);
    ++section;
  }
  sizing_ = before;
}

void ListViewView::FitColumns() {
  if (TheControl() && !sizedByHand_) SizeColumns();
}

int ListViewView::RowHeight() const {
  return ListLook(Context().scale, ReadingDirection()).RowHeight(fontMetrics().height());
}

void ListViewView::FitRows() {
  if (!TheControl()) return;
  const int room = ExtentOf(List().Position(), Context().scale).height;
  // Frame, header and a scroll bar below the rows.
  const int around = height() - viewport()->height();
  resize(width(), around + WholeRows(room - around, RowHeight()));
}

// Comes for the list and for the part of it that the rows have: a scroll bar takes from the second alone.
void ListViewView::resizeEvent(QResizeEvent* event) {
  QTreeView::resizeEvent(event);
  FitColumns();
  FitRows();
}

void ListViewView::ShowSelection() {
  const ListRow* selected = List().SelectedItem();
  Quietly([&] {
    // Rows change places every second; a view that went after the selected one would jump under the reader's
    // eyes.
    setAutoScroll(false);
    if (selected)
      selectionModel()->setCurrentIndex(model_.index(List().IndexOf(*selected) - 1, 0),
                                        QItemSelectionModel::ClearAndSelect | QItemSelectionModel::Rows);
    else
      selectionModel()->clear();
    setAutoScroll(true);
  });
}

void ListViewView::currentChanged(const QModelIndex& current, const QModelIndex& previous) {
  QTreeView::currentChanged(current, previous);
  if (quiet_ || !TheControl() || !current.isValid()) return;
  Context().dispatcher.Dispatch([&] {
    if (model_.RowAt(current.row())) List().Select(&List().Row(current.row() + 1));
  });
}

void ListViewView::HeaderClicked(int section) {
  Context().dispatcher.Dispatch([&] {
    if (TheControl()) List().ColumnClick(section + 1);
  });
  header()->viewport()->update();
}

void ListViewView::paintEvent(QPaintEvent* event) {
  QTreeView::paintEvent(event);
  const auto ring = RingOfList(hasFocus(), window()->testAttribute(Qt::WA_KeyboardFocusChange));
  if (!ring) return;
  QPainter painter(viewport());
  painter.setPen(QPen(ToQColor(ring->colour), ring->width));
  const int inset = static_cast<int>(ring->inset);
  painter.drawRect(viewport()->rect().adjusted(inset, inset, -inset, -inset));
}

void ListViewView::keyPressEvent(QKeyEvent* event) {
  if (PassesList(ShiftStateOf(event->modifiers()), !event->text().isEmpty())) return event->ignore();
  QTreeView::keyPressEvent(event);
}

} // namespace quendra::forms::qt
