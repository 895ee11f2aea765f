#pragma once

#include "runtime/ByteFields.h"

#include <array>
#include <string>

namespace quendra::platform::linux_ {

/// Bytes as text, high byte first or low byte first.
template <typename Field> std::string HighFirst(Field value) {
  std::array<std::uint8_t, sizeof(Field)> bytes{};
  PutBigField(bytes, 0, value);
  return {bytes.begin(), bytes.end()};
}
template <typename Field> std::string LowFirst(Field value) {
  std::array<std::uint8_t, sizeof(Field)> bytes{};
  PutLittleField(bytes, 0, value);
  return {bytes.begin(), bytes.end()};
}

/// A file as Firefox writes it.
inline std::string FirefoxFile(const std::string& key, const std::string& content = "content",
                               std::uint32_t version = 3) {
  const std::size_t chunks = (content.size() + 262143) / 262144;
  std::string file = content + std::string(4 + 2 * chunks, 'h') + HighFirst(version) + std::string(20, 't') +
                     HighFirst(static_cast<std::uint32_t>(key.size()));
  if (version > 1) file += std::string(4, '\0');
  return file + key + std::string("\0request-method\0GET\0", 20) +
         HighFirst(static_cast<std::uint32_t>(content.size()));
}

/// A file as Chromium's simple cache writes it.
inline std::string ChromiumFile(const std::string& key, const std::string& content = "content") {
  return LowFirst(std::uint64_t{0xFCFB6D1BA7725C30}) + LowFirst(std::uint32_t{5}) +
         LowFirst(static_cast<std::uint32_t>(key.size())) + std::string(8, 'h') + key + content;
}

} // namespace quendra::platform::linux_
