#include "forms/win32/Win32Driver.h"

#include "forms/win32/boxes/BoxViews.h"
#include "forms/win32/windows/WindowClass.h"

#include <algorithm>

namespace quendra::forms::win32 {

namespace {

constexpr DWORD kMostMilliseconds = 5000;

Text TextOf(HWND window) {
  wchar_t text[8192] = {};
  const int length = ::GetWindowTextW(window, text, 8192);
  return winapi::TextOf(text, static_cast<std::size_t>(length));
}

BOOL CALLBACK FindBox(HWND window, LPARAM found) noexcept {
  if (!::IsWindowVisible(window) || !::IsWindowEnabled(window)) return TRUE;
  FormWindow* const form = FormWindow::Around(window);
  if (!form || form->Top() != window || !dynamic_cast<BoxForm*>(form->TheForm())) return TRUE;
  *reinterpret_cast<FormWindow**>(found) = form;
  return FALSE;
}

/// What stands in a box, as its windows say.
BoxContent ContentOf(const FormWindow& box) {
  BoxContent content;
  content.title = TextOf(box.Top());
  content.rightToLeft = ::GetWindowLongW(box.Top(), GWL_EXSTYLE) & WS_EX_LAYOUTRTL;
  for (Control* control : box.TheForm()->Children()) {
    const auto* view = dynamic_cast<const WindowView*>(control->View());
    if (!control->Visible()) continue;
    if (const auto* sign = dynamic_cast<const BoxSignView*>(view)) content.sign = sign->Sign();
    if (dynamic_cast<const BoxTextView*>(view)) content.text = TextOf(view->Window());
    if (dynamic_cast<const CommandButton*>(control))
      content.buttons.push_back({std::stoi(ToUtf8(control->Name())), TextOf(view->Window())});
  }
  return content;
}

INPUT KeyInputOf(WORD key, WORD character, bool up) {
  INPUT input{};
  input.type = INPUT_KEYBOARD;
  input.ki.wVk = key;
  input.ki.wScan = character;
  input.ki.dwFlags = (character ? KEYEVENTF_UNICODE : 0UL) | (up ? KEYEVENTF_KEYUP : 0UL);
  return input;
}

bool IsNamed(int keyCode) {
  return keyCode <= kSpaceKey || (keyCode >= kPageUpKey && keyCode <= kDownKey) || keyCode == kInsertKey ||
         keyCode == kDeleteKey;
}

/// A key with those held down that the shift state tells.
std::vector<INPUT> InputsOf(int keyCode, int shift) {
  std::vector<WORD> held;
  if (shift & kShift) held.push_back(VK_SHIFT);
  if (shift & kCtrl) held.push_back(VK_CONTROL);
  if (shift & kAlt) held.push_back(VK_MENU);
  const bool byCode = IsNamed(keyCode) || shift != kNoShift;
  const WORD key = byCode ? static_cast<WORD>(keyCode) : WORD{0};
  const WORD character = byCode ? WORD{0} : static_cast<WORD>(keyCode);
  std::vector<INPUT> inputs;
  for (const WORD modifier : held) inputs.push_back(KeyInputOf(modifier, 0, false));
  inputs.push_back(KeyInputOf(key, character, false));
  inputs.push_back(KeyInputOf(key, character, true));
  for (const WORD modifier : held) inputs.push_back(KeyInputOf(modifier, 0, true));
  return inputs;
}

} // namespace

void ClickWindow(HWND window) {
  RECT inside{};
  ::GetClientRect(window, &inside);
  const LPARAM place = MAKELPARAM(inside.right / 2, inside.bottom / 2);
  ::SendMessageW(window, WM_LBUTTONDOWN, MK_LBUTTON, place);
  if (::IsWindow(window)) ::SendMessageW(window, WM_LBUTTONUP, 0, place);
}

BoxAnswers::BoxAnswers()
    : window_(::CreateWindowExW(0, OwnClass(L"QuendraBoxAnswers", Procedure), L"", 0, 0, 0, 0, 0,
                                HWND_MESSAGE, nullptr, ThisProgram(), nullptr)) {
  ::SetWindowLongPtrW(window_, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(this));
}

BoxAnswers::~BoxAnswers() {
  ::SetWindowLongPtrW(window_, GWLP_USERDATA, 0);
  ::DestroyWindow(window_);
}

void BoxAnswers::Expect(SeenBox& seen, int button) {
  awaited_.push_back({&seen, button});
  ::SetTimer(window_, 1, 1, nullptr);
}

FormWindow* BoxAnswers::Standing() {
  FormWindow* found = nullptr;
  ::EnumThreadWindows(::GetCurrentThreadId(), FindBox, reinterpret_cast<LPARAM>(&found));
  return found;
}

void BoxAnswers::Look() {
  FormWindow* const box = Standing();
  if (!box || awaited_.empty()) return;
  const Awaited next = awaited_.front();
  awaited_.erase(awaited_.begin());
  if (awaited_.empty()) ::KillTimer(window_, 1);
  next.seen->content = ContentOf(*box);
  ++next.seen->count;
  for (Control* control : box->TheForm()->Children())
    if (dynamic_cast<CommandButton*>(control) && control->Name() == DecimalText(next.button))
      return ClickWindow(dynamic_cast<const WindowView&>(*control->View()).Window());
}

LRESULT CALLBACK BoxAnswers::Procedure(HWND window, UINT message, WPARAM wParam, LPARAM lParam) noexcept {
  auto* const answers = reinterpret_cast<BoxAnswers*>(::GetWindowLongPtrW(window, GWLP_USERDATA));
  if (!answers || message != WM_TIMER) return ::DefWindowProcW(window, message, wParam, lParam);
  answers->Look();
  return 0;
}

int Win32Driver::Run(std::function<void()> start) {
  const auto limit = desktop_.StartTimer(static_cast<int>(kMostMilliseconds), [this] { desktop_.End(-1); });
  return desktop_.Run(std::move(start));
}

void Win32Driver::Pump() {
  try {
    desktop_.PumpOnce();
  } catch (const ProgramEnded&) {
    // Whoever asked goes on looking.
  }
}

bool Win32Driver::WaitUntil(const std::function<bool()>& condition) {
  const DWORD start = ::GetTickCount();
  while (!condition()) {
    if (::GetTickCount() - start > kMostMilliseconds) return false;
    Pump();
    ::MsgWaitForMultipleObjects(0, nullptr, FALSE, 1, QS_ALLINPUT);
  }
  return true;
}

void Win32Driver::Click(Control& control) {
  if (const auto* view = dynamic_cast<const WindowView*>(control.View())) ClickWindow(view->Window());
}

void Win32Driver::PressKey(Form& form, int keyCode, int shift) {
  const FormWindow* const window = WindowOf(form);
  if (::GetForegroundWindow() != window->Top()) ::SetForegroundWindow(window->Top());
  std::vector<INPUT> inputs = InputsOf(keyCode, shift);
  ::SendInput(static_cast<UINT>(inputs.size()), inputs.data(), sizeof(INPUT));
  Pump();
}

void Win32Driver::PressCloseBox(Form& form) {
  if (const FormWindow* window = WindowOf(form)) ::SendMessageW(window->Top(), WM_SYSCOMMAND, SC_CLOSE, 0);
}

bool Win32Driver::Stands(Form& form) {
  const FormWindow* const window = WindowOf(form);
  return window && window->IsStanding();
}

const Control* Win32Driver::Focused(Form& form) {
  const FormWindow* const window = WindowOf(form);
  return window ? window->ControlWithFocus() : nullptr;
}

} // namespace quendra::forms::win32
