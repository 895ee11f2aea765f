#pragma once

#include "forms/controls/Picture.h"

#include <cstdint>
#include <optional>
#include <span>

namespace quendra::forms {

/// The pixels of a PNG file of 8 bits a channel that isn't interlaced: grey, colours or a palette, each with
/// alpha or without. Files may be of any origin: none is given for any other bytes, for broken ones, and for
/// pictures of more than 2048 pixels a side.
std::optional<Picture::Pixels> ReadPng(std::span<const std::uint8_t> file);

} // namespace quendra::forms
