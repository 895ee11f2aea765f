#pragma once

#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace quendra::platform {

/// Version records of executable files. Paths, names and values are in the system's code page.
class VersionInfo {
 public:
  virtual ~VersionInfo() = default;

  /// The sub-block of the languages, and what stands before language, code page and a text's name.
  static constexpr std::string_view kTranslation = "\\VarFileInfo\\Translation";
  static constexpr std::string_view kTexts = "\\StringFileInfo\\";

  /// 0 for a file without a version block.
  virtual std::uint32_t GetFileVersionInfoSizeA(const std::string& path) = 0;
  virtual bool GetFileVersionInfoA(const std::string& path, std::span<std::uint8_t> buffer) = 0;
  /// The value's bytes for a sub-block: kTranslation, or kTexts and such as "040D04E7\ProductName" (texts
  /// with their NUL); nothing when the block lacks it.
  virtual std::optional<std::vector<std::uint8_t>> VerQueryValueA(std::span<const std::uint8_t> block,
                                                                  const std::string& subBlock) = 0;
};

} // namespace quendra::platform
