#include "foundation/SocketTexts.h"

#include <array>
#include <bit>

namespace quendra::foundation {

Text DottedAddress(std::uint32_t address) {
  const auto bytes = std::bit_cast<std::array<std::uint8_t, 4>>(address);
  return DecimalText(bytes[0]) + u"." + DecimalText(bytes[1]) + u"." + DecimalText(bytes[2]) + u"." +
         DecimalText(bytes[3]);
}

std::string LibraryName(const Text& name) { return std::string(CutAtNul(ToCodePage(name))); }

} // namespace quendra::foundation
