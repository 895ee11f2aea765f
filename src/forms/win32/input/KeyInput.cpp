#include "forms/win32/input/KeyInput.h"

#include "forms/win32/input/MouseInput.h"
#include "forms/win32/windows/FormWindow.h"

namespace quendra::forms::win32 {

namespace {

bool HasOwnCode(WPARAM key) {
  return key == VK_BACK || key == VK_TAB || key == VK_RETURN || key == VK_ESCAPE ||
         (key >= VK_SPACE && key <= VK_DOWN) || key == VK_INSERT || key == VK_DELETE ||
         (key >= VK_F1 && key <= VK_F16);
}

/// What the key gives alone in the active layout; 0 for a key without a character, and for one that waits for
/// the next.
char16_t CharacterOf(UINT key, UINT scanCode) {
  const HKL layout = ::GetKeyboardLayout(0);
  constexpr UINT kWaitsForNext = 0x80000000;
  const UINT plain = ::MapVirtualKeyExW(key, MAPVK_VK_TO_CHAR, layout);
  if (plain == 0 || plain & kWaitsForNext) return u'\0';
  // The plain map knows letters by their Latin names alone.
  const BYTE nothingHeld[256] = {};
  wchar_t given[4] = {};
  const int count = ::ToUnicodeEx(key, scanCode, nothingHeld, given, 4, 0, layout);
  return count == 1 && given[0] >= L' ' ? static_cast<char16_t>(given[0]) : static_cast<char16_t>(plain);
}

} // namespace

KeyPress PressOf(WPARAM wParam, LPARAM lParam) {
  constexpr LPARAM kWasDown = 1L << 30;
  KeyPress press{0, ShiftStateNow(), (lParam & kWasDown) != 0};
  const auto key = static_cast<UINT>(LOWORD(wParam));
  // A key that was typed for its character alone tells it beside its code.
  if (key == VK_PACKET)
    press.code = CodeOfCharacter(static_cast<char16_t>(HIWORD(wParam)));
  else if (HasOwnCode(key))
    press.code = static_cast<int>(key);
  else
    press.code = CodeOfCharacter(CharacterOf(key, LOBYTE(HIWORD(lParam))));
  return press;
}

bool KeyInput::Takes(const MSG& message) {
  if (message.message != WM_KEYDOWN && message.message != WM_SYSKEYDOWN) return false;
  WindowView* const view = WindowView::Around(message.hwnd);
  FormWindow* const form = FormWindow::Around(message.hwnd);
  if (!view || !form || !form->TheForm()) return false;
  const WindowView::Work formAtWork(*form);
  const WindowView::Work viewAtWork(*view);
  return Handle(*form, *view, PressOf(message.wParam, message.lParam));
}

bool KeyInput::Handle(FormWindow& form, WindowView& view, const KeyPress& key) {
  const bool ofControl = &view != &form;
  if (HearsOf(*form.TheForm(), key, ofControl))
    form.Context().dispatcher.Dispatch([&] { form.TheForm()->Form_KeyDown(key.code, key.shift); });
  if (!form.TheForm() || !view.TheControl()) return true;
  if (MoveFocus(form, key)) return true;
  const KeyUse use = view.IsEnabled() ? view.Use(key) : KeyUse::Free;
  if (use != KeyUse::Free) return use == KeyUse::Done;
  const Control* const pressed = ControlPressedBy(*form.TheForm(), key);
  if (pressed) form.Context().dispatcher.Dispatch([&] { pressed->Click(); });
  return pressed;
}

bool KeyInput::MoveFocus(FormWindow& form, const KeyPress& key) {
  if (key.code != kTabKey || key.shift & (kCtrl | kAlt)) return false;
  form.Context().state.usesKeys = true;
  form.MoveFocus(key.shift & kShift ? TabDirection::Backwards : TabDirection::Forwards);
  return true;
}

} // namespace quendra::forms::win32
