#include "foundation/InputNormaliser.h"

#include "platform/simulated/SimulatedMachine.h"

#include <gtest/gtest.h>

#include <array>
#include <string_view>

namespace quendra::foundation {

namespace {

struct Pair {
  char16_t hebrew;
  char latin;
};

/// The whole key map, written down a second time.
constexpr std::array kKeyMap{
    Pair{u'א', 't'}, Pair{u'ב', 'c'}, Pair{u'ג', 'd'}, Pair{u'ד', 's'}, Pair{u'ה', 'v'}, Pair{u'ו', 'u'},
    Pair{u'ז', 'z'}, Pair{u'ח', 'j'}, Pair{u'ט', 'y'}, Pair{u'י', 'h'}, Pair{u'ך', 'l'}, Pair{u'כ', 'f'},
    Pair{u'ל', 'k'}, Pair{u'ם', 'o'}, Pair{u'מ', 'n'}, Pair{u'ן', 'i'}, Pair{u'נ', 'b'}, Pair{u'ס', 'x'},
    Pair{u'ע', 'g'}, Pair{u'פ', 'p'}, Pair{u'צ', 'm'}, Pair{u'ק', 'e'}, Pair{u'ר', 'r'}, Pair{u'ש', 'a'}};

class InputNormaliserTest : public testing::Test {
 protected:
  std::int16_t Press(char16_t character, std::int16_t flag = 0) {
    keyCode = static_cast<std::int16_t>(character);
    specialFlag = flag;
    std::int16_t result = 99;
    normaliser.NormaliseKey(keyCode, specialFlag, result);
    return result;
  }
  void TypeHebrew() { machine.keyboardLayout.Name = "0000040D"; }
  void TypeEnglish() { machine.keyboardLayout.Name = "00000409"; }

  platform::simulated::SimulatedMachine machine;
  InputNormaliser normaliser{machine.keyboardLayout};
  std::int16_t keyCode = 0;
  std::int16_t specialFlag = 0;
};

TEST_F(InputNormaliserTest, Each_Hebrew_letter_of_the_key_map_gives_the_Latin_letter_of_its_key) {
  ASSERT_EQ(kKeyMap.size(), 24u);
  for (const Pair& pair : kKeyMap) EXPECT_EQ(Press(pair.hebrew), pair.latin) << pair.latin;
}

TEST_F(InputNormaliserTest, Final_nun_in_a_user_name_arrives_as_i) { EXPECT_EQ(Press(u'ן'), 'i'); }

TEST_F(InputNormaliserTest, The_Hebrew_letters_without_a_row_are_refused) {
  for (const char16_t letter : {u'ף', u'ץ', u'ת'}) EXPECT_EQ(Press(letter), 0);
}

TEST_F(InputNormaliserTest, Hebrew_characters_outside_the_alphabet_are_refused) {
  for (const char16_t character : {char16_t(u'א' - 1), char16_t(u'ת' + 1), u'ְ', u'״', u'₪'})
    EXPECT_EQ(Press(character), 0);
}

TEST_F(InputNormaliserTest, Small_letters_digits_and_the_marks_of_addresses_stay) {
  for (const char16_t character : std::u16string_view(u"abcdefghijklmnopqrstuvwxyz0123456789_-.#@"))
    EXPECT_EQ(Press(character), character);
}

TEST_F(InputNormaliserTest, Capitals_become_small) {
  for (char16_t capital = u'A'; capital <= u'Z'; ++capital) EXPECT_EQ(Press(capital), capital + 32);
}

TEST_F(InputNormaliserTest, On_the_Hebrew_layout_the_slash_is_q_and_the_apostrophe_w) {
  TypeHebrew();
  EXPECT_EQ(Press(u'/'), 'q');
  EXPECT_EQ(Press(u'\''), 'w');
}

TEST_F(InputNormaliserTest, On_any_other_layout_slash_and_apostrophe_are_refused) {
  TypeEnglish();
  EXPECT_EQ(Press(u'/'), 0);
  EXPECT_EQ(Press(u'\''), 0);
  machine.keyboardLayout.Name.reset();
  EXPECT_EQ(Press(u'/'), 0);
}

TEST_F(InputNormaliserTest, The_layout_in_use_is_asked_at_each_key) {
  EXPECT_EQ(Press(u'/'), 0);
  TypeHebrew();
  EXPECT_EQ(Press(u'/'), 'q');
  TypeEnglish();
  EXPECT_EQ(Press(u'/'), 0);
}

TEST_F(InputNormaliserTest, Marks_are_refused_whatever_the_flag_and_with_flag_0_their_key_code_is_cleared) {
  for (const char16_t mark : std::u16string_view(u"!$%^&*()")) {
    EXPECT_EQ(Press(mark, 0), 0);
    EXPECT_EQ(keyCode, 0);
    EXPECT_EQ(Press(mark, -1), 0);
    EXPECT_EQ(keyCode, mark);
    EXPECT_EQ(specialFlag, -1);
  }
}

TEST_F(InputNormaliserTest, The_backspace_passes) { EXPECT_EQ(Press(8), 8); }

TEST_F(InputNormaliserTest, The_blank_and_all_other_characters_are_refused_on_either_layout) {
  const std::u16string_view passing =
      u"abcdefghijklmnopqrstuvwxyzABCDEFGHIJKLMNOPQRSTUVWXYZ0123456789_-.#@/'\b";
  for (const bool isHebrew : {false, true}) {
    isHebrew ? TypeHebrew() : TypeEnglish();
    for (char32_t character = 0; character <= 0xFFFF; ++character) {
      const auto c = static_cast<char16_t>(character);
      if (passing.find(c) != std::u16string_view::npos || (u'א' <= c && c <= u'ת')) continue;
      ASSERT_EQ(Press(c), 0) << static_cast<std::uint32_t>(character);
    }
  }
}

TEST_F(InputNormaliserTest, Only_refused_marks_lose_their_key_code) {
  for (const char16_t character : {u'A', u'ן', u'ת', u' ', u'/', u'+'}) {
    Press(character);
    EXPECT_EQ(keyCode, character);
  }
}

TEST_F(InputNormaliserTest, The_key_press_of_a_field_becomes_what_is_typed_or_nothing) {
  TypeEnglish();
  const auto typed = [this](int keyCode) {
    normaliser.MendKeyPress(keyCode, 0);
    return keyCode;
  };

  EXPECT_EQ(typed(u'ן'), u'i');
  EXPECT_EQ(typed(u'A'), u'a');
  EXPECT_EQ(typed(u'!'), 0);
}

TEST_F(InputNormaliserTest, The_key_press_of_a_character_beyond_16_bits_with_a_sign_is_refused) {
  // The lower halves of some are characters that pass.
  for (const int character : {0x8000, 0xFB2A, 0x10061, 0x1F600, 0x10FFFF, -1, -65439}) {
    int keyCode = character;
    normaliser.MendKeyPress(keyCode, 0);
    EXPECT_EQ(keyCode, 0) << character;
  }
}

} // namespace

} // namespace quendra::foundation
