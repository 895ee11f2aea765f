#pragma once

#include "platform/linux/programs/DesktopIndex.h"
#include "platform/linux/programs/IconTheme.h"
#include "platform/linux/system/SystemPaths.h"
#include "platform/process/Icons.h"

#include <map>
#include <memory>
#include <unordered_map>

namespace quendra::platform::linux_ {

/// The icon of a file is the one of the desktop entry that starts it.
class LinuxIcons : public Icons {
 public:
  LinuxIcons(DesktopIndex& index, IconTheme& theme, const SystemPaths& paths)
      : index_(index), theme_(theme), paths_(paths) {}

  Handle ExtractIconExA(const std::string& path, int index) override;
  const std::vector<std::uint8_t>& ImageOf(Handle icon) override;
  bool DestroyIcon(Handle icon) override { return icons_.erase(icon) != 0; }

  static constexpr std::size_t kIconBytes = 1 << 20;
  static constexpr std::size_t kMostRemembered = 256;

 private:
  using Image = std::shared_ptr<const std::vector<std::uint8_t>>;
  Image ImageFor(const std::string& executable);
  Image Load(const std::string& executable);

  DesktopIndex& index_;
  IconTheme& theme_;
  const SystemPaths& paths_;
  std::map<Handle, Image> icons_;
  std::unordered_map<std::string, Image>
      imageOf_; ///< by executable, without an image for those that have none
  int generation_ = 0;
  std::uint32_t next_ = 0;
};

} // namespace quendra::platform::linux_
