#include "forms/view/png/PngBytes.h"
#include "forms/win32/Win32Desktop.h"

#include <gtest/gtest.h>

namespace quendra::forms::win32 {

namespace {

/// A form of 400 by 300 pixels with two boxes of 100 by 100, which draw in pixels.
struct CanvasForm : Form {
  CanvasForm() : Form(u"frmCanvas") {}
  void Design() override {
    Move(0, 0, 6000, 4500);
    for (PictureBox* picture : {&box, &other}) {
      picture->Move(0, 0, 1500, 1500);
      picture->ScaleMode = ScaleMode::Pixels;
    }
  }

  PictureBox box{*this, u"picBuffer"};
  PictureBox other{*this, u"picOut"};
};

class CanvasTest : public testing::Test {
 protected:
  CanvasTest() { desktop.Load(form); }
  ~CanvasTest() override { desktop.Unload(form); }

  std::uint32_t PixelIn(const PictureBox& picture, int x, int y) {
    const Picture image = desktop.ImageOf(picture);
    return image.pixels()->argb[static_cast<std::size_t>(y * image.pixels()->width + x)];
  }

  Win32Desktop desktop;
  CanvasForm form;
  PictureBox& box = form.box;
  PictureBox& other = form.other;
};

constexpr std::uint32_t kRedPixel = 0xFFFF0000;

} // namespace

TEST_F(CanvasTest, A_filled_box_holds_both_its_corners) {
  desktop.FillBox(box, 10, 20, 12, 22, Rgb(10, 20, 30));

  EXPECT_EQ(PixelIn(box, 10, 20), 0xFF0A141EU);
  EXPECT_EQ(PixelIn(box, 12, 22), 0xFF0A141EU);
  EXPECT_EQ(PixelIn(box, 9, 20), 0U);
  EXPECT_EQ(PixelIn(box, 13, 22), 0U);
}

TEST_F(CanvasTest, A_filled_box_may_go_beyond_the_edges_and_name_its_corners_in_any_order) {
  desktop.FillBox(box, 200, 4, -5, -1, kRed);

  EXPECT_EQ(PixelIn(box, 0, 0), kRedPixel);
  EXPECT_EQ(PixelIn(box, 99, 4), kRedPixel);
  EXPECT_EQ(PixelIn(box, 0, 5), 0U);
}

TEST_F(CanvasTest, A_print_in_a_mirrored_form_stands_at_the_right_and_moves_to_the_next_line) {
  box.ForeColour = kWhite;
  box.CurrentY = 10;

  desktop.Print(box, u"א");

  EXPECT_EQ(box.CurrentX, 0);
  EXPECT_EQ(box.CurrentY, 10 + desktop.TextHeight(box, u"א"));
  bool left = false;
  bool right = false;
  for (int y = 0; y < 100; ++y)
    for (int x = 0; x < 100; ++x) (x < 50 ? left : right) |= PixelIn(box, x, y) != 0U;
  EXPECT_FALSE(left);
  EXPECT_TRUE(right);
}

TEST_F(CanvasTest, Printed_letters_have_their_colour_and_are_seen_through_beside_it) {
  box.ForeColour = Rgb(200, 100, 50);
  box.TextFont = Font{30, true, false};

  desktop.Print(box, u"ם");

  bool full = false;
  bool smooth = false;
  for (int y = 0; y < 100; ++y)
    for (int x = 0; x < 100; ++x) {
      const std::uint32_t pixel = PixelIn(box, x, y);
      full |= pixel == 0xFFC86432;
      smooth |= (pixel >> 24) != 0 && (pixel >> 24) != 0xFF;
      if (pixel >> 24) {
        ASSERT_EQ(pixel & 0xFFFFFF, 0xC86432U);
      }
    }
  EXPECT_TRUE(full);
  EXPECT_TRUE(smooth);
}

TEST_F(CanvasTest, A_print_below_the_box_draws_nothing) {
  box.ForeColour = kWhite;
  box.CurrentY = 5000;

  desktop.Print(box, u"א");

  EXPECT_EQ(box.CurrentY, 5000 + desktop.TextHeight(box, u"א"));
  EXPECT_EQ(PixelIn(box, 90, 99), 0U);
}

TEST_F(CanvasTest, A_blit_copies_what_the_source_shows) {
  box.BackColour = kGreen;
  desktop.FillBox(box, 0, 0, 9, 9, kRed);

  desktop.BitBlt(other, 50, 60, 20, 20, box, 0, 0);

  EXPECT_EQ(PixelIn(other, 50, 60), kRedPixel);
  EXPECT_EQ(PixelIn(other, 65, 75), 0xFF008000U);
  EXPECT_EQ(PixelIn(other, 70, 60), 0U);
  EXPECT_EQ(PixelIn(other, 49, 60), 0U);
}

TEST_F(CanvasTest, A_blit_reads_from_its_source_place_and_nothing_beyond_the_source) {
  desktop.FillBox(box, 90, 90, 99, 99, kRed);

  desktop.BitBlt(other, 0, 0, 50, 50, box, 95, 95);

  EXPECT_EQ(PixelIn(other, 0, 0), kRedPixel);
  EXPECT_EQ(PixelIn(other, 4, 4), kRedPixel);
  EXPECT_EQ(PixelIn(other, 5, 5), 0U);
}

TEST_F(CanvasTest, Clearing_leaves_the_ground_and_starts_again_at_the_top) {
  desktop.FillBox(box, 0, 0, 99, 99, kRed);
  box.CurrentY = 50;

  desktop.Cls(box);

  EXPECT_EQ(PixelIn(box, 50, 50), 0U);
  EXPECT_EQ(box.CurrentY, 0);
}

TEST_F(CanvasTest, A_picture_is_stretched_over_the_box_below_its_drawings) {
  box.Contents = Picture::Of({1, 1, {0xFF0000FF}});
  desktop.FillBox(box, 0, 0, 9, 9, kRed);

  EXPECT_EQ(PixelIn(box, 5, 5), kRedPixel);
  EXPECT_EQ(PixelIn(box, 99, 99), 0xFF0000FFU);
}

TEST_F(CanvasTest, A_new_size_or_picture_drops_the_drawings_and_a_new_place_keeps_them) {
  desktop.FillBox(box, 0, 0, 9, 9, kRed);
  box.Move(300, 300, 1500, 1500);
  EXPECT_EQ(PixelIn(box, 5, 5), kRedPixel);

  box.Move(300, 300, 1500, 1200);
  EXPECT_EQ(PixelIn(box, 5, 5), 0U);
  desktop.FillBox(box, 0, 0, 9, 9, kRed);
  box.Contents = Picture::Of({1, 1, {0xFF0000FF}});

  EXPECT_EQ(PixelIn(box, 5, 5), 0xFF0000FFU);
}

TEST_F(CanvasTest, An_icon_is_scaled_into_its_place_and_keeps_its_aspect) {
  ASSERT_TRUE(desktop.DrawIconEx(box, 0, 0, PngOf(64, 32, kRedPixel), 32, 32));

  EXPECT_EQ(PixelIn(box, 16, 16), kRedPixel);
  EXPECT_EQ(PixelIn(box, 16, 4), 0U);
  EXPECT_EQ(PixelIn(box, 16, 28), 0U);
  EXPECT_EQ(PixelIn(box, 40, 16), 0U);
}

TEST_F(CanvasTest, An_icon_keeps_its_alpha) {
  ASSERT_TRUE(desktop.DrawIconEx(box, 0, 0, PngOf(32, 32, 0x80FF0000), 32, 32));

  EXPECT_EQ(PixelIn(box, 16, 16), 0x80FF0000U);
}

TEST_F(CanvasTest, Bytes_that_are_no_such_image_and_absurd_sizes_draw_nothing) {
  const std::string_view svg = "<svg xmlns='http://www.w3.org/2000/svg' width='8' height='8'/>";
  const std::string_view xpm = "/* XPM */\nstatic char* x[] = {\"1 1 1 1\", \"a c #00FF00\", \"a\"};\n";

  EXPECT_FALSE(desktop.DrawIconEx(box, 0, 0, {}, 32, 32));
  EXPECT_FALSE(desktop.DrawIconEx(box, 0, 0, Bytes(svg.begin(), svg.end()), 32, 32));
  EXPECT_FALSE(desktop.DrawIconEx(box, 0, 0, Bytes(xpm.begin(), xpm.end()), 32, 32));
  EXPECT_FALSE(desktop.DrawIconEx(box, 0, 0, PngOf(4, 4, kRedPixel), 0, 32));
  EXPECT_FALSE(desktop.DrawIconEx(box, 0, 0, PngOf(4, 4, kRedPixel), 32, 2049));
  EXPECT_EQ(PixelIn(box, 16, 16), 0U);
}

TEST_F(CanvasTest, A_box_of_a_form_that_is_not_loaded_takes_drawings_without_harm) {
  desktop.Unload(form);

  desktop.FillBox(box, 0, 0, 9, 9, kRed);
  desktop.Print(box, u"א");
  desktop.BitBlt(other, 0, 0, 9, 9, box, 0, 0);
  desktop.Cls(box);

  EXPECT_FALSE(desktop.DrawIconEx(box, 0, 0, PngOf(4, 4, kRedPixel), 32, 32));
  EXPECT_TRUE(desktop.ImageOf(box).IsNone());
}

} // namespace quendra::forms::win32
