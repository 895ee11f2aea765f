#include "runtime/Text.h"

#include <array>

namespace quendra {

namespace {

/// The upper half of code page 1255. Its unassigned places stand where the system puts them, so that they
/// survive the way to text and back: below 0xA0 the control characters of the same number, 0xCA a point, the
/// others in the private area.
constexpr std::array<char16_t, 128> kUpperHalf{
    0x20AC, 0x0081, 0x201A, 0x0192, 0x201E, 0x2026, 0x2020, 0x2021, // 80
    0x02C6, 0x2030, 0x008A, 0x2039, 0x008C, 0x008D, 0x008E, 0x008F, // 88
    0x0090, 0x2018, 0x2019, 0x201C, 0x201D, 0x2022, 0x2013, 0x2014, // 90
    0x02DC, 0x2122, 0x009A, 0x203A, 0x009C, 0x009D, 0x009E, 0x009F, // 98
    0x00A0, 0x00A1, 0x00A2, 0x00A3, 0x20AA, 0x00A5, 0x00A6, 0x00A7, // A0
    0x00A8, 0x00A9, 0x00D7, 0x00AB, 0x00AC, 0x00AD, 0x00AE, 0x00AF, // A8
    0x00B0, 0x00B1, 0x00B2, 0x00B3, 0x00B4, 0x00B5, 0x00B6, 0x00B7, // B0
    0x00B8, 0x00B9, 0x00F7, 0x00BB, 0x00BC, 0x00BD, 0x00BE, 0x00BF, // B8
    0x05B0, 0x05B1, 0x05B2, 0x05B3, 0x05B4, 0x05B5, 0x05B6, 0x05B7, // C0
    0x05B8, 0x05B9, 0x05BA, 0x05BB, 0x05BC, 0x05BD, 0x05BE, 0x05BF, // C8
    0x05C0, 0x05C1, 0x05C2, 0x05C3, 0x05F0, 0x05F1, 0x05F2, 0x05F3, // D0
    0x05F4, 0xF88D, 0xF88E, 0xF88F, 0xF890, 0xF891, 0xF892, 0xF893, // D8
    0x05D0, 0x05D1, 0x05D2, 0x05D3, 0x05D4, 0x05D5, 0x05D6, 0x05D7, // E0
    0x05D8, 0x05D9, 0x05DA, 0x05DB, 0x05DC, 0x05DD, 0x05DE, 0x05DF, // E8
    0x05E0, 0x05E1, 0x05E2, 0x05E3, 0x05E4, 0x05E5, 0x05E6, 0x05E7, // F0
    0x05E8, 0x05E9, 0x05EA, 0xF894, 0xF895, 0x200E, 0x200F, 0xF896, // F8
};

constexpr char kLacking = '?';

char16_t UnitOf(char byte) {
  const auto index = static_cast<unsigned char>(byte);
  return index < 0x80 ? static_cast<char16_t>(index) : kUpperHalf[index - 0x80U];
}

/// The way back, a place for each code unit: texts of a thousand rows are turned to bytes in every report.
class BytesByUnit {
 public:
  BytesByUnit() {
    bytes_.fill(kLacking);
    for (unsigned byte = 0; byte < 256; ++byte)
      bytes_[UnitOf(static_cast<char>(byte))] = static_cast<char>(byte);
  }
  char operator[](char16_t unit) const { return bytes_[unit]; }

 private:
  std::array<char, 65536> bytes_{};
};

} // namespace

std::string ToCodePage(TextView text) {
  static const BytesByUnit byteOf;
  std::string bytes;
  bytes.reserve(text.size());
  // A byte for each code unit, also for the halves of a pair: lengths in characters hold for the bytes too.
  for (const char16_t unit : text) bytes.push_back(byteOf[unit]);
  return bytes;
}

Text FromCodePage(std::string_view bytes) {
  Text text;
  text.reserve(bytes.size());
  for (const char byte : bytes) text.push_back(UnitOf(byte));
  return text;
}

} // namespace quendra
