#include "platform/net/Ipv4Address.h"

namespace quendra::platform {

namespace {

/// One part, taken from the front of the text; nothing where none stands.
template <typename View> std::optional<std::uint32_t> TakePart(View& text) {
  std::size_t digits = 0;
  std::uint32_t value = 0;
  while (digits < text.size() && digits < 3 && text[digits] >= '0' && text[digits] <= '9')
    value = value * 10 + static_cast<std::uint32_t>(text[digits++] - '0');
  const bool leadingZero = digits > 1 && text[0] == '0';
  if (digits == 0 || value > 255 || leadingZero) return {};
  text.remove_prefix(digits);
  return value;
}

template <typename View> std::optional<Ipv4Address> Parsed(View text) {
  std::uint32_t number = 0;
  for (int part = 0; part < 4; ++part) {
    if (part > 0) {
      if (text.empty() || text.front() != '.') return {};
      text.remove_prefix(1);
    }
    const auto value = TakePart(text);
    if (!value) return {};
    number = number << 8 | *value;
  }
  if (!text.empty()) return {};
  return Ipv4Address::FromHost(number);
}

} // namespace

std::optional<Ipv4Address> Ipv4Address::FromText(TextView text) { return Parsed(text); }

std::optional<Ipv4Address> Ipv4Address::FromText(std::string_view text) { return Parsed(text); }

std::string Ipv4Address::AsAscii() const {
  const std::uint32_t number = InHost();
  std::string text = std::to_string(number >> 24);
  for (int shift = 16; shift >= 0; shift -= 8) text += "." + std::to_string(number >> shift & 0xFF);
  return text;
}

Text Ipv4Address::AsText() const {
  const std::string text = AsAscii();
  return Text(text.begin(), text.end());
}

} // namespace quendra::platform
