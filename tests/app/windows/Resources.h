#pragma once

#include "winapi/Winapi.h"

#include <iosfwd>

namespace quendra::app::windows {

/// What this process holds of the system's means.
struct Resources {
  int drawing = 0; ///< pens, brushes, fonts, bitmaps and the like
  int windows = 0; ///< the highest number among windows, icons and the like: lower ones are used again first
  int handles = 0; ///< files, processes, events and the like
  int objects = 0; ///< of the program's own code on its heap
  int kilobytes = 0; ///< in use on its heaps

  static Resources Now();
};

std::ostream& operator<<(std::ostream& out, const Resources& held);

} // namespace quendra::app::windows
