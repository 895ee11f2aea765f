#include "forms/view/VisibleText.h"

#include <algorithm>

namespace quendra::forms {

namespace {

constexpr char16_t kReplacement = u'\uFFFD';
constexpr char16_t kEllipsis = u'\u2026';
constexpr char16_t kIsolate = u'\u2066';
constexpr char16_t kEndOfIsolate = u'\u2069';

bool IsHighSurrogate(char16_t unit) { return unit >= 0xD800 && unit <= 0xDBFF; }
bool IsLowSurrogate(char16_t unit) { return unit >= 0xDC00 && unit <= 0xDFFF; }

bool IsHebrew(char16_t unit) { return unit >= 0x0590 && unit <= 0x05FF; }

/// Of an alphabet, as far as reading goes: signs and digits take the direction of their surroundings.
bool IsLetter(char16_t unit) {
  const bool isSign = unit == u'\u00D7' || unit == u'\u00F7' || (unit >= 0x2000 && unit <= 0x2BFF);
  return (unit >= u'A' && unit <= u'Z') || (unit >= u'a' && unit <= u'z') || (unit >= 0xC0 && !isSign);
}

bool ChangesDirectionOrHides(char16_t unit) {
  return unit == u'\u00AD' || unit == u'\u061C' || unit == u'\uFEFF' ||
         (unit >= u'\u200B' && unit <= u'\u200F') || (unit >= u'\u2028' && unit <= u'\u202E') ||
         (unit >= u'\u2060' && unit <= u'\u206F');
}

char16_t VisibleUnit(char16_t unit) {
  if (unit < 0x20) return static_cast<char16_t>(0x2400 + unit);
  if (unit == 0x7F) return u'\u2421';
  if (unit >= 0x80 && unit < 0xA0) return kReplacement;
  if (IsHighSurrogate(unit) || IsLowSurrogate(unit)) return kReplacement; // half of a pair
  return ChangesDirectionOrHides(unit) ? kReplacement : unit;
}

bool IsLineBreak(char16_t unit) { return unit == u'\r' || unit == u'\n'; }

/// Carriage return and line feed are one line break, and so is either alone.
bool EndsPair(TextView text, std::size_t at) { return text[at] == u'\n' && at > 0 && text[at - 1] == u'\r'; }

} // namespace

Text VisibleText(TextView text, LineBreaks lineBreaks, std::size_t limit) {
  const bool cut = text.size() > limit;
  if (cut) text = text.substr(0, limit);
  const bool keepsLines = lineBreaks == LineBreaks::Keep;
  Text visible;
  visible.reserve(text.size() + 1);
  for (std::size_t i = 0; i < text.size(); ++i) {
    const char16_t unit = text[i];
    if (IsHighSurrogate(unit) && i + 1 < text.size() && IsLowSurrogate(text[i + 1]))
      visible.append({unit, text[++i]});
    else if (keepsLines && IsLineBreak(unit))
      visible.append(EndsPair(text, i) ? 0 : 1, u'\n');
    else
      visible.push_back(VisibleUnit(unit));
  }
  if (cut) visible.push_back(kEllipsis);
  return visible;
}

Direction DirectionOf(TextView text) {
  const auto first = std::find_if(text.begin(), text.end(), IsLetter);
  return first != text.end() && IsHebrew(*first) ? Direction::RightToLeft : Direction::LeftToRight;
}

Text Isolated(TextView text) {
  if (text.empty() || DirectionOf(text) == Direction::RightToLeft) return Text(text);
  Text isolated(1, kIsolate);
  return isolated.append(text).append(1, kEndOfIsolate);
}

} // namespace quendra::forms
