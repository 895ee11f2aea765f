#pragma once

#include "platform/mail/InstalledProducts.h"

#include <algorithm>
#include <string>
#include <vector>

namespace quendra::platform::simulated {

/// Installed programs as a list of their codes.
class SimulatedInstalledProducts : public InstalledProducts {
 public:
  std::vector<std::string> Codes;
  /// What is given from the index behind the last on.
  std::uint32_t EndError = kNoMoreItems;

  std::uint32_t MsiEnumProductsA(std::uint32_t index, std::span<char> code) override {
    if (index >= Codes.size()) return EndError;
    const std::string text = Codes[index].substr(0, code.empty() ? 0 : code.size() - 1);
    std::ranges::copy(text, code.begin());
    if (!code.empty()) code[text.size()] = '\0';
    return 0;
  }
};

} // namespace quendra::platform::simulated
