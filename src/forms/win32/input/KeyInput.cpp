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

} // namespace

KeyPress KeyInput::PressOf(WPARAM wParam, LPARAM lParam) {
  constexpr LPARAM kWasDown = 1L << 30;
  KeyPress press{0, ShiftStateNow(), (lParam & kWasDown) != 0};
  const auto key = static_cast<UINT>(LOWORD(wParam));
  // A key that was typed for its character alone tells it beside its code, or where others tell their place.
  if (key == VK_PACKET)
    press.code = CodeOfCharacter(static_cast<char16_t>(HIWORD(wParam) ? HIWORD(wParam) : HIWORD(lParam)));
  else if (HasOwnCode(key))
    press.code = static_cast<int>(key);
  else
    press.code = CodeOfCharacter(characters_.Of(key, ::GetKeyboardLayout(0)));
  return press;
}

bool KeyInput::Takes(const MSG& message) {
  if (message.message != WM_KEYDOWN && message.message != WM_SYSKEYDOWN) return false;
  WindowView* const view = WindowView::Around(message.hwnd);
  FormWindow* const form = FormWindow::Around(message.hwnd);
  if (!view || !form || !form->TheForm()) return false;
  const WindowView::Work formAtWork(*form);
  const WindowView::Work viewAtWork(*view);
  const KeyPress key = PressOf(message.wParam, message.lParam);
  if (Handle(*form, *view, key)) return true;
  // A handler that waited may have seen Ctrl let go, and the system would now make a letter of the key.
  return ShiftStateNow() != key.shift;
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
