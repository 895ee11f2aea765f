#include "forms/qt/QtFixture.h"

#include "forms/qt/drawing/Conversion.h"
#include "forms/view/ListLook.h"

#include <QHeaderView>
#include <QPaintEvent>
#include <QScrollBar>
#include <QTreeView>

namespace quendra::forms::qt {

class TableView : public QtFixture {
 protected:
  TableView() {
    form.design = [this] { list.Move(0, 0, 6000, 4500); };
    list.AddColumn({u"יישום", 1500});
    list.AddColumn({u"פורטים", 1500, Alignment::Trailing});
  }

  ListRow& AddRow(const Text& name) {
    ListRow& row = list.Add(u"p" + name, name, 0);
    row.AddCell(u".80.", {});
    return row;
  }
  QTreeView& View() { return As<QTreeView>(list); }
  QString Shown(int row, int column) { return View().model()->index(row, column).data().toString(); }
  int SelectedRow() { return View().currentIndex().row(); }

  ListView list{form, u"main_ListView1"};
};

TEST_F(TableView, Rows_that_were_there_before_the_view_are_shown) {
  AddRow(u"alpha");
  AddRow(u"beta");

  desktop.Show(form);

  EXPECT_EQ(View().model()->rowCount(), 2);
  EXPECT_EQ(Shown(1, 0), QStringLiteral("beta"));
  EXPECT_EQ(Shown(1, 1), QStringLiteral(".80."));
  EXPECT_EQ(SelectedRow(), 0);
}

TEST_F(TableView, Adding_removing_and_clearing_reach_the_view) {
  desktop.Show(form);
  AddRow(u"alpha");
  AddRow(u"beta");
  EXPECT_EQ(View().model()->rowCount(), 2);

  list.Remove(1);
  EXPECT_EQ(View().model()->rowCount(), 1);
  EXPECT_EQ(Shown(0, 0), QStringLiteral("beta"));

  list.Clear();
  EXPECT_EQ(View().model()->rowCount(), 0);
  EXPECT_FALSE(View().currentIndex().isValid());
}

TEST_F(TableView, The_selection_follows_its_row_through_a_sort) {
  desktop.Show(form);
  AddRow(u"alpha");
  AddRow(u"beta");
  list.Select(&list.Row(1));

  list.Sort(0, SortOrder::Descending);

  EXPECT_EQ(Shown(0, 0), QStringLiteral("beta"));
  EXPECT_EQ(SelectedRow(), 1);
  EXPECT_EQ(list.SelectedItem()->Key(), u"palpha");
}

TEST_F(TableView, Removing_the_selected_row_selects_the_one_that_takes_its_place) {
  desktop.Show(form);
  for (const Text name : {u"a", u"b", u"c"}) AddRow(name);
  list.Select(&list.Row(2));

  list.Remove(2);

  EXPECT_EQ(SelectedRow(), 1);
  EXPECT_EQ(list.SelectedItem()->Key(), u"pc");
}

TEST_F(TableView, Removing_a_row_above_the_selected_one_keeps_the_selection_on_its_row) {
  desktop.Show(form);
  for (const Text name : {u"a", u"b", u"c"}) AddRow(name);
  list.Select(&list.Row(3));

  list.Remove(1);

  EXPECT_EQ(SelectedRow(), 1);
  EXPECT_EQ(list.SelectedItem()->Key(), u"pc");
}

TEST_F(TableView, The_users_choice_becomes_the_lists_selection) {
  desktop.Show(form);
  AddRow(u"alpha");
  AddRow(u"beta");

  PressKey(View(), Qt::Key_Down);

  EXPECT_EQ(list.SelectedItem()->Key(), u"pbeta");
  EXPECT_EQ(SelectedRow(), 1);
}

TEST_F(TableView, Rows_that_move_do_not_scroll_the_view) {
  desktop.Show(form);
  for (int i = 0; i < 200; ++i) AddRow(DecimalText(1000 + i));
  QCoreApplication::processEvents();
  View().verticalScrollBar()->setValue(0);

  list.Sort(0, SortOrder::Descending);

  EXPECT_EQ(SelectedRow(), 199);
  EXPECT_EQ(View().verticalScrollBar()->value(), 0);
}

TEST_F(TableView, A_header_click_raises_the_columns_number_from_1_and_sorts_nothing) {
  desktop.Show(form);
  AddRow(u"beta");
  AddRow(u"alpha");
  int clicked = 0;
  list.ColumnClick = [&](int header) { clicked = header; };

  emit View().header()->sectionClicked(1);

  EXPECT_EQ(clicked, 2);
  EXPECT_EQ(Shown(0, 0), QStringLiteral("beta"));
}

TEST_F(TableView, Columns_take_their_width_in_twips_and_one_of_2_twips_is_hidden) {
  list.AddColumn({u"שימוש כולל", 2});

  desktop.Show(form);

  EXPECT_EQ(View().header()->sectionSize(0), 100);
  EXPECT_FALSE(View().header()->isSectionHidden(1));
  EXPECT_TRUE(View().header()->isSectionHidden(2));
}

TEST_F(TableView, Columns_with_too_little_room_are_shown_in_proportion_and_need_no_scroll_bar) {
  list.AddColumn({u"יוצר", 6000});

  desktop.Show(form);

  const int room = View().viewport()->width();
  EXPECT_EQ(View().header()->length(), room);
  EXPECT_NEAR(View().header()->sectionSize(0), room / 6.0, 1);
  EXPECT_FALSE(View().horizontalScrollBar()->isVisible());
}

TEST_F(TableView, Columns_in_proportion_make_room_for_the_scroll_bar_of_many_rows) {
  list.AddColumn({u"יוצר", 6000});
  desktop.Show(form);

  for (int i = 0; i < 200; ++i) AddRow(DecimalText(1000 + i));

  EXPECT_TRUE(RunUntil([&] { return View().verticalScrollBar()->isVisible(); }));
  EXPECT_EQ(View().header()->length(), View().viewport()->width());
}

TEST_F(TableView, A_column_that_the_user_sized_stays_so_until_the_columns_are_set_up_anew) {
  desktop.Show(form);
  View().header()->resizeSection(0, 250);
  for (int i = 0; i < 200; ++i) AddRow(DecimalText(1000 + i));
  QCoreApplication::processEvents();
  EXPECT_EQ(View().header()->sectionSize(0), 250);

  list.ClearColumns();
  list.AddColumn({u"יחיד", 1500});

  EXPECT_EQ(View().header()->sectionSize(0), 100);
}

TEST_F(TableView, Only_whole_rows_are_shown_whatever_the_height_and_the_letters) {
  for (int i = 0; i < 200; ++i) AddRow(DecimalText(1000 + i));
  desktop.Show(form);

  for (const int points : {7, 9, 11})
    for (int height = 3990; height < 4500; height += 45) {
      list.TextFont = Font{points, false, false};
      list.Move(0, 0, 6000, height);
      QCoreApplication::processEvents();
      const int row = View().visualRect(View().model()->index(0, 0)).height();
      EXPECT_EQ(View().viewport()->height() % row, 0) << points << " " << height;
      EXPECT_LE(View().height(), height / kPixel);
      EXPECT_GT(View().height(), height / kPixel - row);
    }
}

TEST_F(TableView, Only_whole_rows_are_shown_above_the_scroll_bar_of_wide_columns) {
  for (int i = 0; i < 200; ++i) AddRow(DecimalText(1000 + i));
  desktop.Show(form);

  View().header()->resizeSection(0, 900);

  ASSERT_TRUE(RunUntil([&] { return View().horizontalScrollBar()->isVisible(); }));
  EXPECT_EQ(View().viewport()->height() % View().visualRect(View().model()->index(0, 0)).height(), 0);
  EXPECT_LE(View().height(), 300);
}

TEST_F(TableView, A_scrolled_list_starts_with_a_whole_row) {
  for (int i = 0; i < 200; ++i) AddRow(DecimalText(1000 + i));
  desktop.Show(form);

  View().verticalScrollBar()->setValue(View().verticalScrollBar()->maximum());

  const QRect last = View().visualRect(View().model()->index(199, 0));
  EXPECT_EQ(last.bottom(), View().viewport()->height() - 1);
  EXPECT_EQ(View().visualRect(View().indexAt({5, 1})).top(), 0);
}

TEST_F(TableView, Columns_set_up_anew_replace_the_old_ones) {
  desktop.Show(form);

  list.ClearColumns();
  list.AddColumn({u"יחיד", 3000});

  EXPECT_EQ(View().model()->columnCount(), 1);
  EXPECT_EQ(View().header()->sectionSize(0), 200);
}

TEST_F(TableView, Control_characters_and_line_breaks_are_shown_as_signs_on_one_line) {
  desktop.Show(form);
  AddRow(u"a\nb\r\tc\x7F");

  EXPECT_EQ(Shown(0, 0), QStringLiteral("a\u240Ab\u240D\u2409c\u2421"));
}

TEST_F(TableView, Direction_overrides_and_broken_code_units_are_shown_as_signs) {
  desktop.Show(form);
  AddRow(Text(u"evil\u202Etxt.exe") + static_cast<char16_t>(0xD800));

  EXPECT_EQ(Shown(0, 0), QStringLiteral("evil\uFFFDtxt.exe\uFFFD"));
}

TEST_F(TableView, A_text_of_4_KB_is_cut_and_its_tip_is_plain_text) {
  desktop.Show(form);
  AddRow(u"<b>" + Text(4096, u'w'));

  EXPECT_EQ(Shown(0, 0).size(), 1025);
  EXPECT_TRUE(Shown(0, 0).endsWith(QChar(0x2026)));
  const QString tip = View().model()->index(0, 0).data(Qt::ToolTipRole).toString();
  EXPECT_TRUE(tip.contains(QStringLiteral("&lt;b&gt;www")));
  View().grab();
}

TEST_F(TableView, A_selected_row_has_its_plain_ground_in_a_list_with_the_focus_too) {
  desktop.Show(form);
  AddRow(u"1");
  View().setFocus();
  View().window()->setAttribute(Qt::WA_KeyboardFocusChange);
  QCoreApplication::processEvents();

  const QImage image = View().viewport()->grab().toImage();

  const QRect row = View().visualRect(View().model()->index(0, 0));
  for (int y = row.top() + 4; y <= row.bottom(); ++y)
    EXPECT_EQ(image.pixelColor(row.right() - 4, y), ToQColor(RowGround(0, true))) << y;
}

TEST_F(TableView, A_leading_cell_stands_at_the_right_edge_of_a_mirrored_form) {
  list.ClearColumns();
  list.AddColumn({u"", 5700});
  desktop.Show(form);
  list.Add(u"p1", u"x", 0).SetCellColour(0, kRed);
  QCoreApplication::processEvents();

  const QImage image = View().viewport()->grab().toImage();
  int leftmost = image.width();
  int rightmost = 0;
  for (int y = 0; y < 26; ++y)
    for (int x = 0; x < image.width(); ++x)
      if (image.pixelColor(x, y).red() > 200 && image.pixelColor(x, y).green() < 120) {
        leftmost = std::min(leftmost, x);
        rightmost = std::max(rightmost, x);
      }
  // At the right, but for the place of the row's icon.
  EXPECT_GT(leftmost, image.width() / 2);
  EXPECT_GT(rightmost, image.width() - 80);
}

TEST_F(TableView, Cells_are_drawn_with_their_icon) {
  ImageList icons(form, u"main_ImList");
  icons.Add(Picture::Of({2, 2, {0xFFFF0000, 0xFFFF0000, 0xFFFF0000, 0xFFFF0000}}));
  list.SmallIcons = &icons;
  desktop.Show(form);
  list.Add(u"p1", u"", 1);
  list.Add(u"p2", u"", 7);
  QCoreApplication::processEvents();

  const QImage image = View().viewport()->grab().toImage();

  EXPECT_LT(image.pixelColor(image.width() - 18, 13).green(), 64);
  EXPECT_GT(image.pixelColor(image.width() - 18, 39).green(), 192);
}

TEST_F(TableView, A_cell_that_its_row_lacks_is_empty) {
  desktop.Show(form);
  list.Add(u"p1", u"alone", 0);

  EXPECT_TRUE(Shown(0, 1).isEmpty());
  View().grab();
}

TEST_F(TableView, A_changed_cell_is_painted_anew_and_nothing_else) {
  desktop.Show(form);
  for (int i = 0; i < 10; ++i) AddRow(DecimalText(i));
  for (int i = 0; i < 10; ++i) QCoreApplication::processEvents();
  struct PaintedRegion : QObject {
    bool eventFilter(QObject*, QEvent* event) override {
      if (event->type() == QEvent::Paint) region += static_cast<QPaintEvent*>(event)->region();
      return false;
    }
    QRegion region;
  } painted;
  View().viewport()->installEventFilter(&painted);

  list.Row(3).SetCellText(1, u".443.");
  QCoreApplication::processEvents();

  const QRect cell = View().visualRect(View().model()->index(2, 1));
  EXPECT_EQ(painted.region.boundingRect(), cell.intersected(View().viewport()->rect()));
}

TEST_F(TableView, A_row_of_5000_that_changes_out_of_sight_paints_nothing) {
  desktop.Show(form);
  for (int i = 0; i < 5000; ++i) AddRow(DecimalText(i));
  QCoreApplication::processEvents();
  int paints = 0;
  struct PaintCounter : QObject {
    explicit PaintCounter(int& count) : count_(count) {}
    bool eventFilter(QObject*, QEvent* event) override {
      count_ += event->type() == QEvent::Paint;
      return false;
    }
    int& count_;
  } counter(paints);
  View().viewport()->installEventFilter(&counter);

  list.Row(4900).SetCellText(1, u".443.");
  QCoreApplication::processEvents();

  EXPECT_EQ(paints, 0);
}

} // namespace quendra::forms::qt
