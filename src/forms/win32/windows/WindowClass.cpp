#include "forms/win32/windows/WindowClass.h"

namespace quendra::forms::win32 {

HINSTANCE ThisProgram() { return ::GetModuleHandleW(nullptr); }

const wchar_t* OwnClass(const wchar_t* name, WNDPROC procedure, UINT style) {
  constexpr WORD kProgramsIcon = 1;
  WNDCLASSEXW known{};
  known.cbSize = sizeof known;
  known.style = style;
  known.lpfnWndProc = procedure;
  known.hInstance = ThisProgram();
  known.hIcon = ::LoadIconW(ThisProgram(), MAKEINTRESOURCEW(kProgramsIcon));
  known.hCursor = ::LoadCursorW(nullptr, reinterpret_cast<const wchar_t*>(IDC_ARROW));
  known.lpszClassName = name;
  ::RegisterClassExW(&known); // fails for one that is known
  return name;
}

} // namespace quendra::forms::win32
