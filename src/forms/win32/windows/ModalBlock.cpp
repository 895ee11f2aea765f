#include "forms/win32/windows/ModalBlock.h"

#include <new>
#include <utility>

namespace quendra::forms::win32 {

namespace {

/// The property of a window that counts the blocks on it: those of several modal forms and boxes end in any
/// order.
constexpr const wchar_t* kBlocks = L"QuendraBlocks";

INT_PTR BlocksOn(HWND window) { return reinterpret_cast<INT_PTR>(::GetPropW(window, kBlocks)); }

void Count(HWND window, INT_PTR blocks) {
  if (blocks > 0)
    ::SetPropW(window, kBlocks, reinterpret_cast<HANDLE>(blocks));
  else
    ::RemovePropW(window, kBlocks);
  ::EnableWindow(window, blocks <= 0);
}

BOOL CALLBACK Collect(HWND window, LPARAM windows) noexcept {
  const bool takesUser = ::IsWindowEnabled(window) && ::IsWindowVisible(window);
  if (!takesUser && BlocksOn(window) == 0) return TRUE;
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
    Count(window, BlocksOn(window) + 1);
    blocked_.push_back(window);
  }
}

void ModalBlock::Lift() {
  for (const HWND window : std::exchange(blocked_, {}))
    if (BlocksOn(window) > 0) Count(window, BlocksOn(window) - 1);
}

} // namespace quendra::forms::win32
