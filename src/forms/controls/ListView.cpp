#include "forms/controls/ListView.h"

#include "runtime/Fault.h"

#include <algorithm>

namespace quendra::forms {

ListRow::ListRow(ListView& list, Text key, Text text, int smallIcon)
    : list_(list), key_(std::move(key)), smallIcon_(smallIcon) {
  cells_.push_back({std::move(text), {}});
}

const ListRow::Cell& ListRow::At(int cell) const {
  if (cell < 0 || cell >= static_cast<int>(cells_.size())) throw Fault(Fault::kSubscript);
  return cells_[static_cast<std::size_t>(cell)];
}

ListRow::Cell& ListRow::At(int cell) { return const_cast<Cell&>(std::as_const(*this).At(cell)); }

void ListRow::SetCellText(int cell, Text text) {
  Text& current = At(cell).text;
  if (current == text) return;
  current = std::move(text);
  list_.CellChanged(*this, cell);
}

void ListRow::AppendCellText(int cell, TextView tail) {
  if (tail.empty()) return;
  At(cell).text.append(tail);
  list_.CellChanged(*this, cell);
}

void ListRow::SetCellColour(int cell, Colour colour) {
  if (std::exchange(At(cell).colour, colour) != colour) list_.CellChanged(*this, cell);
}

void ListRow::SetCellBold(int cell, bool bold) {
  if (std::exchange(At(cell).bold, bold) != bold) list_.CellChanged(*this, cell);
}

void ListRow::SetCellIcon(int cell, int icon) {
  if (std::exchange(At(cell).icon, icon) != icon) list_.CellChanged(*this, cell);
}

int ListRow::AddCell(Text text, Variant tag, int icon, Text key) {
  cells_.push_back({std::move(text), std::move(tag), kBlack, false, icon, std::move(key)});
  list_.CellChanged(*this, CellCount());
  return CellCount();
}

void ListView::ClearColumns() {
  columns_.clear();
  if (observer_) observer_->ColumnsChanged();
}

void ListView::AddColumn(ColumnHeader column) {
  columns_.push_back(std::move(column));
  if (observer_) observer_->ColumnsChanged();
}

const ListRow& ListView::Row(int index) const {
  if (index < 1 || index > Count()) throw Fault(Fault::kNoSuchElement);
  return *rows_[static_cast<std::size_t>(index - 1)];
}

ListRow& ListView::Row(int index) { return const_cast<ListRow&>(std::as_const(*this).Row(index)); }

ListRow* ListView::Find(TextView key) {
  const auto found = byKey_.find(key);
  return found == byKey_.end() ? nullptr : found->second;
}

ListRow& ListView::Add(Text key, Text text, int smallIcon) {
  if (!key.empty() && byKey_.contains(key)) throw Fault(Fault::kDuplicateKey);
  rows_.push_back(std::make_unique<ListRow>(*this, std::move(key), std::move(text), smallIcon));
  ListRow& row = *rows_.back();
  row.index_ = Count();
  if (!row.Key().empty()) byKey_.emplace(row.Key(), &row);
  ++revision_;
  if (observer_) observer_->RowAdded(row.index_);
  if (Count() == 1) Select(&row);
  return row;
}

void ListView::Remove(int index) {
  ListRow& row = Row(index);
  const bool wasSelected = selected_ == &row;
  if (wasSelected) selected_ = nullptr;
  byKey_.erase(row.Key());
  const std::unique_ptr<ListRow> removed = std::move(rows_[static_cast<std::size_t>(index - 1)]);
  rows_.erase(rows_.begin() + (index - 1));
  Renumber(static_cast<std::size_t>(index - 1));
  ++revision_;
  if (observer_) observer_->RowRemoved(index);
  if (wasSelected) Select(rows_.empty() ? nullptr : &Row(std::min(index, Count())));
}

void ListView::Clear() {
  if (rows_.empty()) return;
  selected_ = nullptr;
  byKey_.clear();
  rows_.clear();
  ++revision_;
  if (observer_) observer_->RowsCleared();
}

void ListView::Sort(int sortKey, SortOrder order) {
  sortKey_ = sortKey;
  order_ = order;
  sorted_ = true;
  static const Text kNone;
  const auto textOf = [&](const std::unique_ptr<ListRow>& row) -> const Text& {
    return sortKey_ < 0 || sortKey_ > row->CellCount() ? kNone : row->CellText(sortKey_);
  };
  const auto lowered = [](char16_t unit) { return unit >= u'A' && unit <= u'Z' ? unit + 32 : unit; };
  const auto below = [&](const Text& left, const Text& right) {
    return std::lexicographical_compare(left.begin(), left.end(), right.begin(), right.end(),
                                        [&](char16_t a, char16_t b) { return lowered(a) < lowered(b); });
  };
  const auto before = [&](const auto& left, const auto& right) {
    return order_ == SortOrder::Ascending ? below(textOf(left), textOf(right))
                                          : below(textOf(right), textOf(left));
  };
  if (std::is_sorted(rows_.begin(), rows_.end(), before)) return;
  std::stable_sort(rows_.begin(), rows_.end(), before);
  Renumber(0);
  ++revision_;
  if (observer_) observer_->RowsMoved();
}

void ListView::Select(ListRow* row) {
  if (std::exchange(selected_, row) != row) TellChanged(*this, Aspect::Selection);
}

void ListView::CellChanged(const ListRow& row, int cell) {
  ++revision_;
  if (observer_) observer_->RowChanged(row.index_, cell);
}

void ListView::Renumber(std::size_t from) {
  for (std::size_t i = from; i < rows_.size(); ++i) rows_[i]->index_ = static_cast<int>(i) + 1;
}

} // namespace quendra::forms
