#include "forms/win32/views/list/DueCells.h"

#include <gtest/gtest.h>

namespace quendra::forms::win32 {

namespace {

/// Five rows from number 10 on, each of three cells.
RowsInSight Sight() {
  return {10, 5, {{0, 30}, {90, 20}}, {{{0, 0}, {40, 20}}, {{40, 0}, {30, 20}}, {{70, 0}, {20, 20}}}};
}

} // namespace

TEST(DueCells, Have_nothing_to_be_drawn_at_first_and_once_they_were_taken) {
  DueCells due;
  EXPECT_TRUE(due.Take(Sight()).empty());

  due.Add(10, 1);
  due.AddFrom(12);

  EXPECT_FALSE(due.Take(Sight()).empty());
  EXPECT_TRUE(due.Take(Sight()).empty());
}

TEST(DueCells, Are_those_in_sight_alone) {
  DueCells due;
  for (const int row : {-1, 9, 15, 300}) due.Add(row, 0);

  EXPECT_TRUE(due.Take(Sight()).empty());
}

TEST(DueCells, Reach_from_the_first_to_the_last_cell_that_changed) {
  DueCells due;
  due.Add(11, 1);
  due.Add(11, 2);

  EXPECT_EQ(due.Take(Sight()), (std::vector<Area>{{{40, 50}, {50, 20}}}));
}

TEST(DueCells, Of_rows_side_by_side_are_one_place) {
  DueCells due;
  for (const int row : {14, 12, 10, 11}) due.Add(row, 0);

  EXPECT_EQ(due.Take(Sight()), (std::vector<Area>{{{0, 30}, {40, 60}}, {{0, 110}, {40, 20}}}));
}

TEST(DueCells, Of_a_whole_row_reach_across_the_window) {
  DueCells due;
  due.Add(13);

  EXPECT_EQ(due.Take(Sight()), (std::vector<Area>{{{0, 90}, {90, 20}}}));
}

TEST(DueCells, From_a_row_on_reach_to_the_foot_of_the_window) {
  DueCells due;
  due.AddFrom(13);
  due.AddFrom(20);
  EXPECT_EQ(due.Take(Sight()), (std::vector<Area>{{{0, 90}, {90, 40}}}));

  due.AddFrom(3);
  EXPECT_EQ(due.Take(Sight()), (std::vector<Area>{{{0, 30}, {90, 100}}}));
}

TEST(DueCells, Of_a_cell_without_a_column_or_of_a_hidden_one_need_no_more_than_their_row) {
  DueCells due;
  due.Add(10, 7);
  EXPECT_EQ(due.Take(Sight()), (std::vector<Area>{{{0, 30}, {90, 20}}}));

  RowsInSight sight = Sight();
  sight.cells[2].extent.width = 0;
  due.Add(10, 2);
  EXPECT_TRUE(due.Take(sight).empty());
}

} // namespace quendra::forms::win32
