#include "forms/view/ListLayout.h"

#include <gtest/gtest.h>

#include <numeric>

namespace quendra::forms {
namespace {

int SumOf(const std::vector<int>& widths) { return std::accumulate(widths.begin(), widths.end(), 0); }

TEST(ColumnWidths, Are_as_told_where_there_is_room) {
  EXPECT_EQ(ColumnWidths({251, 251, 159}, 661), (std::vector{251, 251, 159}));
  EXPECT_EQ(ColumnWidths({251, 251, 159}, 2000), (std::vector{251, 251, 159}));
}

TEST(ColumnWidths, Keep_their_proportion_where_there_is_less_room) {
  EXPECT_EQ(ColumnWidths({400, 200, 200}, 400), (std::vector{200, 100, 100}));
}

TEST(ColumnWidths, Fill_every_smaller_room_to_the_last_pixel_and_differ_from_their_share_by_less_than_one) {
  const std::vector<int> told{251, 251, 159, 150, 86, 93, 97, 0, 0};
  const int sum = SumOf(told);
  for (int room = 0; room < sum; ++room) {
    const std::vector<int> shown = ColumnWidths(told, room);
    ASSERT_EQ(SumOf(shown), room);
    for (std::size_t i = 0; i < told.size(); ++i)
      ASSERT_NEAR(shown[i], static_cast<double>(told[i]) * room / sum, 1) << room;
  }
}

TEST(ColumnWidths, Of_a_hidden_column_stay_0) { EXPECT_EQ(ColumnWidths({300, 0, 300}, 301)[1], 0); }

TEST(ColumnWidths, Of_no_columns_or_before_there_is_a_view_are_as_told) {
  EXPECT_TRUE(ColumnWidths({}, 0).empty());
  EXPECT_EQ(ColumnWidths({10}, -1), (std::vector{10}));
}

TEST(WholeRows, Fill_the_height_as_far_as_no_row_is_cut) {
  EXPECT_EQ(WholeRows(378, 27), 378);
  EXPECT_EQ(WholeRows(377, 27), 351);
  EXPECT_EQ(WholeRows(26, 27), 0);
}

TEST(WholeRows, Of_no_height_leave_the_height_as_it_is) {
  EXPECT_EQ(WholeRows(100, 0), 100);
  EXPECT_EQ(WholeRows(-5, 27), 0);
}

} // namespace
} // namespace quendra::forms
