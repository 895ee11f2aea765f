#pragma once

#include "forms/controls/Alignment.h"
#include "forms/controls/Control.h"
#include "forms/controls/ImageList.h"
#include "runtime/Variant.h"

#include <memory>
#include <unordered_map>

namespace quendra::forms {

class ListView;

/// One item of a ListView: a key, a text and a Tag, a small icon, and cells numbered from 1. Cell 0 is the
/// item itself.
class ListRow {
 public:
  ListRow(ListView& list, Text key, Text text, int smallIcon);

  const Text& Key() const { return key_; }
  int SmallIcon() const { return smallIcon_; }
  int CellCount() const { return static_cast<int>(cells_.size()) - 1; }

  /// Fault 9 for a cell that the row lacks.
  const Text& CellText(int cell) const { return At(cell).text; }
  void SetCellText(int cell, Text text);
  /// Appends `tail` to the text; cheap however long the text is.
  void AppendCellText(int cell, TextView tail);
  Variant& CellTag(int cell) { return At(cell).tag; }
  const Variant& CellTag(int cell) const { return At(cell).tag; }
  Colour CellColour(int cell) const { return At(cell).colour; }
  void SetCellColour(int cell, Colour colour);
  bool CellBold(int cell) const { return At(cell).bold; }
  void SetCellBold(int cell, bool bold);

  /// Of the list's small icons, 0 for none. Cell 0 has the row's own.
  int CellIcon(int cell) const { return At(cell).icon; }
  void SetCellIcon(int cell, int icon);
  const Text& CellKey(int cell) const { return At(cell).key; }

  /// The new cell's number.
  int AddCell(Text text, Variant tag = Text(), int icon = 0, Text key = {});

 private:
  friend class ListView;

  struct Cell {
    Text text;
    Variant tag = Text();
    Colour colour = kBlack;
    bool bold = false;
    int icon = 0;
    Text key{};
  };

  const Cell& At(int cell) const;
  Cell& At(int cell);

  ListView& list_;
  Text key_;
  int smallIcon_;
  std::vector<Cell> cells_;
  int index_ = 0;
};

enum class SortOrder { Ascending, Descending };

/// A row of the columns' table: what stands in the header and how the cells below it are laid out.
struct ColumnHeader {
  Text caption{};
  int width = 0; ///< twips
  Alignment alignment = Alignment::Leading;
  int icon = 0; ///< index in the list of header icons, 0 for none
  /// For header icons: what assistive technology says in place of a caption.
  Text description{};
};

/// What a view of a list is told, besides what every control tells.
class ListViewObserver {
 public:
  virtual ~ListViewObserver() = default;
  virtual void RowAdded(int index) = 0;
  virtual void RowRemoved(int index) = 0;
  virtual void RowChanged(int index, int cell) = 0;
  /// Rows stand in another order; none was added or removed.
  virtual void RowsMoved() = 0;
  virtual void RowsCleared() = 0;
  virtual void ColumnsChanged() = 0;
};

/// A table that owns its rows, their order and the selection. Rows are numbered from 1.
class ListView : public Control {
 public:
  using Control::Control;
  void Accept(ControlVisitor& visitor) override { visitor.Visit(*this); }
  bool TakesFocus() const override { return true; }

  void ClearColumns();
  void AddColumn(ColumnHeader column);
  const std::vector<ColumnHeader>& Columns() const { return columns_; }

  int Count() const { return static_cast<int>(rows_.size()); }
  /// Fault 35601 for a row that the list lacks.
  ListRow& Row(int index);
  const ListRow& Row(int index) const;
  /// The row with this key, nullptr when there is none. Finds what a walk from row 1 would find: keys are
  /// unique.
  ListRow* Find(TextView key);
  /// The place of a row of this list now.
  int IndexOf(const ListRow& row) const { return row.index_; }

  /// Adds after the last row; the first row of a list becomes its selection. Fault 457 for a key in use; an
  /// empty key is none.
  ListRow& Add(Text key, Text text, int smallIcon);
  /// A removed selection passes to the row that takes its place, else to the last row.
  void Remove(int index);
  void Clear();

  /// Orders the rows by the text of one cell (0 the item), once, and remembers key and order. Rows that are
  /// equal keep their order; a row without that cell counts as empty. Latin letters compare without regard to
  /// case.
  void Sort(int sortKey, SortOrder order);
  int SortKey() const { return sortKey_; }
  SortOrder Order() const { return order_; }
  bool Sorted() const { return sorted_; }

  /// nullptr when nothing is selected. The selection follows the row, not the index.
  ListRow* SelectedItem() const { return selected_; }
  void Select(ListRow* row);

  /// A number from 1: the header that was clicked.
  Event<int> ColumnClick;

  /// What assistive technology says of the list.
  Text Description;

  ImageList* SmallIcons = nullptr;
  ImageList* HeaderIcons = nullptr;

  /// Grows with every change of the rows, their order or their texts; Tags don't count. An index that was
  /// made of the table holds as long as this number stays the same.
  std::uint64_t Revision() const { return revision_; }

  void Observe(ListViewObserver* observer) { observer_ = observer; }

 private:
  friend class ListRow;
  void CellChanged(const ListRow& row, int cell);
  void Renumber(std::size_t from);

  std::vector<ColumnHeader> columns_;
  std::vector<std::unique_ptr<ListRow>> rows_;
  std::unordered_map<TextView, ListRow*> byKey_;
  ListRow* selected_ = nullptr;
  int sortKey_ = 0;
  SortOrder order_ = SortOrder::Ascending;
  bool sorted_ = false;
  std::uint64_t revision_ = 0;
  ListViewObserver* observer_ = nullptr;
};

} // namespace quendra::forms
