#include "forms/win32/views/EditMenu.h"

namespace quendra::forms::win32 {

namespace {

/// How a field stands when its menu comes up.
struct EditState {
  bool canUndo = false;
  bool canPaste = false;
  bool readOnly = false;
  bool masked = false;
  bool selected = false;
  bool empty = false;
};

EditState StateOf(HWND edit) {
  DWORD from = 0;
  DWORD to = 0;
  ::SendMessageW(edit, EM_GETSEL, reinterpret_cast<WPARAM>(&from), reinterpret_cast<LPARAM>(&to));
  EditState state;
  state.canUndo = ::SendMessageW(edit, EM_CANUNDO, 0, 0) != 0;
  state.canPaste = ::IsClipboardFormatAvailable(CF_UNICODETEXT) != 0;
  state.readOnly = (::GetWindowLongW(edit, GWL_STYLE) & ES_READONLY) != 0;
  state.masked = ::SendMessageW(edit, EM_GETPASSWORDCHAR, 0, 0) != 0;
  state.selected = from != to;
  state.empty = ::GetWindowTextLengthW(edit) == 0;
  return state;
}

struct Entry {
  UINT message; ///< 0 for a line between entries
  const char16_t* caption;
  bool (*offered)(const EditState& state);
};

constexpr Entry kEntries[] = {
    {WM_UNDO, u"ביטול", [](const EditState& s) { return s.canUndo && !s.readOnly; }},
    {0, u"", nullptr},
    {WM_CUT, u"גזירה", [](const EditState& s) { return s.selected && !s.readOnly && !s.masked; }},
    {WM_COPY, u"העתקה", [](const EditState& s) { return s.selected && !s.masked; }},
    {WM_PASTE, u"הדבקה", [](const EditState& s) { return s.canPaste && !s.readOnly; }},
    {WM_CLEAR, u"מחיקה", [](const EditState& s) { return s.selected && !s.readOnly; }},
    {0, u"", nullptr},
    {EM_SETSEL, u"בחירת הכול", [](const EditState& s) { return !s.empty; }},
};

void Fill(HMENU menu, const EditState& state) {
  for (const Entry& entry : kEntries) {
    if (!entry.message)
      ::AppendMenuW(menu, MF_SEPARATOR, 0, nullptr);
    else
      ::AppendMenuW(menu, MF_STRING | (entry.offered(state) ? MF_ENABLED : MF_GRAYED), entry.message,
                    reinterpret_cast<const wchar_t*>(entry.caption));
  }
}

POINT MenuPlace(HWND edit, LPARAM place) {
  POINT spot{static_cast<short>(LOWORD(place)), static_cast<short>(HIWORD(place))};
  if (place != -1) return spot;
  ::GetCaretPos(&spot);
  ::ClientToScreen(edit, &spot);
  return spot;
}

} // namespace

void ShowEditMenu(HWND edit, LPARAM place) {
  constexpr UINT kFromRight = 0x8000; // TPM_LAYOUTRTL, which the headers tell for later systems alone
  const HMENU menu = ::CreatePopupMenu();
  Fill(menu, StateOf(edit));
  const POINT spot = MenuPlace(edit, place);
  const auto chosen = static_cast<UINT>(::TrackPopupMenu(
      menu, TPM_RETURNCMD | TPM_NONOTIFY | TPM_RIGHTBUTTON | kFromRight, spot.x, spot.y, 0, edit, nullptr));
  ::DestroyMenu(menu);
  if (chosen && ::IsWindow(edit)) ::SendMessageW(edit, chosen, 0, chosen == EM_SETSEL ? -1 : 0);
}

} // namespace quendra::forms::win32
