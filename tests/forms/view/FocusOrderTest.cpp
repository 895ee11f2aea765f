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

/// Two buttons, and a panel with one of its own in front of the first.
struct ButtonUnderPanel : Form {
  ButtonUnderPanel() : Form(u"frmPanel") {
    Visible = true;
    for (Label* button : {&under, &beside, &within}) button->Click = [] {};
    under.Move(100, 100, 100, 50);
    beside.Move(300, 100, 100, 50);
    panel.Move(100, 100, 100, 50);
  }
  void Design() override {}

  Label under{*this, u"under"};
  Label beside{*this, u"beside"};
  Frame panel{*this, u"panel"};
  Label within{panel, u"within"};
};

TEST(FocusUnderPanelTest, What_a_panel_lies_over_is_passed_over) {
  ButtonUnderPanel form;

  EXPECT_EQ(FirstFocus(form), &form.beside);
  EXPECT_EQ(NextFocus(form, &form.within, TabDirection::Forwards), &form.beside);
  EXPECT_EQ(NextFocus(form, &form.beside, TabDirection::Backwards), &form.within);
}

TEST(FocusUnderPanelTest, It_is_reached_where_the_panel_is_hidden_behind_it_or_too_small) {
  ButtonUnderPanel form;

  form.panel.Visible = false;
  EXPECT_EQ(FirstFocus(form), &form.under);
  form.panel.Visible = true;
  form.under.BringToFront();
  EXPECT_EQ(NextFocus(form, &form.within, TabDirection::Forwards), &form.under);
  form.panel.BringToFront();
  for (const Geometry tooSmall : {Geometry{101, 100, 99, 50}, Geometry{100, 101, 100, 49},
                                  Geometry{100, 100, 99, 50}, Geometry{100, 100, 100, 49}}) {
    form.panel.Position = tooSmall;
    EXPECT_EQ(NextFocus(form, &form.beside, TabDirection::Forwards), &form.under);
  }
}

TEST(FocusUnderPanelTest, What_lies_in_a_container_under_a_panel_is_passed_over) {
  ButtonUnderPanel form;
  Frame page(form, u"page");
  Label onPage(page, u"onPage");
  Frame cover(form, u"cover");
  onPage.Click = [] {};
  page.Move(500, 500, 100, 100);
  cover.Move(400, 400, 300, 300);

  EXPECT_EQ(NextFocus(form, &form.within, TabDirection::Forwards), &form.beside);
  cover.Visible = false;
  EXPECT_EQ(NextFocus(form, &form.within, TabDirection::Forwards), &onPage);
}

} // namespace
} // namespace quendra::forms
