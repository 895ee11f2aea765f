#include "forms/view/ListLook.h"

#include "forms/view/BareForm.h"
#include "forms/view/Palette.h"

#include <gtest/gtest.h>

namespace quendra::forms {
namespace {

const ListLook kHebrewList(Scale(), Direction::RightToLeft);
const ListLook kLatinList(Scale(), Direction::LeftToRight);
const ListLook kSmaller(Scale().Zoomed(0.8), Direction::LeftToRight);
constexpr Area kCell{{100, 50}, {200, 27}};

TEST(ListRows, Are_as_high_as_their_letters_or_their_icon_need) {
  EXPECT_EQ(kLatinList.RowHeight(12), 26);
  EXPECT_EQ(kLatinList.RowHeight(17), 27);
  EXPECT_EQ(kSmaller.RowHeight(10), 21);
  EXPECT_EQ(kLatinList.HeaderHeight(17), 33);
}

TEST(ListRows, Take_turns_on_two_grounds_and_show_which_one_is_selected) {
  EXPECT_EQ(RowGround(0, false), Palette::Page);
  EXPECT_EQ(RowGround(1, false), Palette::QuietPage);
  EXPECT_EQ(RowGround(2, false), Palette::Page);
  EXPECT_EQ(RowGround(1, true), Palette::Selection);
}

TEST(ListCells, Keep_their_text_off_both_edges) {
  EXPECT_EQ(kLatinList.TextPlace(kCell, 1), (Area{{108, 50}, {184, 27}}));
  EXPECT_EQ(kHebrewList.TextPlace(kCell, 1), (Area{{108, 50}, {184, 27}}));
}

TEST(ListCells, Have_the_icon_at_the_leading_edge_of_the_first_and_its_text_beside_it) {
  EXPECT_EQ(kLatinList.IconPlace(kCell), (Area{{108, 54}, {20, 20}}));
  EXPECT_EQ(kLatinList.TextPlace(kCell, 0), (Area{{136, 50}, {156, 27}}));
  EXPECT_EQ(kHebrewList.IconPlace(kCell), (Area{{272, 54}, {20, 20}}));
  EXPECT_EQ(kHebrewList.TextPlace(kCell, 0), (Area{{108, 50}, {156, 27}}));
}

TEST(ListCells, Align_their_texts_as_the_form_reads) {
  EXPECT_EQ(kHebrewList.SideOf(Alignment::Leading), Side::Right);
  EXPECT_EQ(kLatinList.SideOf(Alignment::Leading), Side::Left);
}

TEST(ListCells, Have_the_ink_that_they_were_given) {
  BareForm form;
  ListView list(form, u"list");
  ListRow& row = list.Add(u"key", u"text", 0);
  EXPECT_EQ(CellInk(row, 0), Palette::Ink);

  row.SetCellColour(0, kRed);

  EXPECT_EQ(CellInk(row, 0), kRed);
}

TEST(ListRing, Is_there_for_those_who_use_the_keys) {
  EXPECT_FALSE(RingOfList(true, false));
  EXPECT_FALSE(RingOfList(false, true));
  const auto ring = RingOfList(true, true);
  ASSERT_TRUE(ring);
  EXPECT_EQ(ring->colour, Palette::Focus);
  EXPECT_GE(ring->inset - ring->width / 2.0, 0);
}

TEST(ListHeaders, End_in_a_line_towards_the_next) {
  const Area header{{100, 0}, {80, 33}};

  EXPECT_EQ(kLatinList.Divider(header), (Area{{179, 7}, {1, 19}}));
  EXPECT_EQ(kHebrewList.Divider(header), (Area{{100, 7}, {1, 19}}));
  EXPECT_EQ(ListLook::HeaderEdge(header), (Area{{100, 32}, {80, 1}}));
}

TEST(ListHeaders, Show_icons_no_larger_than_the_form_and_no_larger_than_there_is_room) {
  const Area header{{0, 0}, {84, 32}};

  EXPECT_DOUBLE_EQ(kLatinList.IconShare(20, 20, header), 1);
  EXPECT_DOUBLE_EQ(kSmaller.IconShare(20, 20, header), 0.8);
  EXPECT_DOUBLE_EQ(kLatinList.IconShare(48, 48, header), 0.5);
  EXPECT_DOUBLE_EQ(kLatinList.IconShare(160, 20, header), 0.5);
  EXPECT_DOUBLE_EQ(kLatinList.IconShare(20, 20, {{0, 0}, {2, 32}}), 0);
  EXPECT_DOUBLE_EQ(kLatinList.IconShare(0, 0, header), 0);
}

TEST(ListHeaders, Have_an_arrow_at_the_end_that_points_the_way_of_the_order) {
  const Area header{{100, 0}, {80, 33}};

  const auto up = kLatinList.Arrow(header, SortOrder::Ascending);
  const auto down = kHebrewList.Arrow(header, SortOrder::Descending);

  EXPECT_DOUBLE_EQ(up[2].x, 165);
  EXPECT_LT(up[2].y, up[0].y);
  EXPECT_DOUBLE_EQ(down[2].x, 114);
  EXPECT_GT(down[2].y, down[0].y);
  EXPECT_DOUBLE_EQ(up[1].x - up[0].x, 8);
}

TEST(ListHeaders, Show_the_arrow_where_the_rows_are_sorted_by_them_and_nowhere_before) {
  BareForm form;
  ListView list(form, u"list");
  EXPECT_FALSE(ShowsArrow(list, 0));

  list.Sort(2, SortOrder::Ascending);

  EXPECT_TRUE(ShowsArrow(list, 2));
  EXPECT_FALSE(ShowsArrow(list, 0));
}

} // namespace
} // namespace quendra::forms
