#include "forms/view/FormPlacement.h"

#include <gtest/gtest.h>

namespace quendra::forms {
namespace {

constexpr Area kWorkArea{{0, 0}, {1024, 728}};

TEST(FittingScale, Is_1_for_a_form_that_has_room_to_the_last_pixel) {
  EXPECT_DOUBLE_EQ(FittingScale({1000, 680}, {1000, 680}).scale, 1);
  EXPECT_DOUBLE_EQ(FittingScale({1000, 680}, {3840, 2160}).scale, 1);
  EXPECT_FALSE(FittingScale({1000, 680}, {1000, 680}).scrolls);
}

TEST(FittingScale, Goes_by_the_side_that_has_less_room) {
  EXPECT_DOUBLE_EQ(FittingScale({1000, 680}, {800, 680}).scale, 0.8);
  EXPECT_DOUBLE_EQ(FittingScale({1000, 680}, {900, 510}).scale, 0.75);
  EXPECT_FALSE(FittingScale({1000, 680}, {900, 510}).scrolls);
}

TEST(FittingScale, Stays_at_70_percent_and_scrolls_where_there_is_less_room) {
  EXPECT_FALSE(FittingScale({1000, 500}, {700, 500}).scrolls);
  EXPECT_DOUBLE_EQ(FittingScale({1000, 500}, {699, 500}).scale, 0.7);
  EXPECT_TRUE(FittingScale({1000, 500}, {699, 500}).scrolls);
}

TEST(FittingScale, Of_a_form_without_extent_or_a_screen_without_room_is_a_scale_to_be_shown_in) {
  EXPECT_DOUBLE_EQ(FittingScale({0, 0}, {0, 0}).scale, 1);
  EXPECT_DOUBLE_EQ(FittingScale({100, 100}, {-5, 0}).scale, 0.7);
}

TEST(WindowExtent, Is_that_of_a_form_that_has_room) {
  EXPECT_EQ(WindowExtent({700, 476}, {700, 476}, 14), (Extent{700, 476}));
}

TEST(WindowExtent, Gives_a_scroll_bar_its_own_room_beside_what_does_not_fit) {
  EXPECT_EQ(WindowExtent({700, 400}, {600, 500}, 14), (Extent{600, 414}));
  EXPECT_EQ(WindowExtent({500, 476}, {600, 400}, 14), (Extent{514, 400}));
}

TEST(WindowExtent, Never_exceeds_the_room_for_the_sake_of_a_scroll_bar) {
  EXPECT_EQ(WindowExtent({700, 495}, {600, 500}, 14), (Extent{600, 500}));
  EXPECT_EQ(WindowExtent({700, 900}, {600, 500}, 14), (Extent{600, 500}));
}

TEST(WindowCorner, Is_in_the_middle_of_what_the_window_stands_over) {
  EXPECT_EQ(CornerOver({1000, 700}, kWorkArea, kWorkArea), (Spot{12, 14}));
  EXPECT_EQ(CornerOver({100, 100}, {{500, 300}, {200, 200}}, kWorkArea), (Spot{550, 350}));
}

TEST(WindowCorner, Stays_on_the_screen_when_its_owner_stands_at_an_edge) {
  EXPECT_EQ(CornerOver({400, 300}, {{900, 600}, {100, 100}}, kWorkArea), (Spot{624, 428}));
  EXPECT_EQ(CornerOver({400, 300}, {{-50, -50}, {100, 100}}, kWorkArea), (Spot{0, 0}));
}

TEST(WindowCorner, Counts_from_where_panels_leave_the_screen) {
  EXPECT_EQ(CornerOnScreen({{0, 0}, {400, 300}}, {{60, 30}, {964, 738}}), (Spot{60, 30}));
}

TEST(WindowCorner, Of_a_window_that_lies_on_the_screen_is_left_alone) {
  EXPECT_EQ(CornerOnScreen({{24, 28}, {1000, 700}}, kWorkArea), (Spot{24, 28}));
}

TEST(WindowCorner, Of_a_window_larger_than_the_screen_shows_its_title_bar) {
  EXPECT_EQ(CornerOnScreen({{-10, -40}, {1200, 800}}, kWorkArea), (Spot{0, 0}));
}

} // namespace
} // namespace quendra::forms
