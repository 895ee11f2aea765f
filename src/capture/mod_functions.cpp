#include "capture/mod_functions.h"

#include "platform/net/Ipv4Address.h"
#include "runtime/ByteFields.h"

#include <algorithm>

namespace quendra::capture::mod_functions {

Text IpFromLong(std::uint32_t value) { return platform::Ipv4Address::FromMemory(value).AsText(); }

std::uint32_t ReadBytes(const platform::FrameBytes& bytes, std::int32_t index, std::int32_t count) {
  std::array<std::uint8_t, 4> copied{};
  for (std::int32_t i = 0; i < std::min(count, 4); ++i)
    copied[static_cast<std::size_t>(i)] = bytes[index + i];
  return Little32(copied, 0);
}

Text HexRun(const platform::FrameBytes& bytes, std::int32_t first, std::int32_t countLessOne) {
  static constexpr char16_t kDigits[] = u"0123456789ABCDEF";
  Text text;
  for (std::int32_t i = 0; i <= countLessOne; ++i) {
    const std::uint8_t byte = bytes[first + i];
    if (i > 0) text += u':';
    text += kDigits[byte >> 4];
    text += kDigits[byte & 15];
  }
  return text;
}

} // namespace quendra::capture::mod_functions
