#include "forms/headless/HeadlessDesktop.h"

#include <gtest/gtest.h>

namespace quendra::forms::headless {
namespace {

struct MainForm : Form {
  MainForm() : Form(u"frmMenu") {}
  void Design() override {
    Move(0, 0, 6000, 3000);
    picture.Move(0, 0, 1500, 750);
    buffer.Move(0, 0, 1500, 750);
    buffer.ScaleMode = ScaleMode::Pixels;
  }
  void Form_KeyDown(int keyCode, int shift) override { keys.push_back(keyCode * 10 + shift); }

  Frame page{*this, u"frameMain"};
  Label label{page, u"lblCaption"};
  PictureBox picture{*this, u"picOut"};
  PictureBox buffer{*this, u"picBuffer"};
  ComboBox combo{page, u"main_cmbAdapters"};
  ListView list{page, u"main_ListView1"};
  Timer timer{*this, u"Timer1", 10, false};
  std::vector<int> keys;
};

struct HeadlessDesktopTest : testing::Test {
  HeadlessDesktopTest() { desktop.Show(form); }
  HeadlessDesktop desktop;
  MainForm form;
};

using Lines = std::vector<std::string>;

// The dispatcher.

TEST_F(HeadlessDesktopTest, Nothing_is_dispatched_after_the_end) {
  int ran = 0;
  desktop.Dispatch([&] { desktop.End(3); });

  desktop.Post([&] { ++ran; });
  desktop.RunUntilIdle();
  form.timer.Tick = [&] { ++ran; };
  form.timer.Enabled = true;
  desktop.Advance(100);
  EXPECT_FALSE(desktop.Click(form.label));

  EXPECT_EQ(desktop.EndStatus, 3);
  EXPECT_EQ(ran, 0);
}

// Boxes and yields.

TEST_F(HeadlessDesktopTest, Boxes_are_answered_as_scripted_and_with_1_beyond_the_script) {
  desktop.AnswerNextBox(7);
  desktop.AnswerNextBox(6);

  EXPECT_EQ(desktop.MessageBox(u"a", 4, u"t"), 7);
  EXPECT_EQ(desktop.MessageBox(u"b", 4, u"t"), 6);
  EXPECT_EQ(desktop.MessageBox(u"c", kHebrewBox, u"t"), 1);
  EXPECT_EQ(desktop.Boxes[2], (HeadlessDesktop::Box{u"c", 0x180000, u"t"}));
}

TEST_F(HeadlessDesktopTest, A_yield_is_counted_and_runs_what_was_posted) {
  Lines order;
  desktop.Post([&] { order.push_back("posted"); });
  desktop.OnYield = [&] { order.push_back("yield"); };

  desktop.DoEvents();

  EXPECT_EQ(order, (Lines{"yield", "posted"}));
  EXPECT_EQ(desktop.YieldCount, 1);
}

TEST_F(HeadlessDesktopTest, The_yield_script_is_not_run_within_itself) {
  int scripted = 0;
  desktop.OnYield = [&] {
    ++scripted;
    desktop.DoEvents();
  };

  desktop.DoEvents();
  desktop.DoEvents();

  EXPECT_EQ(scripted, 2);
  EXPECT_EQ(desktop.YieldCount, 4);
}

// The loop.

TEST_F(HeadlessDesktopTest, Work_that_posts_itself_for_ever_is_found_out) {
  std::function<void()> again = [&] { desktop.Post(again); };
  again();

  EXPECT_THROW(desktop.RunUntilIdle(), std::runtime_error);
}

// Time.

TEST_F(HeadlessDesktopTest, Timers_tick_in_the_order_of_their_times) {
  Lines order;
  auto slow = desktop.StartTimer(30, [&] { order.push_back("slow " + std::to_string(desktop.Now())); });
  auto fast = desktop.StartTimer(20, [&] { order.push_back("fast " + std::to_string(desktop.Now())); });

  desktop.Advance(70);

  EXPECT_EQ(order, (Lines{"fast 20", "slow 30", "fast 40", "slow 60", "fast 60"}));
  EXPECT_EQ(desktop.Now(), 70);
}

TEST_F(HeadlessDesktopTest, A_timer_whose_subscription_went_ticks_no_more) {
  int ticks = 0;
  auto timer = desktop.StartTimer(10, [&] { ++ticks; });
  desktop.Advance(20);
  timer.reset();

  desktop.Advance(100);

  EXPECT_EQ(ticks, 2);
}

TEST_F(HeadlessDesktopTest, A_Timer_ticks_while_it_is_enabled) {
  int ticks = 0;
  form.timer.Tick = [&] { ++ticks; };

  desktop.Advance(100);
  EXPECT_EQ(ticks, 0);
  form.timer.Enabled = true;
  desktop.Advance(25);
  EXPECT_EQ(ticks, 2);
  form.timer.Enabled = false;
  desktop.Advance(100);

  EXPECT_EQ(ticks, 2);
}

TEST_F(HeadlessDesktopTest, A_Timer_may_change_its_interval_and_stop_itself_inside_a_tick) {
  Lines ticks;
  form.timer.Tick = [&] {
    ticks.push_back(std::to_string(desktop.Now()));
    form.timer.Interval = 25;
    if (ticks.size() == 3) form.timer.Enabled = false;
  };
  form.timer.Enabled = true;

  desktop.Advance(200);

  EXPECT_EQ(ticks, (Lines{"10", "35", "60"}));
}

// The user.

TEST_F(HeadlessDesktopTest, Only_a_control_that_is_shown_and_enabled_can_be_clicked) {
  int clicks = 0;
  form.label.Click = [&] { ++clicks; };

  form.page.Visible = false;
  EXPECT_FALSE(desktop.Click(form.label));
  form.page.Visible = true;
  form.page.Enabled = false;
  EXPECT_FALSE(desktop.Click(form.label));
  form.page.Enabled = true;
  form.label.Enabled = false;
  EXPECT_FALSE(desktop.Click(form.label));
  form.label.Enabled = true;
  EXPECT_TRUE(desktop.Click(form.label));

  EXPECT_EQ(clicks, 1);
}

TEST_F(HeadlessDesktopTest, The_mouse_reaches_a_control_with_button_keys_and_place) {
  std::vector<int> got;
  form.picture.MouseMove = [&](int button, int shift, int x, int y) { got = {button, shift, x, y}; };

  EXPECT_TRUE(desktop.MouseMove(form.picture, kLeftButton, kCtrl, 30, 45));

  EXPECT_EQ(got, (std::vector<int>{1, 2, 30, 45}));
}

TEST_F(HeadlessDesktopTest, Keys_reach_a_form_that_previews_them) {
  EXPECT_FALSE(desktop.KeyDown(form, 'I', kCtrl));
  form.KeyPreview = true;
  EXPECT_TRUE(desktop.KeyDown(form, 'I', kCtrl));

  EXPECT_EQ(form.keys, std::vector<int>{'I' * 10 + 2});
}

TEST_F(HeadlessDesktopTest, Choosing_an_item_clicks_the_list_and_an_item_that_is_not_there_cannot_be_chosen) {
  int clicks = 0;
  form.combo.AddItem(u"only");
  form.combo.Click = [&] { ++clicks; };

  EXPECT_TRUE(desktop.ChooseItem(form.combo, 0));
  EXPECT_FALSE(desktop.ChooseItem(form.combo, 1));

  EXPECT_EQ(form.combo.ListIndex(), 0);
  EXPECT_EQ(clicks, 1);
}

TEST_F(HeadlessDesktopTest, Headers_and_rows_of_a_list_are_clicked_by_number_from_1) {
  std::vector<int> headers;
  form.list.AddColumn({u"name", 100});
  form.list.ColumnClick = [&](int header) { headers.push_back(header); };
  form.list.Add(u"p4", u"a", 1);
  ListRow& second = form.list.Add(u"p8", u"b", 1);

  EXPECT_TRUE(desktop.ClickHeader(form.list, 1));
  EXPECT_FALSE(desktop.ClickHeader(form.list, 2));
  EXPECT_TRUE(desktop.ClickRow(form.list, 2));
  EXPECT_FALSE(desktop.ClickRow(form.list, 3));

  EXPECT_EQ(headers, std::vector<int>{1});
  EXPECT_EQ(form.list.SelectedItem(), &second);
}

TEST_F(HeadlessDesktopTest, A_modal_form_stands_as_long_as_its_script_runs) {
  MainForm dialog;
  Form* shown = nullptr;
  desktop.OnModal = [&](Form& standing) { shown = &standing; };

  desktop.Show(dialog, Modality::Modal, &form);

  EXPECT_EQ(shown, &dialog);
  EXPECT_EQ(desktop.CountOf("Show frmMenu modal owner frmMenu"), 1);
}

TEST_F(HeadlessDesktopTest, A_box_stands_as_long_as_its_script_runs) {
  std::size_t boxes = 0;
  desktop.OnBox = [&] { boxes = desktop.Boxes.size(); };
  desktop.AnswerNextBox(7);

  EXPECT_EQ(desktop.MessageBox(u"text", 0, u"title"), 7);

  EXPECT_EQ(boxes, 1U);
}

// What is recorded.

TEST_F(HeadlessDesktopTest, Window_calls_are_recorded_with_names_and_numbers) {
  desktop.Calls.clear();

  desktop.SetCursor(desktop.LoadCursor(32649));
  desktop.ReleaseCapture();
  desktop.SendMessage(desktop.HandleOf(form), 0xA1, 2, 0);
  desktop.SetWindowRgn(desktop.HandleOf(form), desktop.CreateRoundRectRgn(0, 0, 400, 300, 10, 10), false);

  EXPECT_EQ(desktop.Calls,
            (Lines{"LoadCursor 32649", "SetCursor 5", "ReleaseCapture", "SendMessage frmMenu 0xA1 2 0",
                   "CreateRoundRectRgn 0 0 400 300 10 10", "SetWindowRgn frmMenu 1 0"}));
}

// Drawing.

TEST_F(HeadlessDesktopTest, Texts_and_boxes_are_measured_in_the_unit_of_the_ScaleMode) {
  EXPECT_EQ(desktop.TextWidth(form.buffer, u"four"), 32);
  EXPECT_EQ(desktop.TextHeight(form.buffer, u"four"), 16);
  EXPECT_EQ(desktop.ScaleWidth(form.buffer), 100);
  EXPECT_EQ(desktop.ScaleHeight(form.buffer), 50);
  EXPECT_EQ(desktop.TextWidth(form.picture, u"four"), 480);
  EXPECT_EQ(desktop.TextHeight(form.picture, u"four"), 240);
  EXPECT_EQ(desktop.ScaleWidth(form.picture), 1500);
}

TEST_F(HeadlessDesktopTest, Drawings_are_remembered_with_their_places_and_colours) {
  form.buffer.ForeColour = kWhite;
  desktop.FillBox(form.buffer, 0, -1, 100, 5, Rgb(1, 2, 255));
  form.buffer.CurrentX = 0;
  form.buffer.CurrentY = 20;
  desktop.Print(form.buffer, u"שלום");

  EXPECT_EQ(desktop.DrawingOf(form.buffer), (Lines{"Box 0,-1 100,5 0102FF", "Print 0,20 FFFFFF שלום"}));
  EXPECT_EQ(form.buffer.CurrentY, 36);
  desktop.Cls(form.buffer);
  EXPECT_TRUE(desktop.DrawingOf(form.buffer).empty());
}

TEST_F(HeadlessDesktopTest, A_copy_over_the_whole_box_takes_the_sources_drawings) {
  desktop.FillBox(form.picture, 0, 0, 1, 1, kBlack);
  desktop.FillBox(form.buffer, 0, 0, 100, 50, kRed);

  desktop.BitBlt(form.picture, 0, 0, 100, 50, form.buffer, 0, 0);
  EXPECT_EQ(desktop.DrawingOf(form.picture), desktop.DrawingOf(form.buffer));
  desktop.BitBlt(form.picture, 5, 5, 10, 10, form.buffer, 1, 2);

  EXPECT_EQ(desktop.DrawingOf(form.picture),
            (Lines{"Box 0,0 100,50 FF0000", "BitBlt 5,5 10x10 from picBuffer 1,2", "Box 0,0 100,50 FF0000"}));
}

TEST_F(HeadlessDesktopTest, An_icon_of_no_bytes_draws_nothing) {
  EXPECT_FALSE(desktop.DrawIconEx(form.picture, 0, 0, {}, 32, 32));
  EXPECT_TRUE(desktop.DrawingOf(form.picture).empty());
  EXPECT_TRUE(desktop.DrawIconEx(form.picture, 0, 0, {1, 2}, 32, 32));
  EXPECT_EQ(desktop.DrawingOf(form.picture).size(), 1U);
}

TEST_F(HeadlessDesktopTest, Equal_contents_give_equal_pictures_and_others_do_not) {
  desktop.DrawIconEx(form.picture, 0, 0, {1, 2}, 32, 32);
  const Picture first = desktop.ImageOf(form.picture);
  desktop.Cls(form.picture);
  desktop.DrawIconEx(form.picture, 0, 0, {3, 4}, 32, 32);
  const Picture second = desktop.ImageOf(form.picture);
  desktop.Cls(form.picture);
  desktop.DrawIconEx(form.picture, 0, 0, {1, 2}, 32, 32);

  EXPECT_FALSE(first == second);
  EXPECT_NE(first.pixels()->argb, second.pixels()->argb);
  EXPECT_EQ(desktop.ImageOf(form.picture), first);
}

TEST_F(HeadlessDesktopTest, Drawings_go_with_the_view) {
  MainForm keepsTheProgram;
  desktop.Load(keepsTheProgram);
  desktop.FillBox(form.picture, 0, 0, 1, 1, kBlack);

  desktop.Unload(form);

  EXPECT_TRUE(desktop.DrawingOf(form.picture).empty());
}

TEST_F(HeadlessDesktopTest, A_form_is_rendered_as_text_without_what_is_hidden) {
  form.Caption = u"title";
  form.label.Caption = u"העלאה:";
  form.label.ForeColour = kRed;
  form.buffer.Visible = false;
  form.picture.Contents = Picture::Artwork("background");
  form.combo.AddItem(u"one");
  form.combo.AddItem(u"two");
  form.combo.SelectItem(1);
  form.combo.Enabled = false;
  form.list.AddColumn({u"name", 100});
  ColumnHeader upload;
  upload.icon = 1;
  upload.description = u"upload";
  form.list.AddColumn(upload);
  form.list.Add(u"p4", u"a", 1).AddCell(u"003.50", 0);
  form.list.Add(u"p8", u"b", 1).AddCell(u"", 0);

  EXPECT_EQ(desktop.Render(form), "Form frmMenu \"title\"\n"
                                  "  Frame frameMain \"\"\n"
                                  "    Label lblCaption \"העלאה:\" colour=255\n"
                                  "    ComboBox main_cmbAdapters [one, *two] disabled\n"
                                  "    ListView main_ListView1\n"
                                  "      # name | {upload}\n"
                                  "      > a | 003.50\n"
                                  "      - b | \n"
                                  "  PictureBox picOut picture=background\n");
}

// Fields.

TEST_F(HeadlessDesktopTest, A_repaint_and_a_new_place_are_recorded) {
  desktop.Show(form);
  desktop.Calls.clear();

  desktop.Repaint(form.label);
  desktop.SetWindowPos(desktop.HandleOf(form), InsertAfter::NotTopmost, 0, 0, 0, 0, kKeepsSize | kKeepsPlace);

  EXPECT_EQ(desktop.Calls, (Lines{"Repaint " + ToUtf8(form.label.Name()),
                                  "SetWindowPos " + ToUtf8(form.Name()) + " -2 0 0 0 0 3"}));
}

TEST_F(HeadlessDesktopTest, Typing_puts_the_focus_there_and_passes_the_handler) {
  TextBox box(form, u"box");
  desktop.Show(form);
  box.KeyPress = [](int& keyCode) { keyCode = keyCode == '!' ? 0 : keyCode; };

  EXPECT_TRUE(desktop.Type(box, u"a!bc\b"));

  EXPECT_EQ(box.Value(), u"ab");
  EXPECT_EQ(desktop.Focused(form), &box);
  EXPECT_FALSE(desktop.Type(form.label, u"a"));
  box.Enabled = false;
  EXPECT_FALSE(desktop.Type(box, u"a"));
}

TEST_F(HeadlessDesktopTest, A_backspace_takes_a_whole_line_break) {
  TextBox box(form, u"box");
  box.MultiLine = true;
  desktop.Show(form);

  desktop.Type(box, u"a\rb");
  EXPECT_EQ(box.Value(), u"a\r\nb");
  desktop.Type(box, u"\b\b");

  EXPECT_EQ(box.Value(), u"a");
}

TEST_F(HeadlessDesktopTest, Fields_buttons_and_cell_icons_are_rendered) {
  TextBox box(form, u"box");
  CommandButton button(form, u"button");
  ListView list(form, u"list");
  box.Value = u"text";
  box.ReadOnly = true;
  button.Caption = u"go";
  list.Add(u"key", u"row", 0).AddCell({}, Text(), 2);
  desktop.Show(form);

  const std::string shown = desktop.Render(form);

  EXPECT_NE(shown.find("TextBox box \"text\" read-only\n"), std::string::npos) << shown;
  EXPECT_NE(shown.find("CommandButton button \"go\"\n"), std::string::npos) << shown;
  EXPECT_NE(shown.find("row | {2}\n"), std::string::npos) << shown;
}

} // namespace
} // namespace quendra::forms::headless
