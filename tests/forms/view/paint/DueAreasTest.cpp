#include "forms/view/paint/DueAreas.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace quendra::forms {

namespace {

constexpr Area kAll{{-10000, -10000}, {20000, 20000}};

} // namespace

TEST(DueAreas, Are_due_until_they_were_taken) {
  DueAreas due;
  const Area area{{10, 20}, {30, 40}};
  due.Add(area);

  EXPECT_TRUE(due.TakeThoseIn({{0, 0}, {10, 100}}).empty());
  EXPECT_EQ(due.TakeThoseIn({{39, 59}, {5, 5}}), std::vector<Area>{area});
  EXPECT_TRUE(due.TakeThoseIn(kAll).empty());
}

TEST(DueAreas, Without_extent_are_none) {
  DueAreas due;
  due.Add({{1, 1}, {0, 5}});
  due.Add({{1, 1}, {5, -1}});

  EXPECT_TRUE(due.TakeThoseIn(kAll).empty());
}

TEST(DueAreas, That_lie_within_or_beside_each_other_become_one) {
  DueAreas due;
  due.Add({{0, 0}, {100, 10}});
  due.Add({{50, 2}, {10, 5}});
  due.Add({{0, 10}, {100, 10}});

  EXPECT_EQ(due.TakeThoseIn(kAll), (std::vector<Area>{{{0, 0}, {100, 20}}}));
}

TEST(DueAreas, That_lie_far_apart_stay_two_until_another_joins_them) {
  DueAreas due;
  due.Add({{0, 0}, {10, 10}});
  due.Add({{30, 0}, {10, 10}});
  EXPECT_EQ(due.TakeThoseIn({{0, 0}, {1, 1}}), (std::vector<Area>{{{0, 0}, {10, 10}}}));

  due.Add({{0, 0}, {10, 10}});
  due.Add({{10, 0}, {20, 10}});
  EXPECT_EQ(due.TakeThoseIn(kAll), (std::vector<Area>{{{0, 0}, {40, 10}}}));
}

TEST(DueAreas, Stay_few_and_lose_nothing) {
  DueAreas due;
  for (int i = 0; i < 100; ++i) due.Add({{i * 50, i % 7 * 300}, {2, 2}});

  const std::vector<Area> areas = due.TakeThoseIn(kAll);

  EXPECT_LE(areas.size(), 12U);
  for (int i = 0; i < 100; ++i) {
    const Spot spot{i * 50, i % 7 * 300};
    EXPECT_TRUE(std::any_of(areas.begin(), areas.end(), [&](const Area& area) {
      return spot.left >= area.corner.left && spot.left + 2 <= area.Right() && spot.top >= area.corner.top &&
             spot.top + 2 <= area.Bottom();
    })) << i;
  }
}

} // namespace quendra::forms
