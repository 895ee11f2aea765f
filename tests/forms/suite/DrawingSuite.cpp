#include "forms/suite/DesktopSuite.h"

namespace quendra::forms {

// Measures and places of drawings.

TEST_P(DesktopSuite, Measures_are_in_the_unit_of_the_scale_mode) {
  PictureBox box(form, u"picBuffer");
  desktop.Load(form);
  box.Move(0, 0, 1500, 750);
  box.ScaleMode = ScaleMode::Pixels;
  const int width = desktop.TextWidth(box, u"four");
  const int height = desktop.TextHeight(box, u"four");
  EXPECT_EQ(desktop.ScaleWidth(box), 100);
  EXPECT_EQ(desktop.ScaleHeight(box), 50);

  box.ScaleMode = ScaleMode::Twips;

  EXPECT_EQ(desktop.ScaleWidth(box), 1500);
  EXPECT_EQ(desktop.ScaleHeight(box), 750);
  EXPECT_EQ(desktop.TextHeight(box, u"four"), height * desktop.TwipsPerPixelY());
  // The toolkit measures parts of pixels.
  EXPECT_NEAR(desktop.TextWidth(box, u"four"), width * desktop.TwipsPerPixelX(), desktop.TwipsPerPixelX());
}

TEST_P(DesktopSuite, Text_is_wider_the_longer_it_is_and_empty_text_has_no_width) {
  PictureBox box(form, u"picBuffer");
  desktop.Load(form);

  EXPECT_EQ(desktop.TextWidth(box, u""), 0);
  EXPECT_GT(desktop.TextWidth(box, u"שלום"), 0);
  EXPECT_GT(desktop.TextWidth(box, u"שלום שלום"), desktop.TextWidth(box, u"שלום"));
}

TEST_P(DesktopSuite, A_print_moves_to_the_start_of_the_next_line_and_clearing_to_the_top) {
  PictureBox box(form, u"picBuffer");
  desktop.Load(form);
  box.Move(0, 0, 1500, 1500);
  box.ScaleMode = ScaleMode::Pixels;
  box.CurrentX = 5;
  box.CurrentY = 10;

  desktop.Print(box, u"שלום");
  EXPECT_EQ(box.CurrentX, 0);
  EXPECT_EQ(box.CurrentY, 10 + desktop.TextHeight(box, u"שלום"));
  box.CurrentX = 5;
  desktop.Cls(box);

  EXPECT_EQ(box.CurrentX, 0);
  EXPECT_EQ(box.CurrentY, 0);
}

TEST_P(DesktopSuite, An_icon_of_no_bytes_draws_nothing) {
  PictureBox box(form, u"picBuffer");
  desktop.Load(form);
  const Picture before = desktop.ImageOf(box);

  EXPECT_FALSE(desktop.DrawIconEx(box, 0, 0, {}, 32, 32));

  EXPECT_EQ(desktop.ImageOf(box).pixels()->argb, before.pixels()->argb);
}

TEST_P(DesktopSuite, A_copy_is_seen_and_a_cleared_box_looks_as_before) {
  PictureBox box(form, u"picBuffer");
  PictureBox copy(form, u"picOut");
  desktop.Load(form);
  for (PictureBox* sized : {&box, &copy}) {
    sized->Move(0, 0, 1500, 1500);
    sized->ScaleMode = ScaleMode::Pixels;
  }
  const auto empty = desktop.ImageOf(copy).pixels()->argb;
  desktop.FillBox(box, 10, 10, 20, 20, kRed);

  desktop.BitBlt(copy, 0, 0, 100, 100, box, 0, 0);
  EXPECT_NE(desktop.ImageOf(copy).pixels()->argb, empty);
  desktop.Cls(copy);

  EXPECT_EQ(desktop.ImageOf(copy).pixels()->argb, empty);
}

TEST_P(DesktopSuite, The_hand_is_a_cursor) { EXPECT_NE(desktop.LoadCursor(32649), kNoCursor); }

TEST_P(DesktopSuite, Each_region_has_a_handle_of_its_own) {
  const RegionHandle first = desktop.CreateRoundRectRgn(0, 0, 400, 300, 10, 10);

  EXPECT_NE(first, desktop.CreateRoundRectRgn(0, 0, 400, 300, 10, 10));
  EXPECT_NE(first, RegionHandle());
}

} // namespace quendra::forms
