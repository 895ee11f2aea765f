#include "runtime/Format.h"

#include "runtime/Fault.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>

namespace quendra {

namespace {

/// 15 significant digits, which is what a double's decimal form has to the formats.
struct Decimal {
  bool negative = false;
  std::string digits; ///< without a point, no leading zeros save a single "0"
  int pointAt = 0;    ///< digits before the point; may be negative or beyond the digits
};

Decimal DecimalOf(double value) {
  // Not printf: its point is the locale's.
  std::array<char, 40> buffer{};
  const auto written = std::to_chars(buffer.data(), buffer.data() + buffer.size(), std::fabs(value),
                                     std::chars_format::scientific, 14);
  Decimal decimal;
  decimal.negative = std::signbit(value) && value != 0;
  const std::string text(buffer.data(), written.ptr);
  const auto exponentAt = text.find('e');
  decimal.digits = text.substr(0, 1) + text.substr(2, exponentAt - 2);
  decimal.pointAt = std::stoi(text.substr(exponentAt + 1)) + 1;
  return decimal;
}

/// Rounds to `places` after the point, half away from zero; gives the digits up to there, at least one
/// before them.
std::string RoundedDigits(const Decimal& decimal, int places) {
  std::string digits(static_cast<std::size_t>(std::max(0, -decimal.pointAt)) + 1, '0');
  digits += decimal.digits;
  const int before = std::max(decimal.pointAt, 0) + 1;
  const auto keep = static_cast<std::size_t>(before) + static_cast<std::size_t>(places);
  if (digits.size() < keep + 1) digits.append(keep + 1 - digits.size(), '0');
  const bool up = digits[keep] >= '5';
  digits.resize(keep);
  if (!up) return digits;
  auto digit = digits.rbegin();
  while (*digit == '9') *digit++ = '0';
  ++*digit;
  return digits;
}

void PartInThrees(std::string& digits) {
  for (std::size_t at = digits.size(); at > 3;) digits.insert(at -= 3, ",");
}

} // namespace

Text Format(double value, TextView format) {
  if (!std::isfinite(value)) throw Fault(Fault::kOverflow);
  const auto point = format.find(u'.');
  const Text whole = Replaced(format.substr(0, point), u",", u"");
  const TextView fraction = point == TextView::npos ? TextView{} : format.substr(point + 1);
  const auto places = fraction.size();
  const Decimal decimal = DecimalOf(value);
  const std::string digits = RoundedDigits(decimal, static_cast<int>(places));

  std::string before = digits.substr(0, digits.size() - places);
  std::string after = digits.substr(digits.size() - places);
  before.erase(0, std::min(before.find_first_not_of('0'), before.size()));
  const auto firstZero = std::min(whole.find(u'0'), whole.size());
  const auto needed = whole.size() - firstZero;
  if (before.size() < needed) before.insert(0, needed - before.size(), '0');
  if (format.substr(0, point).find(u',') != TextView::npos) PartInThrees(before);
  while (!after.empty() && after.back() == '0' && fraction[after.size() - 1] == u'#') after.pop_back();

  const bool zero = digits.find_first_not_of('0') == std::string::npos;
  std::string text = (decimal.negative && !zero ? "-" : "") + before;
  if (point != TextView::npos) text += "." + after;
  return Text(text.begin(), text.end());
}

double NumberOf(TextView text) {
  const TextView trimmed = Trimmed(text);
  std::string bytes;
  for (const char16_t unit : trimmed) bytes.push_back(unit < 0x80 ? static_cast<char>(unit) : '?');
  const bool plus = bytes.starts_with('+') && !bytes.starts_with("+-");
  const char* first = bytes.c_str() + (plus ? 1 : 0);
  const char* last = bytes.c_str() + bytes.size();
  double value = 0;
  const auto [end, error] = std::from_chars(first, last, value);
  if (error == std::errc::result_out_of_range) throw Fault(Fault::kOverflow);
  if (error != std::errc{} || end != last || !std::isfinite(value)) throw Fault(Fault::kTypeMismatch);
  return value;
}

Text NumberText(double value) {
  std::array<char, 40> buffer{};
  const auto written =
      std::to_chars(buffer.data(), buffer.data() + buffer.size(), value, std::chars_format::general, 15);
  Text text(buffer.data(), written.ptr);
  std::replace(text.begin(), text.end(), u'e', u'E');
  return text;
}

} // namespace quendra
