#include "forms/win32/windows/ModalBlock.h"

#include <new>
#include <utility>

namespace quendra::forms::win32 {

namespace {

BOOL CALLBACK Collect(HWND window, LPARAM windows) noexcept {
  if (!::IsWindowEnabled(window) || !::IsWindowVisible(window)) return TRUE;
  try {
    reinterpret_cast<std::vector<HWND>*>(windows)->push_back(window);
  } catch (const std::bad_alloc&) {
    return FALSE;
  }
  return TRUE;
}

} // namespace

ModalBlock::ModalBlock(HWND but) {
  // A press that is under way ends here.
  ::ReleaseCapture();
  std::vector<HWND> windows;
  ::EnumThreadWindows(::GetCurrentThreadId(), Collect, reinterpret_cast<LPARAM>(&windows));
  for (const HWND window : windows) {
    if (window == but || ::GetWindow(window, GW_OWNER) == but) continue;
    ::EnableWindow(window, FALSE);
    blocked_.push_back(window);
  }
}

void ModalBlock::Lift() {
  for (const HWND window : std::exchange(blocked_, {}))
    if (::IsWindow(window)) ::EnableWindow(window, TRUE);
}

} // namespace quendra::forms::win32
