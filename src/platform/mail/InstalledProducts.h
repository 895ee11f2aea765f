#pragma once

#include <cstdint>
#include <span>

namespace quendra::platform {

/// The programs that the system's installer has put on the machine.
class InstalledProducts {
 public:
  virtual ~InstalledProducts() = default;

  static constexpr std::uint32_t kNoMoreItems = 259;
  static constexpr std::size_t kProductCodeBytes = 39; ///< with its NUL

  /// The code of product number `index`, from 0, with its NUL. 0 for success, kNoMoreItems behind the last.
  virtual std::uint32_t MsiEnumProductsA(std::uint32_t index, std::span<char> code) = 0;
};

} // namespace quendra::platform
