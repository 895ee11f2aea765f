#include "forms/win32/views/MarkedEdit.h"

#include "forms/win32/views/Clipboard.h"
#include "forms/win32/views/LineMarks.h"

#include <algorithm>

namespace quendra::forms::win32 {

namespace {

/// As much of a text as there is room for, with the sign that ends it.
LRESULT GiveText(const Text& text, WPARAM room, LPARAM to) {
  if (room == 0) return 0;
  const std::size_t length = std::min<std::size_t>(text.size(), room - 1);
  *std::copy_n(text.begin(), length, reinterpret_cast<wchar_t*>(to)) = L'\0';
  return static_cast<LRESULT>(length);
}

void CopySelection(const InnerWindow& edit) {
  const auto [from, to] = HeldSelectionIn(edit);
  const Text selected = WithoutLineMarks(
      HeldIn(edit).substr(static_cast<std::size_t>(from), static_cast<std::size_t>(to - from)));
  if (!selected.empty()) PutOnClipboard(edit.Window(), selected);
}

} // namespace

Text HeldIn(const InnerWindow& edit) {
  const LRESULT length = std::max<LRESULT>(0, edit.PassOn(WM_GETTEXTLENGTH));
  Text held(static_cast<std::size_t>(length) + 1, u'\0');
  const LRESULT taken = edit.PassOn(WM_GETTEXT, held.size(), reinterpret_cast<LPARAM>(held.data()));
  held.resize(static_cast<std::size_t>(std::clamp<LRESULT>(taken, 0, length)));
  return held;
}

std::pair<int, int> HeldSelectionIn(const InnerWindow& edit) {
  DWORD from = 0;
  DWORD to = 0;
  edit.Send(EM_GETSEL, reinterpret_cast<WPARAM>(&from), reinterpret_cast<LPARAM>(&to));
  return {static_cast<int>(from), static_cast<int>(to)};
}

std::optional<LRESULT> AnswerWithoutMarks(const InnerWindow& edit, UINT message, WPARAM wParam,
                                          LPARAM lParam) {
  switch (message) {
  case WM_GETTEXTLENGTH: return static_cast<LRESULT>(WithoutLineMarks(HeldIn(edit)).size());
  case WM_GETTEXT: return GiveText(WithoutLineMarks(HeldIn(edit)), wParam, lParam);
  case WM_COPY: CopySelection(edit); return 0;
  default: return std::nullopt;
  }
}

} // namespace quendra::forms::win32
