#include "foundation/InputNormaliser.h"

#include "platform/system/KeyboardLayout.h"

#include <array>
#include <limits>
#include <string_view>

namespace quendra::foundation {

namespace {

using namespace std::literals;

constexpr char16_t kBackspace = 8;
constexpr std::string_view kHebrewLayout = "0000040D";

struct KeyPair {
  char16_t hebrew;
  char16_t latin;
};

/// The Israeli key map. Three letters have no row, as their keys bear no Latin letter.
constexpr std::array kHebrewKeyToLatin{
    KeyPair{u'א', u't'}, KeyPair{u'ב', u'c'}, KeyPair{u'ג', u'd'}, KeyPair{u'ד', u's'}, KeyPair{u'ה', u'v'},
    KeyPair{u'ו', u'u'}, KeyPair{u'ז', u'z'}, KeyPair{u'ח', u'j'}, KeyPair{u'ט', u'y'}, KeyPair{u'י', u'h'},
    KeyPair{u'כ', u'f'}, KeyPair{u'ך', u'l'}, KeyPair{u'ל', u'k'}, KeyPair{u'מ', u'n'}, KeyPair{u'ם', u'o'},
    KeyPair{u'ן', u'i'}, KeyPair{u'נ', u'b'}, KeyPair{u'ס', u'x'}, KeyPair{u'ע', u'g'}, KeyPair{u'פ', u'p'},
    KeyPair{u'צ', u'm'}, KeyPair{u'ק', u'e'}, KeyPair{u'ר', u'r'}, KeyPair{u'ש', u'a'}};

constexpr bool IsBetween(char16_t first, char16_t character, char16_t last) {
  return first <= character && character <= last;
}
constexpr bool IsOneOf(std::u16string_view marks, char16_t character) {
  return marks.find(character) != std::u16string_view::npos;
}

std::int16_t HebrewKeyToLatin(char16_t letter) {
  for (const KeyPair& pair : kHebrewKeyToLatin)
    if (pair.hebrew == letter) return static_cast<std::int16_t>(pair.latin);
  return 0;
}

} // namespace

void InputNormaliser::NormaliseKey(std::int16_t& keyCode, std::int16_t& specialFlag, std::int16_t& result) {
  const auto c = static_cast<char16_t>(keyCode);
  result = 0;
  if (IsBetween(u'a', c, u'z') || IsOneOf(u"_-.#@"sv, c) || IsBetween(u'0', c, u'9')) {
    result = keyCode;
  } else if (IsBetween(u'A', c, u'Z')) {
    result = static_cast<std::int16_t>(keyCode + 32);
  } else if (IsBetween(u'א', c, u'ת')) {
    result = HebrewKeyToLatin(c);
  } else if (c == u'/') {
    result = OfHebrewLayout(u'q');
  } else if (c == u'\'') {
    result = OfHebrewLayout(u'w');
  } else if (IsOneOf(u"!$%^&*()"sv, c)) {
    if (specialFlag == 0) keyCode = 0;
  } else if (c == kBackspace) {
    result = keyCode;
  }
}

void InputNormaliser::MendKeyPress(int& keyCode, std::int16_t specialFlag) {
  std::int16_t result = 0;
  if (keyCode >= 0 && keyCode <= std::numeric_limits<std::int16_t>::max()) {
    auto pressed = static_cast<std::int16_t>(keyCode);
    NormaliseKey(pressed, specialFlag, result);
  }
  keyCode = result;
}

/// The marks that stand on the Q and W keys of the Hebrew layout; on any other they are marks.
std::int16_t InputNormaliser::OfHebrewLayout(char16_t onHebrewLayout) {
  const bool isHebrew = layout_.GetKeyboardLayoutNameA() == kHebrewLayout;
  return isHebrew ? static_cast<std::int16_t>(onHebrewLayout) : std::int16_t{0};
}

} // namespace quendra::foundation
