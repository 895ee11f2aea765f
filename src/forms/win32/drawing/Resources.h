#pragma once

#include <cstdint>
#include <span>
#include <string_view>

namespace quendra::forms::win32 {

/// A file that the program carries: a picture by its name in artwork/ without its ending, with "@2x" behind
/// it for the one of twice the size, a font by its file name. Empty where there is none of that name.
std::span<const std::uint8_t> ResourceOf(std::string_view name);

/// As the build writes them.
struct Resource {
  std::string_view name;
  const std::uint8_t* begin;
  const std::uint8_t* end;
};
std::span<const Resource> AllResources();

} // namespace quendra::forms::win32
