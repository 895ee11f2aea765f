#pragma once

#include "platform/mail/InstalledProducts.h"

#include <string>
#include <vector>

namespace quendra::platform::windows {

/// What the system's installer lists. It wants to be asked in order, so the list is taken whole whenever its
/// first product is asked for.
class WindowsInstalledProducts : public InstalledProducts {
 public:
  std::uint32_t MsiEnumProductsA(std::uint32_t index, std::span<char> code) override;

 private:
  std::vector<std::string> codes_;
};

} // namespace quendra::platform::windows
