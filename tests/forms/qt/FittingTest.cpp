#include "forms/qt/QtFixture.h"

#include <QHeaderView>
#include <QScreen>
#include <QScrollArea>
#include <QScrollBar>
#include <QTreeView>
#include <QWindow>

#include <cmath>

namespace quendra::forms::qt {

/// A form without a frame that the screen shows at four fifths: five quarters as wide as the screen.
class FormOnSmallScreen : public QtFixture {
 protected:
  FormOnSmallScreen() : screen(QGuiApplication::primaryScreen()->availableGeometry()) {
    form.Border = BorderStyle::None;
    form.RightToLeft = false;
    form.design = [this] {
      form.Move(0, 0, screen.width() * 5 / 4 * kPixel, 600 * kPixel);
      label.Move(100 * kPixel, 40 * kPixel, 200 * kPixel, 20 * kPixel);
      label.TextFont = Font{12, false, false};
      box.Move(0, 100 * kPixel, 100 * kPixel, 100 * kPixel);
      box.ScaleMode = ScaleMode::Pixels;
      list.Move(0, 220 * kPixel, 400 * kPixel, 300 * kPixel);
      if (alter) alter();
    };
  }

  QTreeView& View() { return As<QTreeView>(list); }
  /// As wide and as high, counted in screens, as it is told.
  void LayOut(double width, double height) {
    alter = [=, this] {
      form.Move(0, 0, static_cast<int>(std::lround(screen.width() * width)) * kPixel,
                static_cast<int>(std::lround(screen.height() * height)) * kPixel);
    };
  }

  QRect screen;
  std::function<void()> alter;
  Label label{form, u"label"};
  PictureBox box{form, u"box"};
  ListView list{form, u"list"};
};

TEST_F(FormOnSmallScreen, Is_shown_whole_and_smaller) {
  desktop.Show(form);

  EXPECT_EQ(WidgetOf(form).size(), QSize(screen.width(), 480));
  EXPECT_EQ(WidgetOf(form).geometry().left(), screen.left());
  EXPECT_EQ(WidgetOf(label).geometry(), QRect(80, 32, 160, 16));
}

TEST_F(FormOnSmallScreen, Shows_its_letters_as_much_smaller_as_its_lengths) {
  desktop.Show(form);

  EXPECT_DOUBLE_EQ(WidgetOf(label).font().pointSizeF(), 9.6);
}

TEST_F(FormOnSmallScreen, That_is_mirrored_keeps_its_distance_from_the_right_edge) {
  form.RightToLeft = true;

  desktop.Show(form);

  EXPECT_EQ(WidgetOf(label).geometry(), QRect(screen.width() - 80 - 160, 32, 160, 16));
}

TEST_F(FormOnSmallScreen, Leaves_room_for_the_frame_of_a_window_that_has_one) {
  form.Border = BorderStyle::FixedSingle;
  LayOut(1, 1);

  desktop.Load(form);

  EXPECT_LT(WidgetOf(form).width(), screen.width());
  EXPECT_LE(WidgetOf(form).height(), screen.height() - 24);
  EXPECT_GE(WidgetOf(form).height(), screen.height() * 9 / 10);
}

TEST_F(FormOnSmallScreen, Takes_all_the_room_that_its_frame_turns_out_to_leave) {
  form.Border = BorderStyle::FixedSingle;
  LayOut(1, 1);

  desktop.Show(form);

  ASSERT_TRUE(RunUntil([&] { return !WidgetOf(form).windowHandle()->frameMargins().isNull(); }));
  const QRect window = WidgetOf(form).frameGeometry();
  EXPECT_TRUE(screen.contains(window)) << window.width() << " x " << window.height();
  EXPECT_TRUE(window.width() == screen.width() || window.height() == screen.height());
}

TEST_F(FormOnSmallScreen, Has_its_size_as_laid_out_where_there_is_room) {
  LayOut(1, 1);

  desktop.Show(form);

  EXPECT_EQ(WidgetOf(form).size(), screen.size());
  EXPECT_EQ(WidgetOf(label).geometry(), QRect(100, 40, 200, 20));
}

TEST_F(FormOnSmallScreen, Fits_again_when_its_size_changes) {
  desktop.Show(form);

  form.Move(0, 0, 400 * kPixel, 300 * kPixel);

  EXPECT_EQ(WidgetOf(form).size(), QSize(400, 300));
  EXPECT_EQ(WidgetOf(label).geometry(), QRect(100, 40, 200, 20));
  EXPECT_DOUBLE_EQ(WidgetOf(label).font().pointSizeF(), 12);
}

TEST_F(FormOnSmallScreen, Comes_back_on_the_screen_when_it_grows_beyond_its_edge) {
  LayOut(0.25, 0.25);
  desktop.Show(form);
  WidgetOf(form).move(screen.right() - 220, screen.bottom() - 220);

  form.Move(0, 0, 400 * kPixel, 300 * kPixel);

  EXPECT_EQ(WidgetOf(form).geometry(), QRect(screen.right() - 399, screen.bottom() - 299, 400, 300));
}

TEST_F(FormOnSmallScreen, Gives_places_of_the_mouse_in_the_twips_of_its_layout) {
  std::pair<int, int> place;
  label.MouseMove = [&](int, int, int x, int y) { place = {x, y}; };
  desktop.Show(form);

  MoveMouse(WidgetOf(label), {80, 8});

  EXPECT_EQ(place, std::pair(100 * kPixel, 10 * kPixel));
}

TEST_F(FormOnSmallScreen, Can_be_dragged_by_as_many_pixels_as_the_mouse_moves) {
  label.MouseMove = [&](int button, int, int, int) {
    if (button == kLeftButton) desktop.SendMessage(desktop.HandleOf(form), 0xA1, 2, 0);
  };
  desktop.Show(form);
  QCursor::setPos(WidgetOf(label).mapToGlobal(QPoint(5, 5)));
  PressMouse(WidgetOf(label), {5, 5});
  MoveMouse(WidgetOf(label), {5, 5}, Qt::LeftButton);
  const QPoint before = WidgetOf(form).pos();

  MoveMouse(WidgetOf(label), {35, 15}, Qt::LeftButton);

  EXPECT_EQ(WidgetOf(form).pos() - before, QPoint(30, 10));
}

TEST_F(FormOnSmallScreen, Does_not_change_what_picture_boxes_measure) {
  LayOut(0.5, 0.5);
  desktop.Load(form);
  const int text = desktop.TextWidth(box, u"הסכם שימוש");
  const int line = desktop.TextHeight(box, u"הסכם שימוש");
  desktop.Unload(form);
  alter = {};

  desktop.Show(form);

  EXPECT_EQ(WidgetOf(box).width(), 80);
  EXPECT_EQ(desktop.ScaleWidth(box), 100);
  EXPECT_EQ(desktop.ScaleHeight(box), 100);
  EXPECT_EQ(desktop.TextWidth(box, u"הסכם שימוש"), text);
  EXPECT_EQ(desktop.TextHeight(box, u"הסכם שימוש"), line);
  EXPECT_DOUBLE_EQ(desktop.TwipsPerPixelX(), kPixel);
  EXPECT_DOUBLE_EQ(desktop.TwipsPerPixelY(), kPixel);
}

TEST_F(FormOnSmallScreen, Shows_drawings_in_proportion_and_keeps_them_in_full) {
  desktop.Show(form);

  desktop.FillBox(box, 0, 0, 49, 99, kRed);

  EXPECT_EQ(PixelOf(WidgetOf(box), 38, 78), QColor(Qt::red));
  EXPECT_EQ(PixelOf(WidgetOf(box), 42, 78), QColor(Qt::white));
  const Picture image = desktop.ImageOf(box);
  EXPECT_EQ(image.pixels()->width, 100);
  EXPECT_EQ(image.pixels()->argb[49], 0xFFFF0000U);
  EXPECT_EQ(image.pixels()->argb[50], 0U);
}

TEST_F(FormOnSmallScreen, Copies_between_picture_boxes_to_their_last_row) {
  PictureBox other(form, u"other");
  alter = [&] {
    other.Move(0, 0, 100 * kPixel, 100 * kPixel);
    other.ScaleMode = ScaleMode::Pixels;
    other.BackColour = kBlack;
  };
  desktop.Show(form);
  desktop.FillBox(box, 0, 0, 99, 99, kRed);

  desktop.BitBlt(other, 0, 0, 100, 100, box, 0, 0);

  EXPECT_EQ(PixelOf(WidgetOf(other), 79, 79), QColor(Qt::red));
}

TEST_F(FormOnSmallScreen, Is_cut_to_its_region_at_its_own_size) {
  desktop.Load(form);
  const int width = form.Position().width / kPixel;

  desktop.SetWindowRgn(desktop.HandleOf(form), desktop.CreateRoundRectRgn(0, 0, width, 600, 10, 10), false);

  const QRegion mask = WidgetOf(form).mask();
  EXPECT_EQ(mask.boundingRect(), WidgetOf(form).rect());
  EXPECT_FALSE(mask.contains(QPoint(0, 0)));
  EXPECT_TRUE(mask.contains(QPoint(4, 0)));
}

TEST_F(FormOnSmallScreen, Keeps_region_and_window_in_step_when_its_size_changes) {
  desktop.Show(form);
  desktop.SetWindowRgn(desktop.HandleOf(form), desktop.CreateRoundRectRgn(0, 0, 400, 300, 10, 10), false);
  ASSERT_EQ(WidgetOf(form).mask().boundingRect(), QRect(0, 0, 320, 240));

  form.Move(0, 0, 400 * kPixel, 300 * kPixel);

  EXPECT_EQ(WidgetOf(form).mask().boundingRect(), QRect(0, 0, 400, 300));
}

TEST_F(FormOnSmallScreen, Shows_the_columns_of_a_list_and_its_rows_in_proportion) {
  list.AddColumn({u"יישום", 150 * kPixel});
  list.AddColumn({u"שימוש כולל", 2});
  list.Add(u"p1", u"alpha", 0);
  desktop.Show(form);
  const int smaller = View().visualRect(View().model()->index(0, 0)).height();
  EXPECT_EQ(View().header()->sectionSize(0), 120);
  EXPECT_TRUE(View().header()->isSectionHidden(1));

  form.Move(0, 0, 500 * kPixel, 600 * kPixel);
  QCoreApplication::processEvents();

  EXPECT_EQ(View().header()->sectionSize(0), 150);
  EXPECT_GT(View().visualRect(View().model()->index(0, 0)).height(), smaller);
}

TEST_F(FormOnSmallScreen, Below_70_percent_scrolls_at_70_percent) {
  LayOut(2, 0.5);

  desktop.Show(form);

  auto& window = dynamic_cast<QScrollArea&>(WidgetOf(form));
  EXPECT_EQ(window.width(), screen.width());
  EXPECT_EQ(WidgetOf(label).geometry(), QRect(70, 28, 140, 14));
  EXPECT_EQ(window.horizontalScrollBar()->maximum(),
            static_cast<int>(std::lround(screen.width() * 1.4)) - screen.width());
  EXPECT_TRUE(RunUntil([&] { return window.horizontalScrollBar()->isVisible(); }));
  EXPECT_FALSE(window.verticalScrollBar()->isVisible());
}

TEST_F(FormOnSmallScreen, That_is_scrolled_gives_places_of_the_mouse_from_its_own_edge) {
  LayOut(2, 0.5);
  std::pair<int, int> place;
  form.MouseMove = [&](int, int, int x, int y) { place = {x, y}; };
  desktop.Show(form);
  dynamic_cast<QScrollArea&>(WidgetOf(form)).horizontalScrollBar()->setValue(70);

  MoveMouse(WidgetOf(form), {7, 14});

  EXPECT_EQ(place, std::pair(110 * kPixel, 20 * kPixel));
}

TEST_F(FormOnSmallScreen, That_reads_from_right_to_left_starts_at_its_right_edge) {
  form.RightToLeft = true;
  LayOut(2, 0.5);

  desktop.Show(form);

  EXPECT_EQ(WidgetOf(label).mapTo(&WidgetOf(form), QPoint(0, 0)).x(), screen.width() - 70 - 140);
}

TEST_F(FormOnSmallScreen, Brings_what_the_Tab_key_finds_into_view) {
  LayOut(2, 0.5);
  Label far(form, u"far");
  far.Click = [] {};
  label.Click = [] {};
  const auto laidOut = alter;
  alter = [&] {
    laidOut();
    far.Move(screen.width() * 2 * kPixel - 100 * kPixel, 40 * kPixel, 100 * kPixel, 20 * kPixel);
  };
  ShowActive();
  WidgetOf(label).setFocus();
  ASSERT_FALSE(WidgetOf(form).rect().contains(WidgetOf(far).mapTo(&WidgetOf(form), QPoint(1, 1))));

  for (int press = 0; press < 5 && !WidgetOf(far).hasFocus(); ++press)
    PressKey(*WidgetOf(form).focusWidget(), Qt::Key_Tab);

  EXPECT_TRUE(WidgetOf(far).hasFocus());
  EXPECT_TRUE(WidgetOf(form).rect().contains(WidgetOf(far).mapTo(&WidgetOf(form), QPoint(1, 1))));
}

} // namespace quendra::forms::qt
