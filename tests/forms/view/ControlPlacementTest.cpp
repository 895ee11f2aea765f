#include "forms/view/ControlPlacement.h"

#include "forms/controls/Controls.h"
#include "forms/view/BareForm.h"

#include <gtest/gtest.h>

namespace quendra::forms {
namespace {

constexpr Direction kHebrew = Direction::RightToLeft;
constexpr Direction kLatin = Direction::LeftToRight;
constexpr Scale kScreen{15, 15};
constexpr int kContainer = 6000;

TEST(ControlPlace, Counts_from_the_left_edge_in_a_form_that_reads_from_left_to_right) {
  EXPECT_EQ(PlaceOf({150, 300, 1500, 450}, kContainer, kScreen, kLatin), (Area{{10, 20}, {100, 30}}));
}

TEST(ControlPlace, Counts_from_the_right_edge_in_a_mirrored_form) {
  // 400 pixels wide, less 10 from the right edge, less its own 100.
  EXPECT_EQ(PlaceOf({150, 300, 1500, 450}, kContainer, kScreen, kHebrew), (Area{{290, 20}, {100, 30}}));
}

TEST(ControlPlace, Counts_from_the_left_edge_in_a_container_that_says_so_and_not_in_what_that_holds) {
  BareForm form;
  Frame tiles(form, u"tiles");
  PictureBox tile(tiles, u"tile");
  Label caption(tile, u"caption");
  EXPECT_EQ(PlacingOf(tile), Direction::RightToLeft);

  tiles.PlacesFromLeft = true;

  EXPECT_EQ(PlacingOf(tiles), Direction::RightToLeft);
  EXPECT_EQ(PlacingOf(tile), Direction::LeftToRight);
  EXPECT_EQ(PlacingOf(caption), Direction::RightToLeft);
}

TEST(ControlPlace, Touches_in_pixels_what_it_touches_in_twips) {
  for (const Direction direction : {kHebrew, kLatin})
    for (int edge = 1000; edge < 1100; ++edge) {
      const Area first = PlaceOf({0, 0, edge, edge}, kContainer, kScreen, direction);
      const Area second = PlaceOf({edge, edge, 1007, 1007}, kContainer, kScreen, direction);
      const Area& left = direction == kLatin ? first : second;
      const Area& right = direction == kLatin ? second : first;
      ASSERT_EQ(left.Right(), right.corner.left) << edge;
      ASSERT_EQ(first.Bottom(), second.corner.top) << edge;
    }
}

TEST(ControlPlace, Of_a_control_without_extent_has_none) {
  EXPECT_EQ(PlaceOf({0, 0, -30, -30}, kContainer, kScreen, kLatin).extent, Extent());
}

TEST(ControlPlace, Of_a_rule_of_one_pixel_has_one_however_small_its_form_is_shown) {
  for (int place = 0; place < 300; ++place) {
    EXPECT_EQ(PlaceOf({0, place, 1500, 15}, kContainer, kScreen.Zoomed(0.5), kHebrew).extent.height, 1);
    EXPECT_EQ(PlaceOf({place, 0, 15, 1500}, kContainer, kScreen.Zoomed(0.5), kHebrew).extent.width, 1);
  }
}

TEST(ControlPlace, Gives_its_mirrored_spots_back_in_twips_from_the_leading_edge) {
  EXPECT_EQ(TwipsAt(90, 4, 100, kScreen, kHebrew), (Spot{150, 60}));
  EXPECT_EQ(TwipsAt(90, 4, 100, kScreen, kLatin), (Spot{1350, 60}));
  EXPECT_EQ(TwipsAt(72, 4, 80, kScreen.Zoomed(0.8), kHebrew), (Spot{150, 75}));
}

TEST(Sides, Follow_the_reading_direction) {
  EXPECT_EQ(SideOf(Alignment::Leading, kHebrew), Side::Right);
  EXPECT_EQ(SideOf(Alignment::Trailing, kHebrew), Side::Left);
  EXPECT_EQ(SideOf(Alignment::Leading, kLatin), Side::Left);
  EXPECT_EQ(SideOf(Alignment::Trailing, kLatin), Side::Right);
  for (const Direction direction : {kHebrew, kLatin})
    EXPECT_EQ(SideOf(Alignment::Centre, direction), Side::Middle);
}

TEST(Sides, Are_where_a_thing_lies_in_its_room) {
  const Area room{{100, 10}, {50, 30}};

  EXPECT_EQ(AlignedIn(Side::Left, {20, 10}, room), (Area{{100, 20}, {20, 10}}));
  EXPECT_EQ(AlignedIn(Side::Right, {20, 10}, room), (Area{{130, 20}, {20, 10}}));
  EXPECT_EQ(AlignedIn(Side::Middle, {20, 10}, room), (Area{{115, 20}, {20, 10}}));
}

TEST(LineStroke, Spans_its_ends_in_any_order) {
  EXPECT_EQ(BoundsOf({300, 40, 100, 90}), (Geometry{100, 40, 200, 50}));
}

TEST(LineStroke, Falls_the_other_way_in_a_mirrored_form) {
  EXPECT_EQ(StrokeOf({0, 0, 10, 10}, kLatin), Stroke::Falling);
  EXPECT_EQ(StrokeOf({10, 10, 0, 0}, kLatin), Stroke::Falling);
  EXPECT_EQ(StrokeOf({0, 10, 10, 0}, kLatin), Stroke::Rising);
  EXPECT_EQ(StrokeOf({0, 0, 10, 10}, kHebrew), Stroke::Rising);
  EXPECT_EQ(StrokeOf({10, 0, 0, 10}, kHebrew), Stroke::Falling);
}

TEST(LineStroke, Is_straight_along_an_edge_of_its_form_whatever_is_read) {
  for (const Direction direction : {kHebrew, kLatin}) {
    EXPECT_EQ(StrokeOf({0, 5, 10, 5}, direction), Stroke::Straight);
    EXPECT_EQ(StrokeOf({5, 0, 5, 10}, direction), Stroke::Straight);
  }
}

TEST(LineStroke, Has_room_for_its_thickness_within_bounds) {
  EXPECT_EQ(StrokeRoom(0), 1);
  EXPECT_EQ(StrokeRoom(5), 5);
  EXPECT_EQ(StrokeRoom(1000), 32);
}

} // namespace
} // namespace quendra::forms
