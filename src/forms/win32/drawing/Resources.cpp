#include "forms/win32/drawing/Resources.h"

namespace quendra::forms::win32 {

std::span<const std::uint8_t> ResourceOf(std::string_view name) {
  for (const Resource& resource : AllResources())
    if (resource.name == name) return {resource.begin, resource.end};
  return {};
}

} // namespace quendra::forms::win32
