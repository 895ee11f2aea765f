#pragma once

#include "winapi/Winapi.h"

#include <string>

namespace quendra::standins {

/// All visible windows of programs whose windows of the screen have that class, those that lie on top first:
/// an array of objects, each behind the window that it lies in. No window is asked anything, so a program
/// that is busy is told of, too.
std::string TreeOf(const std::wstring& topClass);

} // namespace quendra::standins
