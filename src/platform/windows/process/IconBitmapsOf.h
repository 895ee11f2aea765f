#pragma once

#include "platform/process/IconBitmaps.h"
#include "winapi/Winapi.h"

namespace quendra::platform::windows {

/// Colours and mask of an icon of any depth. Without pixels for what is no icon.
IconBitmaps IconBitmapsOf(HICON icon);

} // namespace quendra::platform::windows
