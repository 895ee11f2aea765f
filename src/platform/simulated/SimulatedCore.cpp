#include "platform/simulated/SimulatedCore.h"

#include <sstream>

namespace quendra::platform::simulated {

std::uint32_t AddressInMemory(const std::string& dotted) {
  std::istringstream text(dotted);
  std::uint32_t address = 0;
  for (int i = 0; i < 4; ++i) {
    unsigned part = 0;
    if (i > 0 && text.get() != '.') return 0;
    if (!(text >> part) || part > 255) return 0;
    address |= part << 8 * i;
  }
  return address;
}

} // namespace quendra::platform::simulated
