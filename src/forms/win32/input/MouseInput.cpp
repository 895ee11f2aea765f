#include "forms/win32/input/MouseInput.h"

#include "forms/view/Keyboard.h"

#include <optional>

namespace quendra::forms::win32 {

namespace {

bool IsHeld(int key) { return ::GetKeyState(key) < 0; }

bool IsDouble(UINT message) { return message == WM_LBUTTONDBLCLK || message == WM_RBUTTONDBLCLK; }

std::optional<WindowDrag::MouseEvent> KindOf(UINT message) {
  switch (message) {
  case WM_MOUSEMOVE: return WindowDrag::MouseEvent::Move;
  case WM_LBUTTONDOWN:
  case WM_RBUTTONDOWN:
  case WM_LBUTTONDBLCLK:
  case WM_RBUTTONDBLCLK: return WindowDrag::MouseEvent::Press;
  case WM_LBUTTONUP:
  case WM_RBUTTONUP: return WindowDrag::MouseEvent::Release;
  default: return std::nullopt;
  }
}

int ButtonOf(UINT message) {
  switch (message) {
  case WM_LBUTTONDOWN:
  case WM_LBUTTONDBLCLK:
  case WM_LBUTTONUP: return kLeftButton;
  case WM_RBUTTONDOWN:
  case WM_RBUTTONDBLCLK:
  case WM_RBUTTONUP: return kRightButton;
  default: return kNoButton;
  }
}

Extent SizeOf(HWND window) {
  RECT inside{};
  ::GetClientRect(window, &inside);
  return {inside.right, inside.bottom};
}

Spot MouseOnScreen() {
  POINT mouse{};
  ::GetCursorPos(&mouse);
  return {static_cast<int>(mouse.x), static_cast<int>(mouse.y)};
}

/// The system gives what happens over a disabled window to its container.
bool IsOverDisabledChild(const WindowView& view, Spot place) {
  const HWND child = ::ChildWindowFromPointEx(view.Window(), {place.left, place.top},
                                              CWP_SKIPINVISIBLE | CWP_SKIPTRANSPARENT);
  return child && child != view.Window() && WindowView::Of(child);
}

/// Whether a view looks otherwise under the mouse.
bool ShowsMouse(const WindowView& view) {
  return view.TakesMouse() && view.TheControl() && !view.TheControl()->AsContainer();
}

} // namespace

int ShiftStateNow() { return ShiftSum(IsHeld(VK_SHIFT), IsHeld(VK_CONTROL), IsHeld(VK_MENU)); }

MouseInput::Event MouseInput::EventOf(UINT message, WPARAM wParam, LPARAM lParam) {
  const bool left = wParam & MK_LBUTTON;
  return {message,
          ButtonOf(message),
          ButtonSum(left, wParam & MK_RBUTTON),
          left,
          {static_cast<short>(LOWORD(lParam)), static_cast<short>(HIWORD(lParam))},
          ShiftSum(wParam & MK_SHIFT, wParam & MK_CONTROL, IsHeld(VK_MENU))};
}

bool MouseInput::Takes(WindowView& view, UINT message, WPARAM wParam, LPARAM lParam) {
  if (message == WM_MOUSELEAVE && over_ == &view) Enter(nullptr);
  if (message == WM_CAPTURECHANGED && dragged_) drag_ = {}, dragged_ = nullptr;
  if (!KindOf(message)) return false;
  const bool takes = view.TakesMouse();
  const Event event = EventOf(message, wParam, lParam);
  if (Dragged(event)) return true;
  if (!view.TheControl() || !view.IsEnabled() || IsOverDisabledChild(view, event.place)) return takes;
  Handle(view, event);
  return takes;
}

void MouseInput::Forget(const WindowView& view) {
  if (view.TheControl()) rules_.Forget(*view.TheControl());
  if (moving_ == &view) moving_ = nullptr;
  if (over_ == &view) over_ = nullptr;
}

void MouseInput::SetCursor(HCURSOR cursor) {
  cursor_.Set();
  const Spot mouse = MouseOnScreen();
  WindowView* const view = moving_ ? moving_ : WindowView::Of(::WindowFromPoint({mouse.left, mouse.top}));
  if (!view) return;
  view->cursor = cursor;
  ::SetCursor(cursor);
}

void MouseInput::DragWindow(HWND window, HWND holder) {
  RECT place{};
  ::GetWindowRect(window, &place);
  ::SetCapture(holder);
  dragged_ = window;
  drag_.Start(WindowDrag::By::Desktop, MouseOnScreen(),
              {static_cast<int>(place.left), static_cast<int>(place.top)});
}

bool MouseInput::Dragged(const Event& event) {
  if (!dragged_) return false;
  const bool takes = drag_.Takes(*KindOf(event.message), event.leftHeld);
  if (takes && event.message == WM_MOUSEMOVE) {
    const Spot corner = drag_.WindowAt(MouseOnScreen());
    ::SetWindowPos(dragged_, nullptr, corner.left, corner.top, 0, 0,
                   SWP_NOSIZE | SWP_NOZORDER | SWP_NOACTIVATE);
    return true;
  }
  dragged_ = nullptr;
  ::ReleaseCapture();
  return takes;
}

void MouseInput::Handle(WindowView& view, const Event& event) {
  switch (*KindOf(event.message)) {
  case WindowDrag::MouseEvent::Move: return Moved(view, event);
  case WindowDrag::MouseEvent::Release: return Released(view, event);
  case WindowDrag::MouseEvent::Press: break;
  }
  Control& control = *view.TheControl();
  Pressed(view, event,
          IsDouble(event.message) ? rules_.PressedAgain(control, event.button)
                                  : rules_.Pressed(control, event.button));
}

void MouseInput::Pressed(WindowView& view, const Event& event, MouseRules::Meaning meaning) {
  // Until the button is let go its events come here, wherever the mouse is.
  if (view.TakesMouse()) ::SetCapture(view.Window());
  if (ShowsMouse(view)) view.Invalidate();
  Act(view, event, meaning);
}

void MouseInput::Released(WindowView& view, const Event& event) {
  if (event.held == kNoButton && ::GetCapture() == view.Window() && view.TakesMouse()) ::ReleaseCapture();
  if (ShowsMouse(view)) view.Invalidate();
  const Extent size = SizeOf(view.Window());
  const bool inside = event.place.left >= 0 && event.place.top >= 0 && event.place.left < size.width &&
                      event.place.top < size.height;
  Act(view, event, rules_.Released(*view.TheControl(), event.button, inside));
}

void MouseInput::Act(WindowView& view, const Event& event, MouseRules::Meaning meaning) {
  switch (meaning) {
  case MouseRules::Meaning::Nothing: break;
  case MouseRules::Meaning::Click: view.Press(); break;
  case MouseRules::Meaning::DoubleClick:
    view.Context().dispatcher.Dispatch([&] { view.TheControl()->DoubleClick(); });
    break;
  case MouseRules::Meaning::Press:
    HideRing(view);
    Raise(view, view.TheControl()->MouseDown, event.button, event);
    break;
  }
}

// Who takes the mouse in hand needs no focus ring any more.
void MouseInput::HideRing(const WindowView& view) {
  if (!view.Context().state.usesKeys) return;
  view.Context().state.usesKeys = false;
  if (const WindowView* focused = WindowView::Around(::GetFocus())) focused->Invalidate();
}

void MouseInput::Moved(WindowView& view, const Event& event) {
  Enter(&view);
  cursor_.MoveBegins();
  moving_ = &view;
  Raise(view, view.TheControl()->MouseMove, event.held, event);
  moving_ = nullptr;
  if (!cursor_.MoveEndsIt() || !view.cursor) return;
  view.cursor = nullptr;
  ::SendMessageW(view.Window(), WM_SETCURSOR, reinterpret_cast<WPARAM>(view.Window()),
                 MAKELPARAM(HTCLIENT, WM_MOUSEMOVE));
}

void MouseInput::Enter(WindowView* view) {
  WindowView* const before = std::exchange(over_, view);
  if (before == view) return;
  if (before && ShowsMouse(*before)) before->Invalidate();
  if (!view) return;
  if (ShowsMouse(*view)) view->Invalidate();
  // One that the mouse isn't over, but over a window of the system's in it, would be told at once that it
  // left.
  if (!view->TakesMouse()) return;
  TRACKMOUSEEVENT leaving{sizeof leaving, TME_LEAVE, view->Window(), 0};
  ::TrackMouseEvent(&leaving);
}

void MouseInput::Raise(WindowView& view, const forms::Event<int, int, int, int>& raised, int button,
                       const Event& event) {
  if (!raised) return;
  POINT place{event.place.left, event.place.top};
  ::MapWindowPoints(view.Window(), view.Body(), &place, 1);
  const Spot twips =
      TwipsAt(place.x, place.y, SizeOf(view.Body()).width, view.Context().scale, view.ReadingDirection());
  view.Context().dispatcher.Dispatch([&] { raised(button, event.shift, twips.left, twips.top); });
}

} // namespace quendra::forms::win32
