#include "forms/view/fields/Typing.h"

#include "forms/controls/ComboBox.h"

#include <algorithm>

namespace quendra::forms {

namespace {

constexpr int kFirstOutsidePlane = 0x10000;
constexpr int kLastCharacter = 0x10FFFF;

bool IsControl(int character) { return character < 0x20 || (character >= 0x7F && character < 0xA0); }

bool IsCharacter(int number) { return number <= kLastCharacter && (number < 0xD800 || number > 0xDFFF); }

Text TextOfCharacter(int character) {
  if (character < kFirstOutsidePlane) return Text(1, static_cast<char16_t>(character));
  const int beyond = character - kFirstOutsidePlane;
  return {static_cast<char16_t>(0xD800 + (beyond >> 10)), static_cast<char16_t>(0xDC00 + (beyond & 0x3FF))};
}

enum class Kind { Blank, Break, Sign, Letter };

Kind KindOf(char16_t unit) {
  if (unit == u' ' || unit == u'\t' || unit == u'\u00A0') return Kind::Blank;
  if (unit == u'\r' || unit == u'\n') return Kind::Break;
  const bool isLetter = (unit >= u'0' && unit <= u'9') || (unit >= u'A' && unit <= u'Z') || unit == u'_' ||
                        (unit >= u'a' && unit <= u'z') || unit >= 0xC0;
  return isLetter ? Kind::Letter : Kind::Sign;
}

} // namespace

TextEntry* FieldOf(Control& control) {
  const auto* combo = dynamic_cast<const ComboBox*>(&control);
  return combo && !combo->FreeText ? nullptr : dynamic_cast<TextEntry*>(&control);
}

bool IsTyped(const Form& form, const KeyPress& key) {
  const bool usesAlt = (key.shift & kAlt) != 0;
  return key.code != kTabKey && !usesAlt && !ControlPressedBy(form, key.code, key.shift);
}

Typing Type(TextEntry& entry, int character, bool ofManyLines) {
  int typed = character;
  entry.KeyPress(typed);
  if (typed == kBackspaceKey) return {Typing::Act::DeleteBack};
  if (typed == kEnterKey && ofManyLines) return {Typing::Act::Insert, u"\r\n"};
  if (typed > 0 && !IsControl(typed) && IsCharacter(typed))
    return {Typing::Act::Insert, TextOfCharacter(typed)};
  return {typed != 0 && typed == character ? Typing::Act::Command : Typing::Act::Nothing};
}

int WordStart(TextView text, int place) {
  std::size_t start = std::min(static_cast<std::size_t>(std::max(place, 0)), text.size());
  const auto ends = [&](Kind kind) { return start > 0 && KindOf(text[start - 1]) == kind; };
  if (ends(Kind::Break)) {
    const bool isPair = start > 1 && text[start - 1] == u'\n' && text[start - 2] == u'\r';
    return static_cast<int>(start - (isPair ? 2 : 1));
  }
  while (ends(Kind::Blank)) --start;
  const Kind kind = start > 0 ? KindOf(text[start - 1]) : Kind::Break;
  while (kind != Kind::Break && ends(kind)) --start;
  return static_cast<int>(start);
}

} // namespace quendra::forms
