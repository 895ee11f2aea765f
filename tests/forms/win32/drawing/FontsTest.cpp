#include "forms/win32/drawing/Fonts.h"

#include "forms/win32/drawing/Drawing.h"

#include <gtest/gtest.h>

namespace quendra::forms::win32 {

namespace {

/// Every sign of Hebrew and Latin text that the program's forms and the data in them are made of.
Text AllSigns() {
  Text signs;
  for (char16_t sign = u' '; sign <= u'~'; ++sign) signs += sign;
  for (char16_t sign = u'א'; sign <= u'ת'; ++sign) signs += sign;
  return signs + u"©®…₪";
}

Text MissingSigns(HFONT font) {
  const Text signs = AllSigns();
  std::vector<WORD> glyphs(signs.size());
  const HDC dc = ::CreateCompatibleDC(nullptr);
  const HGDIOBJ before = ::SelectObject(dc, font);
  ::GetGlyphIndicesW(dc, winapi::Wide(signs), static_cast<int>(signs.size()), glyphs.data(),
                     GGI_MARK_NONEXISTING_GLYPHS);
  ::SelectObject(dc, before);
  ::DeleteDC(dc);
  Text missing;
  for (std::size_t i = 0; i < signs.size(); ++i)
    if (glyphs[i] == 0xFFFF) missing += signs[i];
  return missing;
}

} // namespace

TEST(FontsTest, Every_sign_is_shown_in_both_weights) {
  Fonts fonts;

  EXPECT_EQ(MissingSigns(fonts.FontOf({9, false, false}, {})), u"");
  EXPECT_EQ(MissingSigns(fonts.FontOf({9, true, false}, {})), u"");
}

TEST(FontsTest, The_family_is_there_and_shows_Hebrew) {
  Fonts fonts;

  EXPECT_TRUE(ShowsHebrewAndLatin(fonts.Family()));
}

TEST(FontsTest, A_family_that_is_not_there_shows_nothing) {
  EXPECT_FALSE(ShowsHebrewAndLatin(u"No Family Of This Name"));
}

TEST(FontsTest, Letters_have_the_size_that_the_screen_and_the_form_give_them) {
  Fonts fonts;
  const auto height = [&](int points, const Scale& scale) {
    LOGFONTW made{};
    ::GetObjectW(fonts.FontOf({points, false, false}, scale), sizeof made, &made);
    return -made.lfHeight;
  };

  EXPECT_EQ(height(9, {}), 12);
  EXPECT_EQ(height(12, {}), 16);
  EXPECT_EQ(height(9, {12, 12}), 15); // 120 dots to the inch
  EXPECT_EQ(height(9, Scale{}.Zoomed(0.75)), 9);
}

TEST(FontsTest, The_same_letters_are_made_once) {
  Fonts fonts;

  EXPECT_EQ(fonts.FontOf({9, true, false}, {}), fonts.FontOf({9, true, false}, {}));
  EXPECT_NE(fonts.FontOf({9, true, false}, {}), fonts.FontOf({9, false, false}, {}));
}

TEST(FontsTest, A_longer_text_is_wider_and_none_has_no_width) {
  Fonts fonts;
  const HFONT font = fonts.FontOf({9, false, false}, {});

  EXPECT_EQ(MeasureText(u"", font), Extent{});
  EXPECT_GT(MeasureText(u"שלום", font).width, 10);
  EXPECT_GT(MeasureText(u"שלום שלום", font).width, MeasureText(u"שלום", font).width);
  EXPECT_EQ(MeasureText(u"שלום", font).height, fonts.LineHeight(font));
}

} // namespace quendra::forms::win32
