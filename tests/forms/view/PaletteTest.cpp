#include "forms/view/Palette.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>

namespace quendra::forms {
namespace {

TEST(Palette, A_colour_that_a_form_gave_goes_before_that_of_the_house) {
  EXPECT_EQ(InkOr(kRed, Palette::Ink), kRed);
  EXPECT_EQ(InkOr(kBlack, Palette::Ink), Palette::Ink);
}

TEST(Palette, A_darker_colour_keeps_its_hue_and_loses_light) {
  EXPECT_EQ(Darker(kWhite, 105), Rgb(243, 243, 243));
  EXPECT_EQ(Darker(kWhite, 115), Rgb(222, 222, 222));
  EXPECT_EQ(Darker(Rgb(162, 233, 93), 105), Rgb(154, 222, 89));
  EXPECT_EQ(Darker(Rgb(162, 233, 93), 115), Rgb(141, 203, 81));
  EXPECT_EQ(Darker(kBlack, 115), kBlack);
}

/// How far a colour stands out from another, by the published rule for readable text.
double ContrastOf(Colour first, Colour second) {
  const auto light = [](Colour colour) {
    const auto part = [](Colour value) {
      const double share = (value & 0xFF) / 255.0;
      return share <= 0.03928 ? share / 12.92 : std::pow((share + 0.055) / 1.055, 2.4);
    };
    return 0.2126 * part(colour) + 0.7152 * part(colour >> 8) + 0.0722 * part(colour >> 16);
  };
  const double lighter = std::max(light(first), light(second));
  const double darker = std::min(light(first), light(second));
  return (lighter + 0.05) / (darker + 0.05);
}

TEST(Palette, Texts_stand_out_from_every_ground_that_they_are_drawn_on) {
  for (const Colour ground : {Palette::Page, Palette::QuietPage, Palette::Selection})
    EXPECT_GE(ContrastOf(Palette::Ink, ground), 4.5);
  EXPECT_GE(ContrastOf(Palette::Link, Palette::Page), 4.5);
  EXPECT_GE(ContrastOf(Palette::QuietInk, Palette::Page), 4.2);
}

} // namespace
} // namespace quendra::forms
