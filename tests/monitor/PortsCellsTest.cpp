#include "monitor/PortsCells.h"

#include "monitor/MonitorControls.h"
#include "monitor/ProcessRow.h"

#include <gtest/gtest.h>

namespace quendra::monitor {

namespace {

struct PortsCellsOfAList : testing::Test {
  MonitorControls controls;
  forms::ListView& list = controls.main_ListView1;
  PortsCells cells{list};

  forms::ListRow& Row(const Text& ports) {
    return AddBareRow(list, u"p" + DecimalText(list.Count() + 1), ports);
  }
};

/// So many ports that searching it often costs more than reading it once.
Text LongPorts() {
  Text text = u".";
  for (int port = 10000; port < 10400; ++port) text += DecimalText(port) + u".";
  return text;
}

void ExpectTheAnswersOfAPlainSearch(PortsCells& cells, const forms::ListRow& row) {
  // All of the small ones, which lie inside others, and one of eleven of the others.
  for (int port = 0; port <= 65535; port += port < 2000 ? 1 : 11) {
    const Text text = DecimalText(port);
    ASSERT_EQ(cells.Contains(row, text), row.CellText(kPortsCell).find(text) != Text::npos) << port;
  }
}

/// Answers the first change of a cell by writing that cell itself.
struct MeddlingView : forms::ListViewObserver {
  explicit MeddlingView(forms::ListView& watched) : list(watched) { list.Observe(this); }
  ~MeddlingView() override { list.Observe(nullptr); }
  void RowChanged(int index, int cell) override {
    if (!std::exchange(answered, true)) list.Row(index).SetCellText(cell, u".7.");
  }
  void RowAdded(int) override {}
  void RowRemoved(int) override {}
  void RowsMoved() override {}
  void RowsCleared() override {}
  void ColumnsChanged() override {}

  forms::ListView& list;
  bool answered = false;
};

} // namespace

TEST_F(PortsCellsOfAList, An_empty_cell_takes_a_first_dot_the_port_and_a_dot) {
  forms::ListRow& row = Row(u"");
  cells.Append(row, u"80");
  EXPECT_EQ(row.CellText(kPortsCell), u".80.");
}

TEST_F(PortsCellsOfAList, A_filled_cell_grows_by_the_port_and_a_dot) {
  forms::ListRow& row = Row(u".80.");
  cells.Append(row, u"1025");
  EXPECT_EQ(row.CellText(kPortsCell), u".80.1025.");
}

TEST_F(PortsCellsOfAList, A_port_is_present_where_its_digits_stand_inside_another) {
  const forms::ListRow& row = Row(u".8080.");
  EXPECT_TRUE(cells.Contains(row, u"80"));
  EXPECT_TRUE(cells.Contains(row, u"808"));
  EXPECT_TRUE(cells.Contains(row, u"0"));
  EXPECT_FALSE(cells.Contains(row, u"800"));
}

TEST_F(PortsCellsOfAList, Every_port_of_a_long_cell_answers_as_a_plain_search_does) {
  ExpectTheAnswersOfAPlainSearch(cells, Row(LongPorts()));
}

TEST_F(PortsCellsOfAList, Texts_that_are_no_ports_answer_as_a_plain_search_does) {
  Text text = LongPorts() + u"00123..4567890123.x9y.65536.99999.000.";
  ExpectTheAnswersOfAPlainSearch(cells, Row(text));
}

TEST_F(PortsCellsOfAList, A_long_cell_that_grows_answers_as_a_plain_search_does) {
  forms::ListRow& row = Row(LongPorts() + u"123");
  ExpectTheAnswersOfAPlainSearch(cells, row);
  cells.Append(row, u"54321");
  cells.Append(row, u"60606");
  ExpectTheAnswersOfAPlainSearch(cells, row);
}

TEST_F(PortsCellsOfAList, A_cell_that_somebody_else_writes_is_read_anew) {
  forms::ListRow& row = Row(LongPorts());
  ExpectTheAnswersOfAPlainSearch(cells, row);
  row.SetCellText(kPortsCell, u".7.");
  ExpectTheAnswersOfAPlainSearch(cells, row);
}

TEST_F(PortsCellsOfAList, A_cell_that_is_written_in_answer_to_its_growth_is_read_anew) {
  forms::ListRow& row = Row(LongPorts());
  ExpectTheAnswersOfAPlainSearch(cells, row);
  MeddlingView view(list);
  cells.Append(row, u"54321");
  ASSERT_EQ(row.CellText(kPortsCell), u".7.");
  ExpectTheAnswersOfAPlainSearch(cells, row);
}

TEST_F(PortsCellsOfAList, A_row_that_takes_the_place_of_a_removed_one_is_read_anew) {
  ExpectTheAnswersOfAPlainSearch(cells, Row(LongPorts()));
  list.Remove(1);
  ExpectTheAnswersOfAPlainSearch(cells, Row(u".7."));
}

} // namespace quendra::monitor
