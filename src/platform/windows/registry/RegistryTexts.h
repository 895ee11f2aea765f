#pragma once

#include <cstdint>
#include <span>
#include <vector>

namespace quendra::platform::windows {

/// Whether the system takes values of that type for texts.
bool IsRegistryText(std::uint32_t type);

/// The bytes of such a value in our code page as the system's 16-bit characters, and back. Half a character
/// at the end is lost.
std::vector<std::uint8_t> CharactersOfText(std::span<const std::uint8_t> bytes);
std::vector<std::uint8_t> BytesOfText(std::span<const std::uint8_t> characters);

} // namespace quendra::platform::windows
