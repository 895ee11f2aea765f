#pragma once

#include "platform/process/Processes.h"

#include <vector>

namespace quendra::platform {

/// Icons of executable files.
class Icons {
 public:
  virtual ~Icons() = default;

  /// The handle of the file's icon of this index (from 0) in its large form, kNoHandle when it gives none.
  virtual Handle ExtractIconExA(const std::string& path, int index) = 0;
  /// What the handle stands for: the bytes of an image file (PNG, SVG or XPM). Empty for a handle that is
  /// none.
  virtual const std::vector<std::uint8_t>& ImageOf(Handle icon) = 0;
  virtual bool DestroyIcon(Handle icon) = 0;
};

} // namespace quendra::platform
