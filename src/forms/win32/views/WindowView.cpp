#include "forms/win32/views/WindowView.h"

#include "forms/view/Accessible.h"
#include "forms/view/FocusOrder.h"
#include "forms/win32/input/Assistance.h"
#include "forms/win32/input/MouseInput.h"
#include "forms/win32/windows/Composition.h"
#include "forms/win32/windows/WindowClass.h"

namespace quendra::forms::win32 {

namespace {

/// The property of a window under which it keeps its view.
constexpr const wchar_t* kView = L"QuendraView";

/// A window has a property of this name with the control's own behind it, by which other programs find it.
Text MarkOf(const Control& control) { return u"quendra:" + control.Name(); }

/// The window that tells its container something by this message; nullptr for any other message.
HWND SenderOf(HWND container, UINT message, WPARAM wParam, LPARAM lParam) {
  switch (message) {
  case WM_COMMAND: return reinterpret_cast<HWND>(lParam);
  case WM_NOTIFY: return reinterpret_cast<const NMHDR*>(lParam)->hwndFrom;
  case WM_DRAWITEM: return reinterpret_cast<const DRAWITEMSTRUCT*>(lParam)->hwndItem;
  case WM_MEASUREITEM: return ::GetDlgItem(container, static_cast<int>(wParam));
  case WM_CTLCOLOREDIT:
  case WM_CTLCOLORLISTBOX:
  case WM_CTLCOLORBTN:
  case WM_CTLCOLORSCROLLBAR:
  case WM_CTLCOLORSTATIC: return reinterpret_cast<HWND>(lParam);
  default: return nullptr;
  }
}

bool HoldsFocus(HWND window) {
  const HWND focused = ::GetFocus();
  return focused && (focused == window || ::IsChild(window, focused));
}

/// Moves the focus on from a window that can't keep it.
void HandFocusOn(const Form& form, HWND window) {
  if (!HoldsFocus(window)) return;
  const WindowView* const focused = WindowView::Around(::GetFocus());
  const Control* next = NextFocus(form, focused ? focused->TheControl() : nullptr, TabDirection::Forwards);
  const auto* view = dynamic_cast<const WindowView*>((next ? next : &form)->View());
  ::SetFocus(view ? view->Window() : nullptr);
}

} // namespace

WindowView::WindowView(ViewContext& context, Control& control)
    : context_(context), control_(&control), direction_(DirectionOf(control.OwnerForm())),
      mark_(MarkOf(control)) {}

WindowView::~WindowView() {
  context_.mouse.Forget(*this);
  if (!window_) return;
  ::RemovePropW(window_, kView);
  ::RemovePropW(window_, winapi::Wide(mark_));
  if (before_ != ::DefWindowProcW)
    ::SetWindowLongPtrW(window_, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(before_));
  ::DestroyWindow(window_);
}

void WindowView::Create(HWND parent, const wchar_t* windowClass, DWORD style, DWORD extendedStyle) {
  const bool own = !windowClass;
  if (own) windowClass = OwnClass(L"QuendraControl", Procedure, CS_DBLCLKS);
  // Numbers tell apart the windows of one container that speak of themselves before they have a view.
  const auto number = reinterpret_cast<HMENU>(context_.state.windows += 1);
  window_ =
      ::CreateWindowExW(extendedStyle, windowClass, L"", WS_CHILD | WS_CLIPSIBLINGS | WS_CLIPCHILDREN | style,
                        0, 0, 0, 0, parent, number, ThisProgram(), nullptr);
  if (!window_) throw Fault(Fault::kOutOfMemory);
  before_ = ::DefWindowProcW;
  ::SetPropW(window_, kView, this);
  ::SetPropW(window_, winapi::Wide(mark_), window_);
  if (!own)
    before_ = reinterpret_cast<WNDPROC>(
        ::SetWindowLongPtrW(window_, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(Procedure)));
  // The system puts a new child behind its siblings.
  ::SetWindowPos(window_, HWND_TOP, 0, 0, 0, 0, SWP_NOMOVE | SWP_NOSIZE | SWP_NOACTIVATE);
}

WindowView* WindowView::Of(HWND window) {
  // Another run of the program marks its windows by the same name.
  if (!window || ::GetWindowThreadProcessId(window, nullptr) != ::GetCurrentThreadId()) return nullptr;
  return static_cast<WindowView*>(::GetPropW(window, kView));
}

WindowView* WindowView::Around(HWND window) {
  while (window && !Of(window)) window = ::GetAncestor(window, GA_PARENT);
  return Of(window);
}

void WindowView::Release() {
  if (!control_) return;
  control_->Attach(nullptr);
  ControlGone();
}

void WindowView::ControlGone() {
  ForgetPlace();
  context_.mouse.Forget(*this);
  control_ = nullptr;
}

void WindowView::Changed(Aspect aspect) {
  if (!control_) return;
  if (Concerns(aspect, Aspect::Geometry)) PutInPlace();
  if (Concerns(aspect, Aspect::Font)) ShareFont();
  if (Concerns(aspect, Aspect::Enabled)) Enable();
  if (aspect == Aspect::Order)
    ::SetWindowPos(window_, HWND_TOP, 0, 0, 0, 0, SWP_NOMOVE | SWP_NOSIZE | SWP_NOACTIVATE);
  Apply(aspect);
  if (Concerns(aspect, Aspect::Caption)) TellName();
  if (Concerns(aspect, Aspect::Visible)) Show();
  if (aspect != Aspect::Tag) Invalidate();
}

void WindowView::ShareFont() const {
  if (before_ == ::DefWindowProcW) return;
  const HFONT font = context_.fonts.FontOf(control_->TextFont(), context_.scale);
  ::SendMessageW(window_, WM_SETFONT, reinterpret_cast<WPARAM>(font), TRUE);
}

void WindowView::Enable() {
  if (!control_->Enabled()) HandFocusOn(control_->OwnerForm(), window_);
  ::EnableWindow(window_, control_->Enabled());
  // No handler is asked any more, so the hand of a button that was under the mouse would stay.
  if (!control_->Enabled()) cursor = nullptr;
}

void WindowView::TellName() { ::SetWindowTextW(window_, winapi::Wide(AccessibleOf(*control_).name)); }

Area WindowView::Place() const {
  const int container = control_->Parent()->Position().width;
  return PlaceOf(control_->Position(), container, context_.scale, PlacingOf(*control_));
}

void WindowView::PutInPlace() { MoveTo(Place()); }

void WindowView::MoveTo(const Area& place) {
  if (place == windowPlace_) return;
  windowPlace_ = place;
  ForgetPlace();
  // What it showed at its old place lets other things shine through.
  ::SetWindowPos(window_, nullptr, place.corner.left, place.corner.top, place.extent.width,
                 place.extent.height, SWP_NOZORDER | SWP_NOACTIVATE | SWP_NOCOPYBITS);
  ForgetPlace();
}

void WindowView::Show() {
  if (!control_->Visible()) HandFocusOn(control_->OwnerForm(), window_);
  if (control_->Visible()) TellName();
  ::ShowWindow(window_, control_->Visible() ? SW_SHOWNA : SW_HIDE);
}

std::optional<Area> WindowView::ForgetPlace() const {
  const WindowView* const form =
      control_ ? dynamic_cast<const WindowView*>(control_->OwnerForm().View()) : nullptr;
  if (!form) return std::nullopt;
  RECT window{};
  ::GetWindowRect(window_, &window);
  ::MapWindowPoints(nullptr, form->Body(), reinterpret_cast<POINT*>(&window), 2);
  const Area place{
      {static_cast<int>(window.left), static_cast<int>(window.top)},
      {static_cast<int>(window.right - window.left), static_cast<int>(window.bottom - window.top)}};
  context_.state.picture.Forget(place);
  return place;
}

void WindowView::Invalidate() const {
  const auto place = ForgetPlace();
  if (!place || !::IsWindowVisible(window_)) return;
  const RECT due{place->corner.left, place->corner.top, place->Right(), place->Bottom()};
  const auto* form = static_cast<const WindowView*>(control_->OwnerForm().View());
  ::RedrawWindow(form->Body(), &due, nullptr, RDW_INVALIDATE | RDW_ALLCHILDREN | RDW_NOERASE);
}

void WindowView::Repaint() {
  ForgetPlace();
  ::RedrawWindow(window_, nullptr, nullptr, RDW_INVALIDATE | RDW_ALLCHILDREN | RDW_NOERASE | RDW_UPDATENOW);
}

void WindowView::Press() {
  context_.dispatcher.Dispatch([this] {
    if (control_ && control_->IsUsable()) control_->Click();
  });
}

bool WindowView::IsEnabled() const {
  for (const Control* part = control_; part; part = part->Parent())
    if (!part->Enabled()) return false;
  return control_;
}

bool WindowView::HasFocus() const { return window_ && Around(::GetFocus()) == this; }

bool WindowView::IsUnderMouse() const { return context_.mouse.IsOver(*this); }

bool WindowView::IsHeldDown() const { return IsUnderMouse() && ::GetKeyState(VK_LBUTTON) < 0; }

LRESULT WindowView::PassOn(UINT message, WPARAM wParam, LPARAM lParam) {
  return ::CallWindowProcW(before_, window_, message, wParam, lParam);
}

std::optional<LRESULT> WindowView::Answer(UINT, WPARAM, LPARAM) { return std::nullopt; }

std::optional<LRESULT> WindowView::AnswerReflected(UINT, WPARAM, LPARAM) { return std::nullopt; }

LRESULT CALLBACK WindowView::Procedure(HWND window, UINT message, WPARAM wParam, LPARAM lParam) noexcept {
  WindowView* const view = Of(window);
  if (!view) return ::DefWindowProcW(window, message, wParam, lParam);
  const Work work(*view);
  try {
    return view->Handle(message, wParam, lParam);
  } catch (...) {
    view->context_.dispatcher.Dispatch([] { throw; });
    return 0;
  }
}

LRESULT WindowView::Handle(UINT message, WPARAM wParam, LPARAM lParam) {
  if (WindowView* const sender = Of(SenderOf(window_, message, wParam, lParam))) {
    const Work work(*sender);
    if (const auto answer = sender->AnswerReflected(message, wParam, lParam)) return *answer;
  }
  if (const auto answer = AnswerCommonly(message, wParam, lParam)) return *answer;
  if (const auto answer = Answer(message, wParam, lParam)) return *answer;
  return PassOn(message, wParam, lParam);
}

void WindowView::HearForTip(HWND window, UINT message, LPARAM lParam) const {
  const bool asks = message == WM_MOUSEMOVE || message == WM_MOUSEHOVER;
  const bool ofMouse = message >= WM_MOUSEFIRST && message <= WM_MOUSELAST;
  if (!control_ || !(asks || ofMouse || message == WM_MOUSELEAVE)) return;
  context_.state.tip.Hear(window, message, asks ? TipAt(window, PlainPlace(window, lParam)) : Text());
}

std::optional<LRESULT> WindowView::AnswerCommonly(UINT message, WPARAM wParam, LPARAM lParam) {
  if (message == WM_NCDESTROY) return Forget(wParam, lParam);
  const bool taken = context_.mouse.Takes(*this, message, wParam, lParam);
  HearForTip(window_, message, lParam);
  if (taken) return 0;
  switch (message) {
  case WM_SETFOCUS:
    Invalidate();
    if (control_ && !context_.state.focusComesBack) FocusCame();
    break;
  case WM_KILLFOCUS:
  case WM_ENABLE: Invalidate(); break;
  case WM_SETCURSOR: return ShowCursorAt(wParam, lParam);
  default: break;
  }
  return before_ == ::DefWindowProcW ? AnswerAsOwn(message, lParam) : std::nullopt;
}

std::optional<LRESULT> WindowView::AnswerAsOwn(UINT message, LPARAM lParam) {
  if (const auto answer = AnswerAssistance(*this, message, lParam)) return answer;
  if (message == WM_ERASEBKGND) return 1;
  if (message != WM_PAINT || !control_) return std::nullopt;
  PaintWindow(*this);
  return 0;
}

std::optional<LRESULT> WindowView::ShowCursorAt(WPARAM wParam, LPARAM lParam) const {
  if (!cursor || reinterpret_cast<HWND>(wParam) != window_ || LOWORD(lParam) != HTCLIENT) return std::nullopt;
  ::SetCursor(cursor);
  return TRUE;
}

LRESULT WindowView::Forget(WPARAM wParam, LPARAM lParam) {
  const LRESULT answer = PassOn(WM_NCDESTROY, wParam, lParam);
  window_ = nullptr;
  return answer;
}

void PlaceChildren(const Container& container) {
  for (const Control* child : container.Children())
    if (child->View()) child->View()->Changed(Aspect::Geometry);
}

} // namespace quendra::forms::win32
