#include "forms/view/Palette.h"

namespace quendra::forms {

Colour Darker(Colour colour, unsigned percent) {
  const auto darker = [=](Colour part) { return ((part & 0xFF) * 200 + percent) / (2 * percent); };
  return Rgb(darker(colour), darker(colour >> 8), darker(colour >> 16));
}

} // namespace quendra::forms
