#include "forms/qt/QtFixture.h"

#include <QScreen>

#include <cstdlib>

namespace quendra::forms::qt {

class Window : public QtFixture {};

TEST_F(Window, A_form_takes_its_size_in_twips_and_is_fixed) {
  desktop.Show(form);

  EXPECT_EQ(WidgetOf(form).size(), QSize(400, 300));
  EXPECT_EQ(WidgetOf(form).minimumSize(), WidgetOf(form).maximumSize());
}

TEST_F(Window, A_form_comes_up_in_the_middle_of_the_screen) {
  form.Border = BorderStyle::None;

  desktop.Show(form);

  const QPoint offset =
      WidgetOf(form).geometry().center() - QGuiApplication::primaryScreen()->availableGeometry().center();
  EXPECT_LE(offset.manhattanLength(), 2);
}

TEST_F(Window, A_form_with_a_title_bar_comes_up_in_the_middle_with_its_frame) {
  desktop.Show(form);

  const QPoint offset =
      WidgetOf(form).geometry().center() - QGuiApplication::primaryScreen()->availableGeometry().center();
  constexpr int kHighestTitleBar = 40;
  EXPECT_LE(std::abs(offset.x()), 2);
  EXPECT_LE(std::abs(offset.y()), kHighestTitleBar / 2);
}

TEST_F(Window, A_form_over_an_owner_at_the_edge_of_the_screen_stays_on_the_screen) {
  TestForm other;
  other.Border = BorderStyle::None;
  desktop.Show(form);
  WidgetOf(form).move(-300, -200);
  other.load = [&] { desktop.Show(other, Modality::Modeless, &form); };

  desktop.Load(other);

  const QRect screen = QGuiApplication::primaryScreen()->availableGeometry();
  EXPECT_EQ(WidgetOf(other).geometry().topLeft(), screen.topLeft());
}

TEST_F(Window, A_loaded_form_is_not_shown_yet) {
  desktop.Load(form);

  EXPECT_TRUE(WidgetOf(form).isHidden());
}

TEST_F(Window, A_fixed_single_border_has_a_minimise_box_and_no_maximise_box) {
  desktop.Load(form);

  const Qt::WindowFlags flags = WidgetOf(form).windowFlags();
  EXPECT_TRUE(flags & Qt::WindowTitleHint);
  EXPECT_TRUE(flags & Qt::WindowMinimizeButtonHint);
  EXPECT_TRUE(flags & Qt::WindowCloseButtonHint);
  EXPECT_FALSE(flags & Qt::WindowMaximizeButtonHint);
  EXPECT_FALSE(flags & Qt::FramelessWindowHint);
}

TEST_F(Window, A_form_without_a_border_has_no_frame) {
  form.Border = BorderStyle::None;

  desktop.Load(form);

  EXPECT_TRUE(WidgetOf(form).windowFlags() & Qt::FramelessWindowHint);
}

TEST_F(Window, The_title_is_the_caption) {
  form.design = [&] { form.Caption = Text(u"זלמר בינלאומי@נט"); };

  desktop.Load(form);

  EXPECT_EQ(WidgetOf(form).windowTitle(), QStringLiteral("זלמר בינלאומי@נט"));
}

TEST_F(Window, A_window_that_becomes_active_activates_its_form) {
  desktop.Show(form);

  EXPECT_TRUE(RunUntil([&] { return form.activations > 0; }));
}

TEST_F(Window, A_round_region_leaves_out_the_corners_and_the_right_and_lower_edge) {
  desktop.Load(form);

  desktop.SetWindowRgn(desktop.HandleOf(form), desktop.CreateRoundRectRgn(0, 0, 400, 300, 10, 10), false);

  const QRegion mask = WidgetOf(form).mask();
  EXPECT_EQ(mask.boundingRect(), QRect(0, 0, 400, 300));
  EXPECT_FALSE(mask.contains(QPoint(0, 0)));
  EXPECT_FALSE(mask.contains(QPoint(399, 299)));
  EXPECT_TRUE(mask.contains(QPoint(5, 0)));
  EXPECT_TRUE(mask.contains(QPoint(0, 5)));
  EXPECT_TRUE(mask.contains(QPoint(200, 150)));
}

TEST_F(Window, A_region_belongs_to_the_window_that_took_it) {
  TestForm other;
  desktop.Load(form);
  desktop.Load(other);
  const RegionHandle region = desktop.CreateRoundRectRgn(0, 0, 400, 300, 10, 10);
  desktop.SetWindowRgn(desktop.HandleOf(form), region, false);

  desktop.SetWindowRgn(desktop.HandleOf(other), region, false);

  EXPECT_TRUE(WidgetOf(other).mask().isEmpty());
}

TEST_F(Window, Twips_follow_the_screens_logical_resolution) {
  EXPECT_DOUBLE_EQ(desktop.TwipsPerPixelX(), 1440 / QGuiApplication::primaryScreen()->logicalDotsPerInchX());
  EXPECT_DOUBLE_EQ(desktop.TwipsPerPixelY(), 15);
}

} // namespace quendra::forms::qt
