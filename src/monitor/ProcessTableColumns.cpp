#include "monitor/ProcessTable.h"

#include <array>

namespace quendra::monitor {

namespace {

using forms::Alignment;

struct Column {
  const char16_t* caption;
  int width; ///< twips
  Alignment alignment;
  int icon;
  const char16_t* description;
};

/// The last two are there for their cells and too narrow to be seen.
constexpr std::array<Column, 9> kColumns{{
    {u"יישום", 3765, Alignment::Leading, 0, u""},
    {u"שם תהליך", 3765, Alignment::Leading, 0, u""},
    {u"יוצר", 2381, Alignment::Leading, 0, u""},
    {u"פורטים", 2249, Alignment::Trailing, 0, u""},
    {u"", 1296, Alignment::Centre, 1, u"העלאה"},
    {u"", 1402, Alignment::Centre, 2, u"הורדה"},
    {u"סה\"כ", 1455, Alignment::Leading, 0, u""},
    {u"שימוש כולל", 2, Alignment::Leading, 0, u""},
    {u"", 2, Alignment::Leading, 0, u""},
}};

} // namespace

void ProcessTable::PrepareTable() {
  forms::ListView& list = controls_.main_ListView1;
  list.Clear();
  list.ClearColumns();
  for (const Column& column : kColumns)
    list.AddColumn({column.caption, column.width, column.alignment, column.icon, column.description});
  SortPinned = kFalse16;
}

void ProcessTable::main_ListView1_ColumnClick(int header) {
  forms::ListView& list = controls_.main_ListView1;
  const int key = header - 1;
  const bool turnsOver = key == list.SortKey() && list.Order() == forms::SortOrder::Ascending;
  list.Sort(key, turnsOver ? forms::SortOrder::Descending : forms::SortOrder::Ascending);
}

} // namespace quendra::monitor
