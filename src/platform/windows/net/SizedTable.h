#pragma once

#include "platform/windows/net/IpHelperLibrary.h"

#include <cstdint>
#include <vector>

namespace quendra::platform::windows {

/// A table that the IP helper fills in when it is given room enough: `ask` gets the room and its size, and
/// puts the needed size there. What comes in between makes it grow, so it is asked again, a bounded number of
/// times. 0 on success.
template <typename Ask> DWORD ReadSizedTable(std::vector<std::uint8_t>& table, Ask ask) {
  constexpr int kMostTries = 10;
  constexpr DWORD kSpare = 4096;
  DWORD result = ERROR_INSUFFICIENT_BUFFER;
  table.resize(kSpare);
  for (int i = 0; i < kMostTries; ++i) {
    DWORD size = static_cast<DWORD>(table.size());
    result = ask(table.data(), size);
    if (result != ERROR_INSUFFICIENT_BUFFER && result != ERROR_BUFFER_OVERFLOW) return result;
    table.resize(size + kSpare);
  }
  return result;
}

} // namespace quendra::platform::windows
