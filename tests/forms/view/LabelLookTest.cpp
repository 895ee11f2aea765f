#include "forms/view/LabelLook.h"

#include "forms/view/BareForm.h"
#include "forms/view/Palette.h"

#include <gtest/gtest.h>

namespace quendra::forms {
namespace {

constexpr Direction kHebrewText = Direction::RightToLeft;

struct LabelLook : testing::Test {
  LabelLook() {
    button.Style = Label::Look::Button;
    link.Style = Label::Look::Link;
  }

  BareForm form;
  Label text{form, u"text"};
  Label link{form, u"link"};
  Label button{form, u"button"};
  LabelState state{};
};

TEST_F(LabelLook, A_text_has_its_own_ground_only_where_it_is_opaque) {
  text.BackColour = kRed;
  EXPECT_FALSE(FaceOf(text, state).fill);

  text.Transparent = false;

  EXPECT_EQ(FaceOf(text, state).fill, kRed);
  EXPECT_FALSE(FaceOf(text, state).border);
}

TEST_F(LabelLook, A_text_that_acts_as_a_button_keeps_clear_of_the_ring_at_its_sides) {
  EXPECT_EQ(TextInset(text), 0);

  text.Click = [] {};

  EXPECT_EQ(TextInset(text), 8);
  text.Align = Alignment::Centre;
  EXPECT_EQ(TextInset(text), 0);
  EXPECT_EQ(TextInset(link), 0);
  EXPECT_EQ(TextInset(button), 0);
}

TEST_F(LabelLook, A_button_without_a_colour_of_its_own_is_a_page_with_a_border) {
  const LabelFace face = FaceOf(button, state);

  EXPECT_EQ(face.fill, Palette::Page);
  EXPECT_EQ(face.border, Palette::StrongBorder);
  EXPECT_EQ(face.corner, 6);
}

TEST_F(LabelLook, A_button_is_darker_under_the_mouse_and_darker_still_when_held_down) {
  button.Transparent = false;
  button.BackColour = Rgb(162, 233, 93);
  EXPECT_EQ(FaceOf(button, state).fill, Rgb(162, 233, 93));
  state.underMouse = true;
  EXPECT_EQ(FaceOf(button, state).fill, Rgb(154, 222, 89));
  state.heldDown = true;
  EXPECT_EQ(FaceOf(button, state).fill, Rgb(141, 203, 81));
}

TEST_F(LabelLook, A_disabled_button_loses_its_colours_and_does_not_answer_the_mouse) {
  button.Transparent = false;
  button.BackColour = kGreen;
  button.ForeColour = kWhite;
  state = {.enabled = false, .underMouse = true, .heldDown = true};

  EXPECT_EQ(FaceOf(button, state).fill, Palette::QuietPage);
  EXPECT_EQ(FaceOf(button, state).border, Palette::Border);
  EXPECT_EQ(InkOf(button, state), Palette::QuietInk);
}

TEST_F(LabelLook, Ink_is_that_of_the_form_else_that_of_the_kind) {
  EXPECT_EQ(InkOf(text, state), Palette::Ink);
  EXPECT_EQ(InkOf(link, state), Palette::Link);
  EXPECT_EQ(InkOf(button, state), Palette::Ink);
  for (Label* label : {&text, &link, &button}) {
    label->ForeColour = kRed;
    EXPECT_EQ(InkOf(*label, state), kRed);
  }
}

TEST_F(LabelLook, A_link_is_underlined_and_any_other_text_where_its_font_says_so) {
  EXPECT_TRUE(TextOf(link).underlined);
  EXPECT_FALSE(TextOf(text).underlined);
  text.TextFont = Font{9, false, true};
  EXPECT_TRUE(TextOf(text).underlined);
}

TEST_F(LabelLook, A_caption_wraps_where_it_is_told_to_or_has_lines_and_then_starts_at_the_top) {
  EXPECT_FALSE(TextOf(text).wraps);
  EXPECT_FALSE(TextOf(text).fromTop);
  text.Caption = Text(u"one\r\ntwo");
  EXPECT_TRUE(TextOf(text).wraps);
  EXPECT_TRUE(TextOf(text).fromTop);
  link.WordWrap = true;
  EXPECT_TRUE(TextOf(link).wraps);
}

TEST_F(LabelLook, A_button_has_its_caption_in_the_middle_whatever_it_is_told) {
  button.Align = Alignment::Trailing;
  button.WordWrap = true;
  text.Align = Alignment::Trailing;

  EXPECT_EQ(TextOf(button).align, Alignment::Centre);
  EXPECT_TRUE(TextOf(button).wraps);
  EXPECT_FALSE(TextOf(button).fromTop);
  EXPECT_EQ(TextOf(text).align, Alignment::Trailing);
}

TEST_F(LabelLook, A_caption_is_shown_without_harm_and_reads_in_its_own_direction) {
  text.Caption = Text(u"evil\u202Etxt.exe");
  EXPECT_EQ(TextOf(text).text, u"evil\uFFFDtxt.exe");
  EXPECT_EQ(TextOf(text).direction, Direction::LeftToRight);
  text.Caption = Text(u"שלום");
  EXPECT_EQ(TextOf(text).direction, kHebrewText);
}

TEST_F(LabelLook, A_ring_is_there_for_those_who_use_the_keys) {
  EXPECT_TRUE(RingsOf(button, state).empty());
  state.hasFocus = true;
  EXPECT_TRUE(RingsOf(button, state).empty());
  state.usesKeys = true;
  EXPECT_EQ(RingsOf(button, state).size(), 2U);
  state.hasFocus = false;
  EXPECT_TRUE(RingsOf(button, state).empty());
}

TEST_F(LabelLook, The_ring_of_a_button_lies_in_it_with_a_light_line_within) {
  state.hasFocus = state.usesKeys = true;

  const std::vector<Ring> rings = RingsOf(button, state);

  ASSERT_EQ(rings.size(), 2U);
  EXPECT_EQ(rings[0].colour, Palette::Focus);
  EXPECT_EQ(rings[1].colour, Palette::Page);
  EXPECT_GE(rings[0].inset - rings[0].width / 2.0, 0);
  EXPECT_GE(rings[1].inset - rings[1].width / 2.0, rings[0].inset + rings[0].width / 2.0);
}

TEST_F(LabelLook, The_ring_of_a_link_lies_outside_of_its_letters_and_has_its_room) {
  state.hasFocus = state.usesKeys = true;

  const std::vector<Ring> rings = RingsOf(link, state);

  ASSERT_EQ(rings.size(), 1U);
  EXPECT_LE(rings[0].inset + rings[0].width / 2.0, 0);
  EXPECT_GE(RingRoom(link), rings[0].width / 2.0 - rings[0].inset);
  EXPECT_EQ(RingRoom(text), 0);
  EXPECT_EQ(RingRoom(button), 0);
}

TEST_F(LabelLook, A_ring_goes_round_the_letters_of_a_link_at_their_side_and_round_any_other_label) {
  const Area place{{4, 4}, {100, 20}};

  EXPECT_EQ(RingedArea(link, place, {30, 16}, kHebrewText), (Area{{74, 6}, {30, 16}}));
  EXPECT_EQ(RingedArea(link, place, {30, 16}, Direction::LeftToRight), (Area{{4, 6}, {30, 16}}));
  EXPECT_EQ(RingedArea(link, place, {300, 60}, kHebrewText), place);
  EXPECT_EQ(RingedArea(button, place, {30, 16}, kHebrewText), place);
}

} // namespace
} // namespace quendra::forms
