#include "forms/view/Scale.h"
#include "forms/view/RoundRect.h"

#include <gtest/gtest.h>

namespace quendra::forms {
namespace {

TEST(Scale, Rounds_twips_to_the_nearest_pixel) {
  const Scale scale{15, 12};

  EXPECT_EQ(scale.PixelsX(1500), 100);
  EXPECT_EQ(scale.PixelsX(7), 0);
  EXPECT_EQ(scale.PixelsX(8), 1);
  EXPECT_EQ(scale.PixelsX(-8), -1);
  EXPECT_EQ(scale.PixelsY(1500), 125);
}

TEST(Scale, Gives_every_pixel_its_twips_and_takes_them_back) {
  for (const double dots : {72.0, 96.0, 110.0, 144.0, 220.0}) {
    const Scale scale{1440 / dots, 1440 / dots};
    for (int pixel = -50; pixel < 2000; ++pixel) {
      ASSERT_EQ(scale.PixelsX(scale.TwipsX(pixel)), pixel) << dots;
      ASSERT_EQ(scale.PixelsY(scale.TwipsY(pixel)), pixel) << dots;
    }
  }
}

TEST(Scale, Of_a_smaller_form_makes_its_lengths_smaller_and_gives_the_screens_own_back) {
  const Scale smaller = Scale{15, 15}.Zoomed(0.8);

  EXPECT_EQ(smaller.PixelsX(1500), 80);
  EXPECT_EQ(smaller.TwipsY(80), 1500);
  EXPECT_EQ(smaller.Pixels(8), 6);
  EXPECT_EQ(smaller.Unzoomed().PixelsX(1500), 100);
  EXPECT_EQ(smaller.Unzoomed().Pixels(8), 8);
}

TEST(Scale, Makes_letters_smaller_but_never_smaller_than_a_point) {
  EXPECT_DOUBLE_EQ(Scale().Points(12), 12);
  EXPECT_DOUBLE_EQ(Scale().Zoomed(0.8).Points(12), 9.6);
  EXPECT_DOUBLE_EQ(Scale().Points(0), 1);
}

TEST(RoundRect, Is_as_much_smaller_as_its_form) {
  const RoundRect shape{0, 10, 400, 300, 21, 20};

  EXPECT_EQ(shape.In(Scale().Zoomed(0.8)), (RoundRect{0, 8, 320, 240, 17, 16}));
  EXPECT_EQ(shape.In(Scale()), shape);
}

} // namespace
} // namespace quendra::forms
