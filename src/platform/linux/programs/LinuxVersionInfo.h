#pragma once

#include "platform/linux/programs/DesktopIndex.h"
#include "platform/linux/system/SystemPaths.h"
#include "platform/process/VersionInfo.h"

namespace quendra::platform::linux_ {

/// Version records made of desktop entries: the entry's name as the product, its comment as the description.
/// A file that no entry starts has no version block.
class LinuxVersionInfo : public VersionInfo {
 public:
  LinuxVersionInfo(DesktopIndex& index, const SystemPaths& paths) : index_(index), paths_(paths) {}

  std::uint32_t GetFileVersionInfoSizeA(const std::string& path) override;
  bool GetFileVersionInfoA(const std::string& path, std::span<std::uint8_t> buffer) override;
  std::optional<std::vector<std::uint8_t>> VerQueryValueA(std::span<const std::uint8_t> block,
                                                          const std::string& subBlock) override;

 private:
  std::string BlockOf(const std::string& path);

  DesktopIndex& index_;
  const SystemPaths& paths_;
};

} // namespace quendra::platform::linux_
