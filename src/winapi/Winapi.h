#pragma once

// The one road to the system's own headers. Their macros rename functions, ours too where these share a name:
// here the macros end, and calls of the system are named in full, as MessageBoxW. Other headers of the system
// are included after this one.

#ifndef UNICODE
#define UNICODE
#endif
#ifndef NOMINMAX
#define NOMINMAX
#endif
#ifndef WIN32_LEAN_AND_MEAN
#define WIN32_LEAN_AND_MEAN
#endif

#include <windows.h>

#undef AddAtom
#undef CharUpper
#undef CopyFile
#undef CreateEvent
#undef CreateFont
#undef CreateWindow
#undef CreateWindowEx
#undef DeleteFile
#undef DispatchMessage
#undef DrawText
#undef FindWindow
#undef FormatMessage
#undef GetClassName
#undef GetMessage
#undef GetObject
#undef GetUserName
#undef LoadCursor
#undef LoadIcon
#undef LoadImage
#undef MessageBox
#undef PeekMessage
#undef PostMessage
#undef RegisterClass
#undef RegisterWindowMessage
#undef SendMessage
#undef TextOut
#undef Yield
#undef far
#undef interface
#undef near
#undef small

#include "runtime/Text.h"

namespace quendra::winapi {

/// A text as the system's calls for wide characters take it: they end it at its first NUL.
inline const wchar_t* Wide(const Text& text) { return reinterpret_cast<const wchar_t*>(text.c_str()); }
/// So many characters that the system filled in.
inline Text TextOf(const wchar_t* characters, std::size_t count) {
  return {reinterpret_cast<const char16_t*>(characters), count};
}
/// Up to the NUL.
inline Text TextOf(const wchar_t* characters) { return reinterpret_cast<const char16_t*>(characters); }

} // namespace quendra::winapi
