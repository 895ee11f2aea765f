#pragma once

#include <QImage>

#include <cstdint>
#include <vector>

namespace quendra::forms::qt {

/// Decodes the bytes of a PNG, SVG or XPM image and fits it into `bounds`, keeping its aspect. Icons come
/// from files of any origin: bytes that are too many, images that are too large and other formats give a null
/// image.
QImage DecodeIcon(const std::vector<std::uint8_t>& bytes, QSize bounds);

} // namespace quendra::forms::qt
