#include "provisioning/FirstConnectionPageFixture.h"

namespace quendra::provisioning {
namespace {

class KeyMendingTest : public FirstConnectionPageTest {
 protected:
  KeyMendingTest() {
    OpenConnectionStep();
    mail.frsCon_Frame2.Visible = true;
  }

  struct Field {
    forms::TextBox& box;
    std::size_t mark;
  };
  std::vector<Field> fields{
      {connection.frsCon_txtUsername, 0}, {connection.frsCon_txtPassword, 1}, {mail.frsCon_txtEmailUN, 2}};

  Text Typed(const Field& field, TextView keys) {
    field.box.Value = Text();
    EXPECT_TRUE(desktop.Type(field.box, keys));
    return field.box.Value;
  }
  bool IsMarked(const Field& field) const { return page.frsCon_lblError[field.mark].Visible(); }
};

TEST_F(KeyMendingTest, What_is_typed_with_the_Hebrew_layout_arrives_as_the_Latin_keys) {
  for (const Field& field : fields) {
    EXPECT_EQ(Typed(field, u"ןדנה"), u"isbv");
    EXPECT_FALSE(IsMarked(field));
  }
}

TEST_F(KeyMendingTest, Capitals_arrive_as_small_letters) {
  for (const Field& field : fields) EXPECT_EQ(Typed(field, u"DaNa_1.2-3#4@Z"), u"dana_1.2-3#4@z");
}

TEST_F(KeyMendingTest, A_key_that_is_refused_shows_the_mark_of_its_field_alone) {
  for (const Field& field : fields) {
    for (forms::Label& mark : page.frsCon_lblError) mark.Visible = false;

    EXPECT_EQ(Typed(field, u"ת"), u"");

    std::vector<bool> expected(3, false);
    expected[field.mark] = true;
    EXPECT_EQ(Marks(), expected);
    EXPECT_EQ(page.frsCon_lblError[field.mark].Caption(), u"הוקש מקש שגוי");
    EXPECT_EQ(page.frsCon_lblError[field.mark].ForeColour(), forms::kRed);
  }
}

TEST_F(KeyMendingTest, The_next_key_that_passes_hides_the_mark) {
  for (const Field& field : fields) {
    EXPECT_EQ(Typed(field, u"!a"), u"a");
    EXPECT_FALSE(IsMarked(field));
  }
}

TEST_F(KeyMendingTest, Marks_of_special_keys_are_refused_in_the_password_too) {
  for (const Field& field : fields)
    for (const char16_t key : {u'!', u'$', u'%', u'^', u'&', u'*', u'(', u')'}) {
      EXPECT_EQ(Typed(field, Text(1, key)), u"");
      EXPECT_TRUE(IsMarked(field));
    }
}

TEST_F(KeyMendingTest, The_slash_is_the_q_of_the_Hebrew_layout_and_refused_on_any_other) {
  machine.keyboardLayout.Name = "0000040D";
  for (const Field& field : fields) EXPECT_EQ(Typed(field, u"/'"), u"qw");

  machine.keyboardLayout.Name = "00000409";
  for (const Field& field : fields) {
    EXPECT_EQ(Typed(field, u"/"), u"");
    EXPECT_TRUE(IsMarked(field));
  }
}

TEST_F(KeyMendingTest, The_backspace_passes_and_hides_the_mark) {
  for (const Field& field : fields) {
    EXPECT_EQ(Typed(field, u"ab !\b"), u"a");
    EXPECT_FALSE(IsMarked(field));
  }
}

TEST_F(KeyMendingTest, Blanks_line_breaks_and_what_lies_outside_of_16_bits_are_refused) {
  for (const Field& field : fields) {
    EXPECT_EQ(Typed(field, u" \r"), u"");
    EXPECT_TRUE(IsMarked(field));
    int beyond = 0x10061;
    field.box.KeyPress(beyond);
    EXPECT_EQ(beyond, 0);
  }
}

TEST_F(KeyMendingTest, The_full_name_takes_any_text) {
  desktop.Type(mail.frsCon_txtFullName, u"דנה לוי (Dana)!");

  EXPECT_EQ(mail.frsCon_txtFullName.Value(), u"דנה לוי (Dana)!");
  EXPECT_EQ(Marks(), (std::vector<bool>{false, false, false}));
}

} // namespace
} // namespace quendra::provisioning
