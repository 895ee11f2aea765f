#include "forms/qt/QtFixture.h"

#include <QComboBox>

namespace quendra::forms::qt {

class Views : public QtFixture {};

TEST_F(Views, Attaching_pushes_the_whole_state) {
  Label label(form, u"lblText");
  form.design = [&] {
    label.Move(150, 300, 1500, 450);
    label.Enabled = false;
    label.Visible = false;
    label.TextFont = Font{14, true, true};
    label.Caption = Text(u"כיתוב");
  };

  desktop.Load(form);

  QWidget& widget = WidgetOf(label);
  EXPECT_EQ(widget.size(), QSize(100, 30));
  EXPECT_EQ(widget.y(), 20);
  EXPECT_FALSE(widget.isEnabled());
  EXPECT_TRUE(widget.isHidden());
  EXPECT_EQ(widget.font().pointSize(), 14);
  EXPECT_TRUE(widget.font().bold());
  EXPECT_TRUE(widget.font().underline());
  EXPECT_EQ(widget.accessibleName(), QStringLiteral("כיתוב"));
}

TEST_F(Views, A_form_that_reads_from_right_to_left_mirrors_its_controls) {
  Label label(form, u"lblText");
  form.design = [&] { label.Move(150, 300, 1500, 450); };

  desktop.Load(form);

  // 400 pixels wide, less 10 from the right edge, less its own 100.
  EXPECT_EQ(WidgetOf(label).x(), 290);
  EXPECT_EQ(WidgetOf(form).layoutDirection(), Qt::RightToLeft);
}

TEST_F(Views, A_form_that_reads_from_left_to_right_does_not) {
  Label label(form, u"lblText");
  form.RightToLeft = false;
  form.design = [&] { label.Move(150, 300, 1500, 450); };

  desktop.Load(form);

  EXPECT_EQ(WidgetOf(label).x(), 10);
  EXPECT_EQ(WidgetOf(form).layoutDirection(), Qt::LeftToRight);
}

TEST_F(Views, Mirrored_controls_follow_the_width_of_their_container) {
  Frame frame(form, u"frame");
  Label label(frame, u"lblText");
  form.design = [&] {
    frame.Move(0, 0, 3000, 3000);
    label.Move(150, 0, 750, 300);
  };
  desktop.Load(form);
  ASSERT_EQ(WidgetOf(label).x(), 140);

  frame.Move(0, 0, 4500, 3000);

  EXPECT_EQ(WidgetOf(label).x(), 240);
}

TEST_F(Views, Controls_that_touch_in_twips_touch_in_pixels) {
  Label first(form, u"first");
  Label second(form, u"second");
  form.design = [&] {
    first.Move(0, 0, 1007, 300);
    second.Move(1007, 0, 1007, 300);
  };

  desktop.Load(form);

  EXPECT_EQ(WidgetOf(second).geometry().right() + 1, WidgetOf(first).x());
}

TEST_F(Views, A_change_reaches_the_widget_at_once) {
  Label label(form, u"lblText");
  desktop.Load(form);

  label.Move(0, 0, 600, 300);
  label.Enabled = false;
  label.Visible = false;
  label.Caption = Text(u"אחר");

  EXPECT_EQ(WidgetOf(label).size(), QSize(40, 20));
  EXPECT_FALSE(WidgetOf(label).isEnabled());
  EXPECT_TRUE(WidgetOf(label).isHidden());
  EXPECT_EQ(WidgetOf(label).accessibleName(), QStringLiteral("אחר"));
}

TEST_F(Views, The_control_that_was_brought_to_the_front_covers_its_siblings) {
  PictureBox below(form, u"below");
  PictureBox above(form, u"above");
  form.design = [&] {
    below.Move(0, 0, 6000, 4500);
    below.BackColour = kRed;
    above.Move(0, 0, 6000, 4500);
    above.BackColour = kGreen;
  };
  desktop.Show(form);
  ASSERT_EQ(PixelOf(WidgetOf(form), 5, 5), QColor(0, 128, 0));

  below.BringToFront();

  EXPECT_EQ(PixelOf(WidgetOf(form), 5, 5), QColor(255, 0, 0));
}

TEST_F(Views, The_forms_colour_fills_its_window_and_stays_off_its_controls) {
  ComboBox combo(form, u"combo");
  form.design = [&] {
    form.BackColour = Rgb(162, 233, 93);
    combo.Move(1500, 1500, 1500, 360);
  };

  desktop.Show(form);

  EXPECT_EQ(PixelOf(WidgetOf(form), 5, 5), QColor(162, 233, 93));
  EXPECT_NE(WidgetOf(combo).palette().color(QPalette::Window), QColor(162, 233, 93));
}

TEST_F(Views, An_opaque_label_has_its_own_ground_and_a_transparent_one_has_none) {
  Label opaque(form, u"opaque");
  Label transparent(form, u"transparent");
  form.design = [&] {
    form.BackColour = kGreen;
    opaque.Move(0, 0, 1500, 300);
    opaque.Transparent = false;
    opaque.BackColour = kRed;
    transparent.Move(0, 1500, 1500, 300);
    transparent.BackColour = kRed;
  };

  desktop.Show(form);

  EXPECT_EQ(PixelOf(WidgetOf(form), 350, 10), QColor(255, 0, 0));
  EXPECT_EQ(PixelOf(WidgetOf(form), 350, 110), QColor(0, 128, 0));
}

TEST_F(Views, A_line_falls_the_other_way_in_a_mirrored_form) {
  Line line(form, u"line");
  form.design = [&] {
    line.Ends = LineEnds{0, 0, 1500, 1500};
    line.BorderWidth = 5;
    line.ForeColour = kRed;
  };

  desktop.Show(form);

  // From the top right corner down to the left.
  EXPECT_EQ(PixelOf(WidgetOf(form), 350, 50), QColor(255, 0, 0));
  EXPECT_EQ(PixelOf(WidgetOf(form), 380, 20), QColor(255, 0, 0));
  EXPECT_NE(PixelOf(WidgetOf(form), 320, 20), QColor(255, 0, 0));
}

TEST_F(Views, A_combo_box_shows_its_items_and_the_selected_one) {
  ComboBox combo(form, u"combo");
  desktop.Load(form);
  auto& box = As<QComboBox>(combo);

  combo.AddItem(u"eth0");
  combo.AddItem(u"כרטיס");
  combo.SelectItem(1);

  EXPECT_EQ(box.count(), 2);
  EXPECT_EQ(box.currentIndex(), 1);
  EXPECT_EQ(box.currentText(), QStringLiteral("כרטיס"));

  combo.Clear();
  EXPECT_EQ(box.count(), 0);
  combo.AddItem(u"lo");
  EXPECT_EQ(box.currentIndex(), -1);
}

TEST_F(Views, A_container_may_place_what_stands_in_it_from_its_left_edge) {
  Frame tiles(form, u"tiles");
  Frame mirrored(form, u"mirrored");
  PictureBox tile(tiles, u"tile");
  PictureBox other(mirrored, u"other");
  tiles.PlacesFromLeft = true;
  form.design = [&] {
    for (Frame* frame : {&tiles, &mirrored}) frame->Move(0, 0, 6000, 1500);
    for (PictureBox* box : {&tile, &other}) box->Move(150, 0, 1500, 450);
  };

  desktop.Load(form);

  EXPECT_EQ(WidgetOf(tile).x(), 10);
  EXPECT_EQ(WidgetOf(other).x(), 290);
  tile.Move(1500, 0, 1500, 450);
  EXPECT_EQ(WidgetOf(tile).x(), 100);
}

TEST_F(Views, The_users_choice_in_a_combo_box_selects_and_clicks_once) {
  ComboBox combo(form, u"combo");
  int clicks = 0;
  combo.Click = [&] { ++clicks; };
  desktop.Load(form);
  combo.AddItem(u"eth0");
  combo.AddItem(u"lo");

  emit As<QComboBox>(combo).activated(1);

  EXPECT_EQ(combo.ListIndex(), 1);
  EXPECT_EQ(clicks, 1);
}

TEST_F(Views, A_selection_by_the_program_raises_one_click_not_two) {
  ComboBox combo(form, u"combo");
  int clicks = 0;
  combo.Click = [&] { ++clicks; };
  desktop.Load(form);
  combo.AddItem(u"eth0");

  combo.SelectItem(0);

  EXPECT_EQ(clicks, 1);
}

TEST_F(Views, Latin_items_of_a_combo_box_are_set_apart_from_the_reading_direction) {
  ComboBox combo(form, u"combo");
  desktop.Load(form);

  combo.AddItem(u"eth0 (10.0.0.5)");

  EXPECT_EQ(As<QComboBox>(combo).itemText(0), QStringLiteral(u"\u2066eth0 (10.0.0.5)\u2069"));
}

TEST_F(Views, An_unloaded_form_lets_go_of_its_controls) {
  Label label(form, u"lblText");
  ListView list(form, u"list");
  desktop.Show(form);

  desktop.Unload(form);

  EXPECT_EQ(label.View(), nullptr);
  EXPECT_EQ(form.View(), nullptr);
  label.Caption = Text(u"after");
  list.Add(u"p1", u"row", 0);
}

TEST_F(Views, A_form_can_go_before_its_desktop_without_having_been_unloaded) {
  auto doomed = std::make_unique<TestForm>();
  auto list = std::make_unique<ListView>(*doomed, u"list");
  list->Add(u"p1", u"row", 0);
  desktop.Show(*doomed);

  list.reset();
  doomed.reset();
  QCoreApplication::processEvents();

  for (const QWidget* window : QApplication::topLevelWidgets()) EXPECT_FALSE(window->isVisible());
}

} // namespace quendra::forms::qt
