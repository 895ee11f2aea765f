#include "runtime/Text.h"

#include <iconv.h>

#include <array>
#include <bit>
#include <stdexcept>

namespace quendra {

namespace {

constexpr const char* kUtf16 = std::endian::native == std::endian::little ? "UTF-16LE" : "UTF-16BE";

/// Where the system puts the places that the page leaves unassigned, so that they survive the way there and
/// back: below 0xA0 the control characters of the same number, 0xCA a point, the others in the private area.
char16_t UnassignedUnit(unsigned char place) {
  if (place == 0xCA) return u'\u05BA';
  if (place >= 0xD9 && place <= 0xDF) return static_cast<char16_t>(0xF88D + (place - 0xD9));
  if (place == 0xFB || place == 0xFC) return static_cast<char16_t>(0xF894 + (place - 0xFB));
  return place == 0xFF ? u'\uF896' : static_cast<char16_t>(place);
}

/// The page as two tables, asked of iconv once: the page has 256 places, and a table look-up has no state to
/// share.
class CodePage {
 public:
  CodePage() {
    const iconv_t converter = iconv_open(kUtf16, "CP1255");
    if (converter == reinterpret_cast<iconv_t>(-1)) throw std::runtime_error("iconv has no code page 1255");
    byteOf_.fill(0);
    for (unsigned byte = 0; byte < 256; ++byte) Learn(converter, static_cast<char>(byte));
    iconv_close(converter);
  }

  char16_t UnitOf(char byte) const { return unitOf_[static_cast<unsigned char>(byte)]; }
  char ByteOf(char16_t unit) const {
    if (unit == 0) return '\0';
    const char byte = byteOf_[unit];
    return byte == 0 ? '?' : byte;
  }

 private:
  void Learn(iconv_t converter, char byte) {
    // Without composing: a letter and the point behind it stay two code units, as in the system's own
    // conversion.
    iconv(converter, nullptr, nullptr, nullptr, nullptr);
    char* in = &byte;
    std::size_t inLeft = 1;
    char16_t unit = 0;
    char* out = reinterpret_cast<char*>(&unit);
    std::size_t outLeft = sizeof unit;
    const bool known = iconv(converter, &in, &inLeft, &out, &outLeft) != static_cast<std::size_t>(-1);
    if (known) iconv(converter, nullptr, nullptr, &out, &outLeft);
    const auto index = static_cast<unsigned char>(byte);
    unitOf_[index] = known ? unit : UnassignedUnit(index);
    byteOf_[unitOf_[index]] = byte;
  }

  std::array<char16_t, 256> unitOf_{};
  std::array<char, 65536> byteOf_{};
};

const CodePage& Page() {
  static const CodePage page;
  return page;
}

} // namespace

std::string ToCodePage(TextView text) {
  std::string bytes;
  bytes.reserve(text.size());
  // A byte for each code unit, also for the halves of a pair: lengths in characters hold for the bytes too.
  for (const char16_t unit : text) bytes.push_back(Page().ByteOf(unit));
  return bytes;
}

Text FromCodePage(std::string_view bytes) {
  Text text;
  text.reserve(bytes.size());
  for (const char byte : bytes) text.push_back(Page().UnitOf(byte));
  return text;
}

} // namespace quendra
