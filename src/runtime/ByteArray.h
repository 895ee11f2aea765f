#pragma once

#include <cstdint>
#include <memory>
#include <utility>
#include <vector>

namespace quendra {

/// Leaves new elements without a value: what grows is about to be written, and clearing it first costs as
/// much again.
template <typename Element> class UnclearedAllocator : public std::allocator<Element> {
 public:
  template <typename Other> struct rebind { using other = UnclearedAllocator<Other>; };
  template <typename Other> void construct(Other* place) noexcept { ::new (static_cast<void*>(place)) Other; }
  template <typename Other, typename... Args> void construct(Other* place, Args&&... args) {
    ::new (static_cast<void*>(place)) Other(std::forward<Args>(args)...);
  }
};

using ByteArray = std::vector<std::uint8_t, UnclearedAllocator<std::uint8_t>>;

} // namespace quendra
