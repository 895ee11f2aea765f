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
    else if (keepsLines && unit == u'\n')
      visible.push_back(unit);
    else if (!keepsLines || unit != u'\r')
      visible.push_back(VisibleUnit(unit));
  }
  if (cut) visible.push_back(kEllipsis);
  return visible;
}

Direction DirectionOf(TextView text) {
  const auto isHebrew = [](char16_t unit) { return unit >= 0x0590 && unit <= 0x05FF; };
  return std::any_of(text.begin(), text.end(), isHebrew) ? Direction::RightToLeft : Direction::LeftToRight;
}

Text Isolated(TextView text) {
  if (text.empty() || DirectionOf(text) == Direction::RightToLeft) return Text(text);
  Text isolated(1, kIsolate);
  return isolated.append(text).append(1, kEndOfIsolate);
}

} // namespace quendra::forms
