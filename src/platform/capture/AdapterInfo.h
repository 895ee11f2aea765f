#pragma once

#include <array>
#include <cstdint>

namespace quendra::platform {

/// An adapter in the capture library's exchange form.
struct AdapterInfo {
  std::array<char, 255> AdapterName{};        ///< zero bytes fill the end
  std::array<char, 255> AdapterDescription{}; ///< likewise, in the system's code page
  std::array<char, 2> alignment{};
  std::uint32_t unread = 0;
};
static_assert(sizeof(AdapterInfo) == 516);

} // namespace quendra::platform
