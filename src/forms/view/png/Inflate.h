#pragma once

#include <cstdint>
#include <span>

namespace quendra::forms {

/// Unpacks data in zlib's format (RFC 1950 and 1951) until `unpacked` is full. False where the data is broken
/// or ends before; what was unpacked until then is there. The check sum behind the data isn't read: what
/// carries it has one of its own.
bool Inflate(std::span<const std::uint8_t> packed, std::span<std::uint8_t> unpacked);

} // namespace quendra::forms
