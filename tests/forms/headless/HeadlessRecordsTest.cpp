#include "forms/headless/HeadlessDesktopFixture.h"

// What is written down, drawn and rendered.

namespace quendra::forms::headless {
namespace {

using Lines = std::vector<std::string>;

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

TEST_F(HeadlessDesktopTest, A_repaint_and_a_new_place_are_recorded) {
  desktop.Show(form);
  desktop.Calls.clear();

  desktop.Repaint(form.label);
  desktop.SetWindowPos(desktop.HandleOf(form), InsertAfter::NotTopmost, 0, 0, 0, 0, kKeepsSize | kKeepsPlace);

  EXPECT_EQ(desktop.Calls, (Lines{"Repaint " + ToUtf8(form.label.Name()),
                                  "SetWindowPos " + ToUtf8(form.Name()) + " -2 0 0 0 0 3"}));
}

TEST_F(HeadlessDesktopTest, A_masked_field_is_rendered_without_its_text) {
  TextBox box(form, u"box");
  box.Masked = true;
  box.Value = u"secret";
  desktop.Show(form);

  EXPECT_NE(desktop.Render(form).find("  TextBox box \"******\"\n"), std::string::npos);
}

TEST_F(HeadlessDesktopTest, A_list_box_is_rendered_with_its_items_and_the_chosen_one) {
  ListBox list(form, u"lstNICs");
  for (const char16_t* item : {u"one", u"two"}) list.AddItem(item);
  desktop.Show(form);
  EXPECT_TRUE(desktop.ChooseItem(list, 0));
  EXPECT_FALSE(desktop.ChooseItem(list, 2));

  EXPECT_NE(desktop.Render(form).find("  ListBox lstNICs [*one, two]\n"), std::string::npos);
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
