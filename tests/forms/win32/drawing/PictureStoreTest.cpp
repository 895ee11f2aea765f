#include "forms/win32/drawing/PictureStore.h"

#include "forms/view/png/PngReader.h"
#include "forms/win32/drawing/Resources.h"

#include <gtest/gtest.h>

namespace quendra::forms::win32 {

TEST(PictureStoreTest, Every_picture_that_the_program_carries_can_be_read_in_both_sizes) {
  int pictures = 0;
  for (const Resource& resource : AllResources()) {
    const std::string name(resource.name);
    if (name.ends_with(".ttf") || name.ends_with("@2x")) continue;
    ++pictures;
    const auto one = ReadPng(ResourceOf(name));
    const auto twice = ReadPng(ResourceOf(name + "@2x"));
    ASSERT_TRUE(one && twice) << name;
    EXPECT_EQ(twice->width, 2 * one->width) << name;
    EXPECT_EQ(twice->height, 2 * one->height) << name;
  }
  EXPECT_GT(pictures, 20);
}

TEST(PictureStoreTest, What_the_program_does_not_carry_is_empty) {
  EXPECT_TRUE(ResourceOf("nowhere").empty());
  EXPECT_TRUE(ResourceOf("").empty());
}

TEST(PictureStoreTest, Artwork_is_taken_in_the_density_of_the_screen_and_laid_out_in_one_size) {
  PictureStore plain(false);
  PictureStore dense(true);
  const Picture icon = Picture::Artwork("quendra");

  EXPECT_EQ(dense.BitmapOf(icon).width, 2 * plain.BitmapOf(icon).width);
  EXPECT_EQ(PictureStore::LaidOut(icon, dense.BitmapOf(icon), true),
            PictureStore::LaidOut(icon, plain.BitmapOf(icon), false));
}

TEST(PictureStoreTest, Missing_artwork_is_a_placeholder_and_is_reported_once) {
  PictureStore pictures(false);
  testing::internal::CaptureStderr();

  const Bitmap first = pictures.BitmapOf(Picture::Artwork("nowhere"));
  pictures.BitmapOf(Picture::Artwork("nowhere"));

  EXPECT_EQ(testing::internal::GetCapturedStderr(), "quendra: artwork \"nowhere\" is missing\n");
  EXPECT_EQ(first.argb[0], 0xFF9AA5B1U);
  EXPECT_EQ(first.argb[33], 0xFFE4E7EBU);
}

TEST(PictureStoreTest, No_picture_and_one_with_fewer_pixels_than_it_says_are_empty) {
  PictureStore pictures(false);

  EXPECT_TRUE(pictures.BitmapOf(Picture()).argb.empty());
  EXPECT_TRUE(pictures.BitmapOf(Picture::Of({100, 100, {1, 2, 3}})).argb.empty());
  EXPECT_TRUE(pictures.BitmapOf(Picture::Of({-1, 2, {1, 2, 3}}), {5, 5}).argb.empty());
}

TEST(PictureStoreTest, The_last_other_size_of_artwork_is_kept) {
  PictureStore pictures(false);
  const Picture splash = Picture::Artwork("splash");

  const std::uint32_t* const first = pictures.BitmapOf(splash, {300, 200}).argb.data();
  EXPECT_EQ(pictures.BitmapOf(splash, {300, 200}).argb.data(), first);
  const Bitmap& other = pictures.BitmapOf(splash, {150, 100});

  EXPECT_EQ(other.width, 150);
  EXPECT_EQ(pictures.BitmapOf(splash).width, 600);
}

TEST(PictureStoreTest, Pixels_are_given_as_they_are_and_in_any_size) {
  PictureStore pictures(false);
  const Picture pixel = Picture::Of({1, 1, {0xFF102030}});

  EXPECT_EQ(pictures.BitmapOf(pixel).argb.data(), pixel.pixels()->argb.data());
  EXPECT_EQ(pictures.BitmapOf(pixel, {2, 2}).argb, std::vector<std::uint32_t>(4, 0xFF102030));
}

} // namespace quendra::forms::win32
