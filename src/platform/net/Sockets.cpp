#include "platform/net/Sockets.h"

namespace quendra::platform {

namespace {

/// One part in decimal, octal (leading 0) or hexadecimal (leading 0x), as the library reads them; -1 when it
/// is none.
std::int64_t TakePart(std::string_view& text) {
  unsigned base = 10;
  if (text.starts_with("0x") || text.starts_with("0X")) {
    base = 16;
    text.remove_prefix(2);
  } else if (text.size() > 1 && text[0] == '0') {
    base = 8;
  }
  std::int64_t value = -1;
  while (!text.empty()) {
    const char digit = text.front();
    unsigned number = 99;
    if (digit >= '0' && digit <= '9') number = static_cast<unsigned>(digit - '0');
    if (digit >= 'a' && digit <= 'f') number = static_cast<unsigned>(digit - 'a') + 10;
    if (digit >= 'A' && digit <= 'F') number = static_cast<unsigned>(digit - 'A') + 10;
    if (number >= base) break;
    value = (value < 0 ? 0 : value) * base + number;
    if (value > 0xFFFFFFFF) return -1;
    text.remove_prefix(1);
  }
  return value;
}

} // namespace

Ipv4Address Sockets::inet_addr(const std::string& dotted) {
  std::string_view text = dotted;
  std::uint32_t address = 0;
  for (int part = 0; part < 4; ++part) {
    const std::int64_t value = TakePart(text);
    if (value < 0) return kNoAddress;
    const bool last = text.empty();
    const int bits = 8 * (4 - part);
    if (value > (last ? (std::int64_t{1} << bits) - 1 : 255)) return kNoAddress;
    address |= static_cast<std::uint32_t>(last ? value : value << (bits - 8));
    if (last) return Ipv4Address::FromHost(address);
    if (text.front() != '.') return kNoAddress;
    text.remove_prefix(1);
  }
  return kNoAddress;
}

} // namespace quendra::platform
