#include "forms/win32/views/Clipboard.h"

#include <algorithm>

namespace quendra::forms::win32 {

namespace {

HGLOBAL MemoryOf(const Text& text) {
  const std::size_t length = text.size() + 1;
  const HGLOBAL memory = ::GlobalAlloc(GMEM_MOVEABLE, length * sizeof(char16_t));
  auto* const room = memory ? static_cast<char16_t*>(::GlobalLock(memory)) : nullptr;
  if (!room) return memory;
  std::copy_n(text.c_str(), length, room);
  ::GlobalUnlock(memory);
  return memory;
}

} // namespace

void PutOnClipboard(HWND owner, const Text& text) {
  const HGLOBAL memory = MemoryOf(text);
  if (!memory) return;
  const bool isOpen = ::OpenClipboard(owner) != FALSE;
  if (isOpen) ::EmptyClipboard();
  // The system owns it once it has taken it.
  if (!isOpen || !::SetClipboardData(CF_UNICODETEXT, memory)) ::GlobalFree(memory);
  if (isOpen) ::CloseClipboard();
}

} // namespace quendra::forms::win32
