#include "forms/qt/QtFixture.h"

#include "forms/qt/drawing/ImageDecoder.h"

#include <QBuffer>

namespace quendra::forms::qt {

namespace {

std::vector<std::uint8_t> PngOf(int width, int height, QColor colour) {
  QImage image(width, height, QImage::Format_ARGB32);
  image.fill(colour);
  QByteArray bytes;
  QBuffer buffer(&bytes);
  buffer.open(QIODevice::WriteOnly);
  image.save(&buffer, "png");
  return {bytes.begin(), bytes.end()};
}

std::vector<std::uint8_t> BytesOf(std::string_view text) { return {text.begin(), text.end()}; }

} // namespace

class Drawing : public QtFixture {
 protected:
  Drawing() {
    form.design = [this] {
      for (PictureBox* picture : {&box, &other}) {
        picture->Move(0, 0, 1500, 1500);
        picture->ScaleMode = ScaleMode::Pixels;
      }
    };
    desktop.Load(form);
  }

  std::uint32_t PixelIn(const PictureBox& picture, int x, int y) {
    const Picture image = desktop.ImageOf(picture);
    return image.pixels()->argb[static_cast<std::size_t>(y * image.pixels()->width + x)];
  }

  PictureBox box{form, u"picBuffer"};
  PictureBox other{form, u"picOut"};
};

TEST_F(Drawing, A_filled_box_holds_both_its_corners) {
  desktop.FillBox(box, 10, 20, 12, 22, Rgb(10, 20, 30));

  EXPECT_EQ(PixelIn(box, 10, 20), 0xFF0A141EU);
  EXPECT_EQ(PixelIn(box, 12, 22), 0xFF0A141EU);
  EXPECT_EQ(PixelIn(box, 9, 20), 0U);
  EXPECT_EQ(PixelIn(box, 13, 22), 0U);
}

TEST_F(Drawing, A_filled_box_may_go_beyond_the_edges_and_name_its_corners_in_any_order) {
  desktop.FillBox(box, 200, 4, -5, -1, kRed);

  EXPECT_EQ(PixelIn(box, 0, 0), 0xFFFF0000U);
  EXPECT_EQ(PixelIn(box, 99, 4), 0xFFFF0000U);
  EXPECT_EQ(PixelIn(box, 0, 5), 0U);
}

TEST_F(Drawing, A_gradient_in_bands_has_the_last_bands_colour_in_every_row) {
  const int height = desktop.ScaleHeight(box);
  ASSERT_EQ(height, 100);
  double level = 0;
  for (int y = 0; y <= height; y += 5) {
    const auto grey = static_cast<unsigned>(level + 0.5);
    desktop.FillBox(box, 0, y - 1, desktop.ScaleWidth(box), y + 5, Rgb(grey, grey, grey));
    level += 765.0 / height;
  }

  EXPECT_EQ(PixelIn(box, 50, 0), 0xFF000000U);
  EXPECT_EQ(PixelIn(box, 50, 4), 0xFF080808U);
  EXPECT_EQ(PixelIn(box, 50, 50), 0xFF4D4D4DU);
  EXPECT_EQ(PixelIn(box, 50, 99), 0xFF999999U);
}

TEST_F(Drawing, Measures_are_in_the_unit_of_the_scale_mode) {
  EXPECT_EQ(desktop.ScaleWidth(box), 100);
  const int pixels = desktop.TextHeight(box, u"א");
  box.ScaleMode = ScaleMode::Twips;

  EXPECT_EQ(desktop.ScaleWidth(box), 1500);
  EXPECT_EQ(desktop.TextHeight(box, u"א"), pixels * kPixel);
  desktop.FillBox(box, 150, 150, 150, 150, kRed);
  EXPECT_EQ(PixelIn(box, 10, 10), 0xFFFF0000U);
}

TEST_F(Drawing, A_print_in_a_mirrored_form_stands_at_the_right_and_moves_to_the_next_line) {
  box.ForeColour = kWhite;
  box.CurrentX = 0;
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

TEST_F(Drawing, A_blit_copies_what_the_source_shows) {
  box.BackColour = kGreen;
  desktop.FillBox(box, 0, 0, 9, 9, kRed);

  desktop.BitBlt(other, 50, 60, 20, 20, box, 0, 0);

  EXPECT_EQ(PixelIn(other, 50, 60), 0xFFFF0000U);
  EXPECT_EQ(PixelIn(other, 65, 75), 0xFF008000U);
  EXPECT_EQ(PixelIn(other, 70, 60), 0U);
  EXPECT_EQ(PixelIn(other, 49, 60), 0U);
}

TEST_F(Drawing, A_blit_reads_from_its_source_place_and_nothing_beyond_the_source) {
  desktop.FillBox(box, 90, 90, 99, 99, kRed);

  desktop.BitBlt(other, 0, 0, 50, 50, box, 95, 95);

  EXPECT_EQ(PixelIn(other, 0, 0), 0xFFFF0000U);
  EXPECT_EQ(PixelIn(other, 4, 4), 0xFFFF0000U);
  EXPECT_EQ(PixelIn(other, 5, 5), 0U);
}

TEST_F(Drawing, Clearing_leaves_the_ground_and_starts_again_at_the_top) {
  desktop.FillBox(box, 0, 0, 99, 99, kRed);
  box.CurrentY = 50;

  desktop.Cls(box);

  EXPECT_EQ(PixelIn(box, 50, 50), 0U);
  EXPECT_EQ(box.CurrentY, 0);
}

TEST_F(Drawing, A_picture_is_stretched_over_the_box_below_its_drawings) {
  box.Contents = Picture::Of({1, 1, {0xFF0000FF}});
  desktop.FillBox(box, 0, 0, 9, 9, kRed);

  EXPECT_EQ(PixelIn(box, 5, 5), 0xFFFF0000U);
  EXPECT_EQ(PixelIn(box, 99, 99), 0xFF0000FFU);
}

TEST_F(Drawing, A_moved_container_keeps_the_drawings_of_what_is_in_it) {
  Frame frame(form, u"frame");
  PictureBox inner(frame, u"main_Pic");
  desktop.Unload(form);
  form.design = [&] {
    frame.Move(0, 0, 3000, 3000);
    inner.Move(0, 0, 480, 480);
  };
  desktop.Load(form);
  inner.ScaleMode = ScaleMode::Pixels;
  desktop.FillBox(inner, 0, 0, 31, 31, kRed);

  frame.Move(0, 300, 4500, 3000);

  EXPECT_EQ(PixelIn(inner, 5, 5), 0xFFFF0000U);
}

TEST_F(Drawing, An_icon_is_scaled_into_its_place_and_keeps_its_aspect) {
  ASSERT_TRUE(desktop.DrawIconEx(box, 0, 0, PngOf(64, 32, Qt::red), 32, 32));

  EXPECT_EQ(PixelIn(box, 16, 16), 0xFFFF0000U);
  EXPECT_EQ(PixelIn(box, 16, 4), 0U);
  EXPECT_EQ(PixelIn(box, 16, 28), 0U);
  EXPECT_EQ(PixelIn(box, 40, 16), 0U);
}

TEST_F(Drawing, Icons_may_be_drawings_or_pixmap_sources) {
  const auto svg = BytesOf("<svg xmlns='http://www.w3.org/2000/svg' width='8' height='8'>"
                           "<rect width='8' height='8' fill='#ff0000'/></svg>");
  const auto xpm =
      BytesOf("/* XPM */\nstatic char* x[] = {\n\"2 2 1 1\",\n\"a c #00FF00\",\n\"aa\",\n\"aa\"\n};\n");

  ASSERT_TRUE(desktop.DrawIconEx(box, 0, 0, svg, 32, 32));
  ASSERT_TRUE(desktop.DrawIconEx(box, 40, 0, xpm, 32, 32));

  EXPECT_EQ(PixelIn(box, 16, 16), 0xFFFF0000U);
  EXPECT_EQ(PixelIn(box, 56, 16), 0xFF00FF00U);
}

TEST_F(Drawing, Bytes_that_are_no_image_draw_nothing) {
  EXPECT_FALSE(desktop.DrawIconEx(box, 0, 0, {}, 32, 32));
  EXPECT_FALSE(desktop.DrawIconEx(box, 0, 0, BytesOf("not an image"), 32, 32));
  EXPECT_EQ(PixelIn(box, 16, 16), 0U);
}

TEST_F(Drawing, Every_cut_of_an_image_is_refused_or_drawn_but_never_fatal) {
  const auto whole = PngOf(16, 16, Qt::red);
  for (std::size_t length = 0; length < whole.size(); ++length) {
    const std::vector<std::uint8_t> cut(whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(length));
    desktop.DrawIconEx(box, 0, 0, cut, 32, 32);
  }
  EXPECT_TRUE(desktop.DrawIconEx(box, 0, 0, whole, 32, 32));
}

TEST_F(Drawing, Images_of_absurd_sizes_and_other_formats_are_refused) {
  auto huge = PngOf(16, 16, Qt::red);
  // Width in the header of a PNG: bytes 16 to 19.
  huge[16] = 0x7F;
  const auto xpm =
      BytesOf("/* XPM */\nstatic char* x[] = {\n\"90000 90000 1 1\",\n\"a c #00FF00\",\n\"aa\"\n};\n");
  const auto netpbm = BytesOf("P1 2 2 1 0 0 1");

  EXPECT_TRUE(qt::DecodeIcon(huge, {32, 32}).isNull());
  EXPECT_TRUE(qt::DecodeIcon(xpm, {32, 32}).isNull());
  EXPECT_TRUE(qt::DecodeIcon(netpbm, {32, 32}).isNull());
  EXPECT_TRUE(qt::DecodeIcon(PngOf(16, 16, Qt::red), {0, 32}).isNull());
}

TEST_F(Drawing, An_image_of_2048_pixels_is_taken_and_one_of_2049_refused) {
  EXPECT_FALSE(qt::DecodeIcon(PngOf(2048, 1, Qt::red), {32, 32}).isNull());
  EXPECT_TRUE(qt::DecodeIcon(PngOf(2049, 1, Qt::red), {32, 32}).isNull());
  EXPECT_TRUE(qt::DecodeIcon(PngOf(1, 2049, Qt::red), {32, 32}).isNull());
}

TEST_F(Drawing, A_drawing_that_names_a_giant_size_is_drawn_small) {
  const auto svg = BytesOf("<svg xmlns='http://www.w3.org/2000/svg' width='60000' height='60000'>"
                           "<rect width='60000' height='60000' fill='#ff0000'/></svg>");

  const QImage image = qt::DecodeIcon(svg, {32, 32});

  EXPECT_EQ(image.size(), QSize(32, 32));
}

TEST_F(Drawing, A_box_of_a_form_that_is_not_loaded_takes_drawings_without_harm) {
  desktop.Unload(form);

  desktop.FillBox(box, 0, 0, 9, 9, kRed);
  desktop.Print(box, u"א");
  desktop.BitBlt(other, 0, 0, 9, 9, box, 0, 0);
  desktop.Cls(box);

  EXPECT_FALSE(desktop.DrawIconEx(box, 0, 0, PngOf(4, 4, Qt::red), 32, 32));
  EXPECT_TRUE(desktop.ImageOf(box).IsNone());
}

TEST_F(Drawing, Artwork_is_drawn_from_the_programs_resources) {
  qt::PictureStore pictures;

  const QPixmap icon = pictures.PixmapOf(Picture::Artwork("quendra"));

  EXPECT_GT(icon.width(), 32);
  const QPixmap dense(QStringLiteral(":/artwork/quendra@2x.png"));
  EXPECT_EQ(dense.width() * dense.devicePixelRatio(), 2 * icon.width() * dense.devicePixelRatio());
}

TEST_F(Drawing, Missing_artwork_is_a_placeholder_and_is_reported_once) {
  qt::PictureStore pictures;
  testing::internal::CaptureStderr();

  const QPixmap first = pictures.PixmapOf(Picture::Artwork("nowhere"));
  const QPixmap second = pictures.PixmapOf(Picture::Artwork("nowhere"));

  EXPECT_EQ(testing::internal::GetCapturedStderr(), "quendra: artwork \"nowhere\" is missing\n");
  EXPECT_FALSE(first.isNull());
  EXPECT_EQ(first.cacheKey(), second.cacheKey());
}

TEST_F(Drawing, A_picture_with_fewer_pixels_than_it_says_is_no_picture) {
  qt::PictureStore pictures;

  EXPECT_TRUE(pictures.PixmapOf(Picture::Of({100, 100, {1, 2, 3}})).isNull());
  EXPECT_TRUE(pictures.PixmapOf(Picture::Of({-1, 2, {1, 2, 3}})).isNull());
}

} // namespace quendra::forms::qt
