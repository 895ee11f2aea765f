#include "forms/view/MouseRules.h"

#include "forms/controls/Label.h"
#include "forms/view/BareForm.h"

#include <gtest/gtest.h>

namespace quendra::forms {
namespace {

using Meaning = MouseRules::Meaning;

struct MouseRulesTest : testing::Test {
  BareForm form;
  Label label{form, u"label"};
  Label other{form, u"other"};
  MouseRules rules;
};

TEST_F(MouseRulesTest, Buttons_are_a_sum) {
  EXPECT_EQ(ButtonSum(false, false), 0);
  EXPECT_EQ(ButtonSum(true, false), 1);
  EXPECT_EQ(ButtonSum(false, true), 2);
  EXPECT_EQ(ButtonSum(true, true), 3);
}

TEST_F(MouseRulesTest, A_press_and_a_release_on_one_control_are_a_click) {
  EXPECT_EQ(rules.Pressed(label, kLeftButton), Meaning::Press);
  EXPECT_EQ(rules.Released(label, kLeftButton, true), Meaning::Click);
}

TEST_F(MouseRulesTest, A_release_outside_or_on_another_control_is_none) {
  rules.Pressed(label, kLeftButton);
  EXPECT_EQ(rules.Released(label, kLeftButton, false), Meaning::Nothing);
  rules.Pressed(label, kLeftButton);
  EXPECT_EQ(rules.Released(other, kLeftButton, true), Meaning::Nothing);
  EXPECT_EQ(rules.Released(label, kLeftButton, true), Meaning::Nothing);
}

TEST_F(MouseRulesTest, The_right_button_presses_and_never_clicks) {
  EXPECT_EQ(rules.Pressed(label, kRightButton), Meaning::Press);
  EXPECT_EQ(rules.Released(label, kRightButton, true), Meaning::Nothing);
}

TEST_F(MouseRulesTest, The_right_button_leaves_the_press_of_the_left_one_alone) {
  rules.Pressed(label, kLeftButton);
  rules.Pressed(other, kRightButton);
  rules.Released(other, kRightButton, true);

  EXPECT_EQ(rules.Released(label, kLeftButton, true), Meaning::Click);
}

TEST_F(MouseRulesTest, A_double_click_goes_to_its_handler_and_its_release_is_no_click) {
  label.DoubleClick = [] {};

  EXPECT_EQ(rules.PressedAgain(label, kLeftButton), Meaning::DoubleClick);
  EXPECT_EQ(rules.Released(label, kLeftButton, true), Meaning::Nothing);
}

TEST_F(MouseRulesTest, Without_a_handler_the_second_press_is_one_like_the_first) {
  EXPECT_EQ(rules.PressedAgain(label, kLeftButton), Meaning::Press);
  EXPECT_EQ(rules.Released(label, kLeftButton, true), Meaning::Click);
}

TEST_F(MouseRulesTest, The_right_button_gives_no_double_click) {
  label.DoubleClick = [] {};

  EXPECT_EQ(rules.PressedAgain(label, kRightButton), Meaning::Press);
}

TEST_F(MouseRulesTest, A_control_that_lost_the_capture_or_has_gone_gets_no_click) {
  rules.Pressed(label, kLeftButton);
  rules.ReleaseCapture();
  EXPECT_EQ(rules.Released(label, kLeftButton, true), Meaning::Nothing);
  rules.Pressed(label, kLeftButton);
  rules.Forget(label);
  EXPECT_EQ(rules.Released(label, kLeftButton, true), Meaning::Nothing);
}

TEST_F(MouseRulesTest, Another_control_that_goes_leaves_the_press_alone) {
  rules.Pressed(label, kLeftButton);
  rules.Forget(other);

  EXPECT_EQ(rules.Released(label, kLeftButton, true), Meaning::Click);
}

TEST(CursorRulesTest, A_cursor_stays_until_the_mouse_moves_where_none_is_set) {
  CursorRules cursor;
  cursor.MoveBegins();
  cursor.Set();
  EXPECT_FALSE(cursor.MoveEndsIt());

  cursor.MoveBegins();

  EXPECT_TRUE(cursor.MoveEndsIt());
}

} // namespace
} // namespace quendra::forms
