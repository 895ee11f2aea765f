#pragma once

#include "platform/process/Icons.h"
#include "platform/windows/system/LazyLibrary.h"

#include <map>

namespace quendra::platform::windows {

/// The icons that executable files carry as resources.
class WindowsIcons : public Icons {
 public:
  ~WindowsIcons() override;

  Handle ExtractIconExA(const std::string& path, int index) override;
  const std::vector<std::uint8_t>& ImageOf(Handle icon) override;
  bool DestroyIcon(Handle icon) override;

 private:
  LazyLibrary shell32_{L"shell32.dll"};
  /// The icons that are there, each with its image once somebody has asked for it.
  std::map<Handle, std::vector<std::uint8_t>> images_;
};

} // namespace quendra::platform::windows
