#include "capture/LocalAddress.h"

#include "capture/mod_functions.h"

#include <array>
#include <bit>

namespace quendra::capture {

namespace {

/// The number whose canonical text this may be; the caller compares the texts.
std::uint32_t LooselyRead(TextView text) {
  std::array<std::uint8_t, 4> bytes{};
  std::size_t part = 0;
  for (const char16_t unit : text) {
    if (unit == u'.')
      ++part;
    else if (part < bytes.size())
      bytes[part] = static_cast<std::uint8_t>(bytes[part] * 10 + (unit - u'0'));
  }
  return std::bit_cast<std::uint32_t>(bytes);
}

} // namespace

void LocalAddress::Read(const Text& address) {
  text_ = address;
  const TextView trimmed = Trimmed(address);
  const std::uint32_t number = LooselyRead(trimmed);
  number_ = mod_functions::IpFromLong(number) == trimmed ? std::optional(number) : std::nullopt;
}

} // namespace quendra::capture
