#include "capture/PortIndex.h"

#include "monitor/MonitorControls.h"
#include "monitor/ProcessRow.h"

#include <gtest/gtest.h>
#include <random>

namespace quendra::capture {
namespace {

/// The search in its plain form: rows from the first, "." + port + "." anywhere in the ports text.
forms::ListRow* PlainSearch(forms::ListView& table, std::int16_t port) {
  const Text what = u"." + DecimalText(port) + u".";
  for (int i = 1; i <= table.Count(); ++i)
    if (table.Row(i).CellText(monitor::kPortsCell).find(what) != Text::npos) return &table.Row(i);
  return nullptr;
}

struct PortIndexTest : testing::Test {
  forms::ListRow& AddRow(const Text& ports) {
    return monitor::AddBareRow(form.main_ListView1, monitor::KeyOfProcess(nextId++), ports);
  }
  monitor::MonitorControls form;
  forms::ListView& rows = form.main_ListView1;
  PortIndex index{rows};
  std::uint32_t nextId = 1;
};

TEST_F(PortIndexTest, An_empty_table_holds_no_port) { EXPECT_EQ(index.RowOf(80), nullptr); }

TEST_F(PortIndexTest, A_port_is_found_at_any_place_of_a_cell) {
  const auto& row = AddRow(u".80.1025.5000.");
  for (const std::int16_t port : {80, 1025, 5000}) EXPECT_EQ(index.RowOf(port), &row) << port;
  EXPECT_EQ(index.RowOf(5001), nullptr);
}

TEST_F(PortIndexTest, A_table_that_was_filled_before_the_index_was_made_is_found) {
  const auto& row = AddRow(u".80.");
  EXPECT_EQ(PortIndex(rows).RowOf(80), &row);
}

TEST_F(PortIndexTest, A_change_of_a_cell_is_seen) {
  auto& row = AddRow(u".80.");
  EXPECT_EQ(index.RowOf(80), &row);
  row.SetCellText(monitor::kPortsCell, u".81.");
  EXPECT_EQ(index.RowOf(80), nullptr);
  EXPECT_EQ(index.RowOf(81), &row);
}

TEST_F(PortIndexTest, Texts_that_no_port_reads_as_are_passed_over) {
  const Text odd[] = {u".080.",  u".+80.", u". 80.",   u".80 .",    u".8O.",       u"80.",     u".80",
                      u"..",     u".",     u"",        u"80",       u".99999999.", u".-0.",    u".-.",
                      u".0x50.", u".8 0.", u".32768.", u".-32769.", u".-080.",     u".65616.", u".8\u05D00."};
  for (const Text& ports : odd) {
    rows.Clear();
    AddRow(ports);
    for (int port = -32768; port <= 32767; ++port)
      ASSERT_EQ(index.RowOf(static_cast<std::int16_t>(port)), nullptr) << ToUtf8(ports) << " " << port;
  }
}

TEST_F(PortIndexTest, The_bounds_of_a_signed_word_are_found) {
  const auto& row = AddRow(u".32767.-32768.-1.0.");
  for (const std::int16_t port : {32767, -32768, -1, 0}) EXPECT_EQ(index.RowOf(port), &row) << port;
}

TEST_F(PortIndexTest, Neighbouring_dots_hide_no_port) {
  const auto& row = AddRow(u"..80...81.");
  EXPECT_EQ(index.RowOf(80), &row);
  EXPECT_EQ(index.RowOf(81), &row);
}

/// Ports texts as passes make them, and texts that nobody makes.
class RandomTable {
 public:
  RandomTable(PortIndexTest& test, unsigned seed) : test_(test), random_(seed) {}

  void Fill() {
    test_.rows.Clear();
    const int count = Below(12);
    for (int i = 0; i < count; ++i) test_.AddRow(Below(4) == 0 ? OddText() : PortsText());
  }
  /// One of the things that happen to a table between two packets.
  void Disturb() {
    forms::ListView& rows = test_.rows;
    if (rows.Count() == 0 || Below(5) == 0) {
      test_.AddRow(PortsText());
      return;
    }
    const int row = 1 + Below(rows.Count());
    switch (Below(4)) {
    case 0: rows.Remove(row); break;
    case 1: rows.Row(row).SetCellText(monitor::kPortsCell, OddText()); break;
    case 2: rows.Row(row).SetCellText(monitor::kDownloadCell, DecimalText(Below(100))); break;
    default: rows.Sort(monitor::kDownloadCell, forms::SortOrder::Descending);
    }
  }
  std::int16_t Port() { return static_cast<std::int16_t>(Below(3) == 0 ? Below(65536) : FewPorts()); }

 private:
  int Below(int bound) { return static_cast<int>(random_() % static_cast<unsigned>(bound)); }
  /// Few enough that rows share them: small ones, the first and last of the range, negative ones.
  int FewPorts() {
    constexpr int kPorts[] = {0, 8, 80, 808, 8080, 1025, 5000, 32767, -32768, -15536, -1, -80};
    return kPorts[Below(std::size(kPorts))];
  }
  Text PortsText() {
    Text text;
    for (int i = Below(6); i > 0; --i) {
      if (text.empty()) text = u".";
      text += DecimalText(FewPorts()) + u".";
    }
    return text;
  }
  Text OddText() {
    constexpr char16_t kUnits[] = u"..0858-+ \u05D01";
    Text text;
    for (int i = Below(14); i > 0; --i) text += kUnits[Below(static_cast<int>(std::size(kUnits)) - 1)];
    return text;
  }

  PortIndexTest& test_;
  std::mt19937 random_;
};

TEST_F(PortIndexTest, On_random_tables_every_answer_is_that_of_the_plain_search) {
  RandomTable table(*this, 20050101);
  int found = 0;
  for (int round = 0; round < 3000; ++round) {
    if (round % 10 == 0) table.Fill();
    table.Disturb();
    for (int i = 0; i < 20; ++i) {
      const std::int16_t port = table.Port();
      forms::ListRow* expected = PlainSearch(rows, port);
      found += expected != nullptr;
      ASSERT_EQ(index.RowOf(port), expected) << "round " << round << ", port " << port;
    }
  }
  EXPECT_GT(found, 10000);
}

} // namespace
} // namespace quendra::capture
