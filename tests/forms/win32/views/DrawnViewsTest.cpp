#include "forms/view/Palette.h"
#include "forms/win32/Win32Desktop.h"

#include <gtest/gtest.h>

namespace quendra::forms::win32 {

namespace {

struct DrawnForm : Form {
  DrawnForm() : Form(u"frmDrawn") {}
  void Design() override {
    Move(0, 0, 6000, 4500);
    if (design) design();
  }
  std::function<void()> design;
};

constexpr std::uint32_t kDrawnPaper = 0xFFFFFF;
constexpr int kWidth = 220;
constexpr int kHeight = 80;

std::uint32_t Rgb24(Colour colour) { return ArgbOf(colour) & 0xFFFFFF; }

/// What a view draws, on a sheet of white paper.
class Sheet {
 public:
  explicit Sheet(const Control& control) {
    Drawing drawing(surface_, {}, {{}, {kWidth, kHeight}});
    drawing.Fill({{}, {kWidth, kHeight}}, kWhite);
    auto& view = dynamic_cast<WindowView&>(*control.View());
    Drawing within = drawing.Within({{}, view.WindowPlace().extent});
    view.Paint(within);
  }

  std::uint32_t At(int x, int y) {
    return surface_.Pixels()[static_cast<std::size_t>(y * kWidth + x)] & 0xFFFFFF;
  }
  bool Has(Colour colour) {
    for (const std::uint32_t pixel : surface_.Pixels())
      if ((pixel & 0xFFFFFF) == Rgb24(colour)) return true;
    return false;
  }
  /// Right and left end of what isn't paper, in one row or in all.
  int First(int row = -1) {
    return Edge(row, [](int x) { return x; });
  }
  int Last(int row = -1) {
    return Edge(row, [](int x) { return kWidth - 1 - x; });
  }

 private:
  template <typename Place> int Edge(int row, const Place& place) {
    for (int i = 0; i < kWidth; ++i)
      for (int y = row < 0 ? 0 : row; y < (row < 0 ? kHeight : row + 1); ++y)
        if (At(place(i), y) != kDrawnPaper) return place(i);
    return -1;
  }

  Surface surface_{{kWidth, kHeight}};
};

class DrawnViewsTest : public testing::Test {
 protected:
  ~DrawnViewsTest() override { desktop.Unload(form); }
  static const WindowView& ViewOf(const Control& control) {
    return dynamic_cast<const WindowView&>(*control.View());
  }

  Win32Desktop desktop;
  DrawnForm form;
};

} // namespace

TEST_F(DrawnViewsTest, A_Hebrew_label_of_a_mirrored_form_stands_at_its_right_in_the_ink_of_the_house) {
  Label label(form, u"lbl");
  label.TextFont = Font{20, true, false};
  label.Caption = u"שם";
  label.Move(0, 0, 3000, 600);
  desktop.Load(form);

  Sheet sheet(label);

  EXPECT_GT(sheet.First(), 100);
  EXPECT_NEAR(sheet.Last(), 198, 3);
  EXPECT_TRUE(sheet.Has(Palette::Ink));
}

TEST_F(DrawnViewsTest, A_label_is_seen_through_until_it_gets_a_ground_of_its_own) {
  Label label(form, u"lbl");
  label.Move(0, 0, 1500, 300);
  desktop.Load(form);
  EXPECT_EQ(Sheet(label).First(), -1);

  label.BackColour = Rgb(1, 2, 3);
  label.Transparent = false;

  EXPECT_EQ(Sheet(label).At(99, 19), 0x010203U);
  EXPECT_EQ(Sheet(label).At(100, 19), kDrawnPaper);
}

TEST_F(DrawnViewsTest, A_label_that_is_not_enabled_is_quiet_in_its_container_too) {
  Frame frame(form, u"fra");
  Label label(frame, u"lbl");
  frame.Move(0, 0, 3000, 1200);
  label.Move(0, 0, 3000, 600);
  label.TextFont = Font{20, true, false};
  label.Caption = u"שם";
  desktop.Load(form);

  frame.Enabled = false;

  EXPECT_TRUE(Sheet(label).Has(Palette::QuietInk));
  EXPECT_FALSE(Sheet(label).Has(Palette::Ink));
}

TEST_F(DrawnViewsTest, A_button_has_a_face_with_round_corners_and_its_caption_in_the_middle) {
  CommandButton button(form, u"cmd");
  button.Move(0, 0, 1500, 450);
  button.Caption = u"אישור";
  desktop.Load(form);

  Sheet sheet(button);

  EXPECT_EQ(sheet.At(50, 0), Rgb24(Palette::StrongBorder));
  EXPECT_EQ(sheet.At(99, 15), Rgb24(Palette::StrongBorder));
  EXPECT_EQ(sheet.At(0, 0), kDrawnPaper);
  int first = 10;
  int last = 90;
  const auto isEmpty = [&](int x) {
    for (int y = 5; y < 25; ++y)
      if (sheet.At(x, y) != Rgb24(Palette::Page)) return false;
    return true;
  };
  while (first < 99 && isEmpty(first)) ++first;
  while (last > 0 && isEmpty(last)) --last;
  EXPECT_NEAR(first, 99 - last, 3);
}

TEST_F(DrawnViewsTest, The_window_of_a_link_reaches_beyond_it_with_room_for_its_ring) {
  Label link(form, u"lbl");
  link.Style = Label::Look::Link;
  link.Caption = u"קישור";
  link.Move(600, 600, 1500, 300);
  desktop.Load(form);

  EXPECT_EQ(ViewOf(link).WindowPlace(), ViewOf(link).Place().GrownBy(4));
  EXPECT_TRUE(Sheet(link).Has(Palette::Link)); // its underline
  link.Style = Label::Look::Plain;
  EXPECT_EQ(ViewOf(link).WindowPlace(), ViewOf(link).Place());
}

TEST_F(DrawnViewsTest, The_border_of_a_frame_runs_through_its_title_which_stands_at_the_right) {
  Frame frame(form, u"fra");
  frame.Caption = u"כותרת";
  frame.Move(0, 0, 3000, 900);
  desktop.Load(form);
  Fonts fonts;
  const int middle = fonts.LineHeight(fonts.FontOf({9, false, false}, {})) / 2;

  Sheet sheet(frame);

  EXPECT_NE(sheet.At(50, middle), kDrawnPaper);
  EXPECT_EQ(sheet.At(50, middle - 2), kDrawnPaper);
  EXPECT_EQ(sheet.At(50, middle + 2), kDrawnPaper);
  EXPECT_EQ(sheet.At(100, 59), Rgb24(Palette::Border));
  EXPECT_EQ(sheet.At(0, 40), Rgb24(Palette::Border));
  EXPECT_NEAR(sheet.Last(middle - 2), 180, 8);
  EXPECT_GT(sheet.First(middle - 2), 130);
}

TEST_F(DrawnViewsTest, A_frame_without_a_border_is_a_plain_page) {
  Frame frame(form, u"fra");
  frame.Caption = u"כותרת";
  frame.Border = false;
  frame.BackColour = Rgb(9, 8, 7);
  frame.Move(0, 0, 3000, 900);
  desktop.Load(form);

  Sheet sheet(frame);

  EXPECT_EQ(sheet.At(100, 0), 0x090807U);
  EXPECT_EQ(sheet.At(199, 30), 0x090807U);
  EXPECT_EQ(sheet.At(0, 0), kDrawnPaper);
}

TEST_F(DrawnViewsTest, A_level_line_is_sharp_and_lets_the_mouse_through) {
  Line line(form, u"lin");
  line.Ends = LineEnds{600, 600, 2100, 600};
  line.ForeColour = kRed;
  desktop.Load(form);

  Sheet sheet(line);

  EXPECT_EQ(sheet.At(1, 1), 0xFF0000U);
  EXPECT_EQ(sheet.At(101, 1), 0xFF0000U);
  EXPECT_EQ(sheet.At(50, 0), kDrawnPaper);
  EXPECT_EQ(sheet.At(50, 2), kDrawnPaper);
  EXPECT_EQ(::SendMessageW(ViewOf(line).Window(), WM_NCHITTEST, 0, 0), HTTRANSPARENT);
}

TEST_F(DrawnViewsTest, A_slanting_line_of_a_mirrored_form_is_mirrored) {
  Line line(form, u"lin");
  line.Ends = LineEnds{0, 0, 750, 750};
  desktop.Load(form);

  Sheet sheet(line);

  EXPECT_NE(sheet.At(49, 2), kDrawnPaper);
  EXPECT_NE(sheet.At(2, 49), kDrawnPaper);
  EXPECT_EQ(sheet.At(2, 2), kDrawnPaper);
  EXPECT_EQ(sheet.At(49, 49), kDrawnPaper);
}

TEST_F(DrawnViewsTest, An_image_covers_its_place) {
  Image image(form, u"img");
  image.Contents = Picture::Of({1, 1, {0xFF102030}});
  image.Move(0, 0, 900, 600);
  desktop.Load(form);

  Sheet sheet(image);

  EXPECT_EQ(sheet.At(0, 0), 0x102030U);
  EXPECT_EQ(sheet.At(59, 39), 0x102030U);
  EXPECT_EQ(sheet.At(60, 39), kDrawnPaper);
}

TEST_F(DrawnViewsTest, A_picture_box_shows_ground_picture_and_drawings_within_its_border) {
  PictureBox box(form, u"pic");
  box.BackColour = kGreen;
  box.Border = true;
  box.ScaleMode = ScaleMode::Pixels;
  box.Contents = Picture::Of({2, 1, {0xFF102030, 0}});
  box.Move(0, 0, 900, 600);
  desktop.Load(form);
  desktop.FillBox(box, 5, 5, 6, 6, kRed);

  Sheet sheet(box);

  EXPECT_EQ(sheet.At(2, 20), 0x102030U);
  EXPECT_EQ(sheet.At(57, 20), 0x008000U);
  EXPECT_EQ(sheet.At(6, 6), 0xFF0000U);
  EXPECT_EQ(sheet.At(0, 0), Rgb24(Palette::Border));
  EXPECT_EQ(sheet.At(59, 39), Rgb24(Palette::Border));
}

} // namespace quendra::forms::win32
