#pragma once

#include <algorithm>
#include <cstdint>
#include <span>
#include <string>

namespace quendra::platform::simulated {

/// A text in a field of fixed width: it ends at the first NUL, if there is one.
inline std::string TextAt(std::span<const std::uint8_t> bytes, std::size_t at, std::size_t width) {
  if (at >= bytes.size()) return {};
  const auto field = bytes.subspan(at, std::min(width, bytes.size() - at));
  return {field.begin(), std::find(field.begin(), field.end(), 0)};
}

/// Fills the field: the text as far as it leaves room for a NUL, then nothing but NUL.
inline void PutTextAt(std::span<std::uint8_t> bytes, std::size_t at, std::size_t width,
                      const std::string& text) {
  const auto field = bytes.subspan(at, width);
  std::ranges::fill(field, std::uint8_t{0});
  std::copy_n(text.begin(), std::min(text.size(), width - 1), field.begin());
}

} // namespace quendra::platform::simulated
