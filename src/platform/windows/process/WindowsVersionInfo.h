#pragma once

#include "platform/process/VersionInfo.h"
#include "platform/windows/system/LazyLibrary.h"

namespace quendra::platform::windows {

/// Version blocks that executable files carry as resources. The system reads them out of the files; what they
/// hold is looked up here, as it trusts the lengths that a file's block tells.
class WindowsVersionInfo : public VersionInfo {
 public:
  std::uint32_t GetFileVersionInfoSizeA(const std::string& path) override;
  bool GetFileVersionInfoA(const std::string& path, std::span<std::uint8_t> buffer) override;
  std::optional<std::vector<std::uint8_t>> VerQueryValueA(std::span<const std::uint8_t> block,
                                                          const std::string& subBlock) override;

 private:
  LazyLibrary version_{L"version.dll"};
};

} // namespace quendra::platform::windows
