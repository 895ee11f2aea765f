#include "platform/linux/system/SystemNames.h"

namespace quendra::platform::linux_ {

namespace {

constexpr std::size_t kReadableLength = 255;

bool IsControl(char16_t unit) {
  return unit < 0x20 || (unit >= 0x7F && unit < 0xA0) || unit == 0x2028 || unit == 0x2029;
}

bool IsDirectionMark(char16_t unit) {
  return unit == 0x061C || unit == 0x200E || unit == 0x200F || (unit >= 0x202A && unit <= 0x202E) ||
         (unit >= 0x2066 && unit <= 0x2069);
}

} // namespace

std::string SystemName(std::string_view raw) {
  Text text = FromUtf8(raw);
  for (char16_t& unit : text)
    if (IsControl(unit) || IsDirectionMark(unit)) unit = u'?';
  return ToCodePage(text);
}

Text ReadableText(std::string_view utf8) {
  // Cut first: each unit comes of one byte at least, and the file may hold a name of any length.
  const Text text = FromUtf8(utf8.substr(0, 8 * kReadableLength));
  Text readable;
  for (const char16_t unit : text)
    if (!IsDirectionMark(unit)) readable.push_back(IsControl(unit) ? u' ' : unit);
  return Text(Trimmed(TextView(readable).substr(0, kReadableLength)));
}

} // namespace quendra::platform::linux_
