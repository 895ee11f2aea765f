#include "runtime/Text.h"

#include <algorithm>
#include <array>
#include <cstdio>

namespace quendra {

namespace {

constexpr char32_t kReplacement = 0xFFFD;

void AppendCodePoint(Text& text, char32_t codePoint) {
  if (codePoint < 0x10000) {
    text.push_back(static_cast<char16_t>(codePoint));
    return;
  }
  codePoint -= 0x10000;
  text.push_back(static_cast<char16_t>(0xD800 + (codePoint >> 10)));
  text.push_back(static_cast<char16_t>(0xDC00 + (codePoint & 0x3FF)));
}

struct Decoded {
  char32_t codePoint;
  std::size_t length;
};

int ContinuationBytes(unsigned char lead) {
  if (lead >= 0xC2 && lead <= 0xDF) return 1;
  if (lead >= 0xE0 && lead <= 0xEF) return 2;
  if (lead >= 0xF0 && lead <= 0xF4) return 3;
  return -1;
}

bool IsScalarOfLength(char32_t codePoint, int continuation) {
  if (codePoint >= 0xD800 && codePoint <= 0xDFFF) return false;
  if (continuation == 2) return codePoint >= 0x800;
  if (continuation == 3) return codePoint >= 0x10000 && codePoint <= 0x10FFFF;
  return true;
}

Decoded DecodeUtf8(std::string_view bytes) {
  const auto lead = static_cast<unsigned char>(bytes.front());
  if (lead < 0x80) return {lead, 1};
  const int continuation = ContinuationBytes(lead);
  if (continuation < 0 || bytes.size() <= static_cast<std::size_t>(continuation)) return {kReplacement, 1};
  char32_t codePoint = lead & (0x3F >> continuation);
  for (int i = 1; i <= continuation; ++i) {
    const auto next = static_cast<unsigned char>(bytes[static_cast<std::size_t>(i)]);
    if ((next & 0xC0) != 0x80) return {kReplacement, 1};
    codePoint = (codePoint << 6) | (next & 0x3F);
  }
  if (!IsScalarOfLength(codePoint, continuation)) return {kReplacement, 1};
  return {codePoint, static_cast<std::size_t>(continuation) + 1};
}

void AppendUtf8(std::string& bytes, char32_t codePoint) {
  const auto push = [&](char32_t value) { bytes.push_back(static_cast<char>(value)); };
  if (codePoint < 0x80) {
    push(codePoint);
  } else if (codePoint < 0x800) {
    push(0xC0 | (codePoint >> 6));
    push(0x80 | (codePoint & 0x3F));
  } else if (codePoint < 0x10000) {
    push(0xE0 | (codePoint >> 12));
    push(0x80 | ((codePoint >> 6) & 0x3F));
    push(0x80 | (codePoint & 0x3F));
  } else {
    push(0xF0 | (codePoint >> 18));
    push(0x80 | ((codePoint >> 12) & 0x3F));
    push(0x80 | ((codePoint >> 6) & 0x3F));
    push(0x80 | (codePoint & 0x3F));
  }
}

bool IsHighSurrogate(char16_t unit) { return unit >= 0xD800 && unit <= 0xDBFF; }
bool IsLowSurrogate(char16_t unit) { return unit >= 0xDC00 && unit <= 0xDFFF; }

char16_t LoweredUnit(char16_t unit) {
  return unit >= u'A' && unit <= u'Z' ? static_cast<char16_t>(unit + 32) : unit;
}

} // namespace

Text FromUtf8(std::string_view bytes) {
  Text text;
  text.reserve(bytes.size());
  while (!bytes.empty()) {
    const Decoded decoded = DecodeUtf8(bytes);
    AppendCodePoint(text, decoded.codePoint);
    bytes.remove_prefix(decoded.length);
  }
  return text;
}

std::string ToUtf8(TextView text) {
  std::string bytes;
  bytes.reserve(text.size());
  for (std::size_t i = 0; i < text.size(); ++i) {
    const char16_t unit = text[i];
    if (IsHighSurrogate(unit) && i + 1 < text.size() && IsLowSurrogate(text[i + 1])) {
      AppendUtf8(bytes, 0x10000 + ((char32_t{unit} - 0xD800) << 10) + (char32_t{text[i + 1]} - 0xDC00));
      ++i;
    } else {
      AppendUtf8(bytes, IsHighSurrogate(unit) || IsLowSurrogate(unit) ? kReplacement : char32_t{unit});
    }
  }
  return bytes;
}

Text DecimalText(std::int64_t value) {
  const std::string digits = std::to_string(value);
  return Text(digits.begin(), digits.end());
}

Text HexText(std::uint32_t value) {
  std::array<char, 9> digits{};
  const int length = std::snprintf(digits.data(), digits.size(), "%X", value);
  return Text(digits.begin(), digits.begin() + length);
}

TextView CutAtNul(TextView text) { return text.substr(0, text.find(u'\0')); }

std::string_view CutAtNul(std::string_view bytes) { return bytes.substr(0, bytes.find('\0')); }

TextView Trimmed(TextView text) {
  const auto first = text.find_first_not_of(u' ');
  if (first == TextView::npos) return {};
  return text.substr(first, text.find_last_not_of(u' ') - first + 1);
}

Text Replaced(TextView text, TextView what, TextView with) {
  if (what.empty()) return Text(text);
  Text result;
  for (auto at = text.find(what); at != TextView::npos; at = text.find(what)) {
    result.append(text.substr(0, at)).append(with);
    text.remove_prefix(at + what.size());
  }
  return result.append(text);
}

Text Lowered(TextView text) {
  Text lowered(text);
  std::transform(lowered.begin(), lowered.end(), lowered.begin(), LoweredUnit);
  return lowered;
}

bool SameIgnoringCase(TextView left, TextView right) {
  return std::equal(left.begin(), left.end(), right.begin(), right.end(),
                    [](char16_t a, char16_t b) { return LoweredUnit(a) == LoweredUnit(b); });
}

Text PaddedLeft(TextView text, std::size_t width, char16_t fill) {
  Text padded(width > text.size() ? width - text.size() : 0, fill);
  return padded.append(text);
}

} // namespace quendra
