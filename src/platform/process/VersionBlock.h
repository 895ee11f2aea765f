#pragma once

#include "runtime/Text.h"

#include <cstdint>
#include <optional>
#include <span>
#include <vector>

namespace quendra::platform {

/// The value of a version block under a path such as "\StringFileInfo\040D04E7\ProductName"; names are
/// compared without regard to case. A text is given in the code page, up to and with its NUL, other values as
/// their bytes. Nothing for a path that isn't there, nor beyond what the block's own lengths and its size
/// allow: the block comes from a file that anybody may have written.
///
/// The block is the published tree: each of its nodes has its length, the length of its value and that
/// value's kind (16 bits each), its name in 16-bit characters with a NUL, the value, and its own nodes, each
/// part at a multiple of 4.
std::optional<std::vector<std::uint8_t>> ValueOfVersionBlock(std::span<const std::uint8_t> block,
                                                             TextView path);

} // namespace quendra::platform
