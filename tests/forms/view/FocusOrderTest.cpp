#include "forms/view/FocusOrder.h"

#include "forms/controls/Controls.h"

#include <gtest/gtest.h>

namespace quendra::forms {
namespace {

struct ThreeButtons : Form {
  ThreeButtons() : Form(u"frmButtons") {
    Visible = true;
    for (Label* button : {&first, &second, &third}) button->Click = [] {};
    third.TabIndex = -1;
  }
  void Design() override {}

  Label first{*this, u"first"};
  Label text{*this, u"text"};
  Frame page{*this, u"page"};
  Label second{page, u"second"};
  Label third{*this, u"third"};
};

struct FocusOrderTest : testing::Test {
  Control* After(const Control* focused) const { return NextFocus(form, focused, TabDirection::Forwards); }
  Control* Before(const Control* focused) const { return NextFocus(form, focused, TabDirection::Backwards); }
  ThreeButtons form;
};

TEST_F(FocusOrderTest, Tab_goes_by_the_order_and_round) {
  EXPECT_EQ(After(&form.third), &form.first);
  EXPECT_EQ(After(&form.first), &form.second);
  EXPECT_EQ(After(&form.second), &form.third);
}

TEST_F(FocusOrderTest, Backwards_it_goes_the_other_way) {
  EXPECT_EQ(Before(&form.third), &form.second);
  EXPECT_EQ(Before(&form.second), &form.first);
  EXPECT_EQ(Before(&form.first), &form.third);
}

TEST_F(FocusOrderTest, Without_a_focus_it_begins_at_an_end) {
  EXPECT_EQ(After(nullptr), &form.third);
  EXPECT_EQ(Before(nullptr), &form.second);
}

TEST_F(FocusOrderTest, What_is_not_there_to_take_it_is_passed_over) {
  form.page.Visible = false;
  form.third.Enabled = false;

  EXPECT_EQ(After(&form.first), &form.first);
  form.first.Enabled = false;

  EXPECT_EQ(After(&form.first), nullptr);
}

} // namespace
} // namespace quendra::forms
