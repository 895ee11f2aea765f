#include "platform/simulated/net/dormant/ScriptedReads.h"

#include <algorithm>

namespace quendra::platform::simulated {

std::int32_t ScriptedReads::Read(SocketHandle socket, std::span<std::uint8_t> buffer) {
  auto& waiting = waiting_[socket];
  if (waiting.empty()) return 0;
  if (!waiting.front()) {
    waiting.pop_front();
    return kSocketError;
  }
  auto& bytes = *waiting.front();
  const std::size_t length = std::min(bytes.size(), buffer.size());
  std::copy_n(bytes.begin(), length, buffer.begin());
  bytes.erase(bytes.begin(), bytes.begin() + static_cast<std::ptrdiff_t>(length));
  if (bytes.empty()) waiting.pop_front();
  return static_cast<std::int32_t>(length);
}

} // namespace quendra::platform::simulated
