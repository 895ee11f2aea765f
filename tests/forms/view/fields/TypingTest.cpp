#include "forms/view/fields/Typing.h"

#include "forms/controls/Controls.h"
#include "forms/view/BareForm.h"
#include "forms/view/fields/FieldLook.h"
#include "forms/view/fields/FieldText.h"

#include <gtest/gtest.h>

namespace quendra::forms {

std::ostream& operator<<(std::ostream& stream, const Typing& typing) {
  return stream << static_cast<int>(typing.act) << " " << ToUtf8(typing.text);
}

namespace {

using Act = Typing::Act;

struct TypingTest : testing::Test {
  Typing TypeWith(int character, int becomes) {
    box.KeyPress = [=](int& keyCode) { keyCode = becomes; };
    return Type(box, character, false);
  }
  BareForm form;
  TextBox box{form, u"box"};
  Label label{form, u"label"};
};

TEST_F(TypingTest, A_character_is_inserted_as_it_is_or_as_the_handler_makes_it) {
  EXPECT_EQ(Type(box, 0x05D0, false), (Typing{Act::Insert, u"\u05D0"}));
  EXPECT_EQ(TypeWith(0x05D0, 't'), (Typing{Act::Insert, u"t"}));
  EXPECT_EQ(TypeWith('A', 0), Typing{});
  EXPECT_EQ(TypeWith('A', 8), Typing{Act::DeleteBack});
}

TEST_F(TypingTest, The_handler_gets_the_number_of_a_character_outside_the_first_plane) {
  int got = 0;
  box.KeyPress = [&](int& keyCode) { got = keyCode; };

  EXPECT_EQ(Type(box, 0x1F600, false), (Typing{Act::Insert, u"\U0001F600"}));
  EXPECT_EQ(got, 0x1F600);
}

TEST_F(TypingTest, Control_characters_get_into_no_text) {
  EXPECT_EQ(Type(box, 3, false), Typing{Act::Command});
  EXPECT_EQ(Type(box, 0x7F, false), Typing{Act::Command});
  EXPECT_EQ(Type(box, kEnterKey, false), Typing{Act::Command});
  EXPECT_EQ(TypeWith('A', 7), Typing{});
  EXPECT_EQ(TypeWith(3, 0), Typing{});
  EXPECT_EQ(Type(box, 8, false), Typing{}); // by the handler of the line before
}

TEST_F(TypingTest, Numbers_that_are_no_character_type_nothing) {
  for (const int number : {-1, 0xD800, 0xDFFF, 0x110000})
    EXPECT_EQ(TypeWith('A', number), Typing{}) << number;
}

TEST_F(TypingTest, Enter_begins_a_line_where_there_are_many) {
  EXPECT_EQ(Type(box, kEnterKey, true), (Typing{Act::Insert, u"\r\n"}));
}

TEST_F(TypingTest, Tab_and_what_the_form_takes_are_not_typed) {
  EXPECT_FALSE(IsTyped(form, {kTabKey}));
  EXPECT_FALSE(IsTyped(form, {'A', kAlt}));
  EXPECT_TRUE(IsTyped(form, {kEnterKey}));
  form.Visible = true;
  form.Default = &label;
  EXPECT_FALSE(IsTyped(form, {kEnterKey}));
  EXPECT_TRUE(IsTyped(form, {kEscapeKey}));
}

TEST_F(TypingTest, Only_controls_that_are_typed_into_have_a_field) {
  ComboBox combo(form, u"combo");
  EXPECT_EQ(FieldOf(combo), nullptr);
  combo.FreeText = true;

  EXPECT_EQ(FieldOf(combo), &combo);
  EXPECT_EQ(FieldOf(box), &box);
  EXPECT_EQ(FieldOf(label), nullptr);
}

TEST(FieldTextTest, A_field_of_many_lines_keeps_tabs_and_shows_a_break_as_one_character) {
  const Text value = u"Hop #\t1\r\nend\u202E";
  const FieldText text(value, true);

  EXPECT_EQ(text.Shown(), u"Hop #\t1\nend\uFFFD");
  EXPECT_EQ(text.ShownPlace(9), 8);
  EXPECT_EQ(text.ValuePlace(8), 9);
  EXPECT_EQ(text.ValuePlace(7), 7);
  EXPECT_EQ(text.ValuePlace(99), static_cast<int>(value.size()));
}

TEST(FieldTextTest, A_field_of_one_line_shows_breaks_and_tabs_as_signs) {
  const FieldText text(u"a\r\n\tb", false);

  EXPECT_EQ(text.Shown(), u"a\u240D\u240A\u2409b");
  EXPECT_EQ(text.ShownPlace(3), 3);
}

TEST(FieldTextTest, What_the_user_edits_has_breaks_of_two_characters) {
  EXPECT_EQ(FieldText::ValueOf(u"a\n\tb", true), u"a\r\n\tb");
  EXPECT_EQ(FieldText::ValueOf(u"a\nb", false), u"a\u240Ab");
}

TEST(FieldLookTest, The_ring_is_for_those_who_use_the_keys) {
  EXPECT_TRUE(RingsOf({true, false, true, false}).empty());
  EXPECT_FALSE(RingsOf({true, false, true, true}).empty());
}

TEST(FieldLookTest, A_field_that_cannot_be_changed_is_quiet) {
  EXPECT_EQ(FaceOf({true, true}).fill, FaceOf({false, false}).fill);
  EXPECT_NE(FaceOf({true, false}).fill, FaceOf({true, true}).fill);
  EXPECT_NE(FaceOf({true, false, true}).border, FaceOf({true, false, false}).border);
}

} // namespace
TEST(WordStart, Is_that_of_the_word_before_with_the_blanks_behind_it) {
  const Text text = u"www.one.test  שלום_1, abc";

  EXPECT_EQ(WordStart(text, 25), 22);
  EXPECT_EQ(WordStart(text, 22), 20);
  EXPECT_EQ(WordStart(text, 20), 14);
  EXPECT_EQ(WordStart(text, 16), 14);
  EXPECT_EQ(WordStart(text, 14), 8);
  EXPECT_EQ(WordStart(text, 8), 7);
  EXPECT_EQ(WordStart(text, 3), 0);
  EXPECT_EQ(WordStart(text, 0), 0);
}

TEST(WordStart, Goes_over_one_line_break_however_it_is_written) {
  const Text text = u"a\r\n\nb\r\n  ";

  EXPECT_EQ(WordStart(text, 9), 7);
  EXPECT_EQ(WordStart(text, 7), 5);
  EXPECT_EQ(WordStart(text, 4), 3);
  EXPECT_EQ(WordStart(text, 3), 1);
}

TEST(WordStart, Of_a_place_outside_the_text_is_that_of_its_nearest_end) {
  EXPECT_EQ(WordStart(u"ab", 9), 0);
  EXPECT_EQ(WordStart(u"ab", -1), 0);
  EXPECT_EQ(WordStart(u"", 0), 0);
}

} // namespace quendra::forms
