#pragma once

#include "platform/process/VersionInfo.h"

namespace quendra::platform::unavailable {

/// A system whose files have no version blocks.
class UnavailableVersionInfo : public VersionInfo {
 public:
  std::uint32_t GetFileVersionInfoSizeA(const std::string&) override { return 0; }
  bool GetFileVersionInfoA(const std::string&, std::span<std::uint8_t>) override { return false; }
  std::optional<std::vector<std::uint8_t>> VerQueryValueA(std::span<const std::uint8_t>,
                                                          const std::string&) override {
    return {};
  }
};

} // namespace quendra::platform::unavailable
