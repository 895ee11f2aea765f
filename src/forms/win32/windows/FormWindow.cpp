#include "forms/win32/windows/FormWindow.h"

#include "forms/view/VisibleText.h"
#include "forms/win32/input/MouseInput.h"

#include <algorithm>
#include <utility>

namespace quendra::forms::win32 {

namespace {

DWORD StyleOf(const Form& form) {
  const DWORD boxes = (form.MinimizeBox ? WS_MINIMIZEBOX : 0UL) | (form.MaximizeBox ? WS_MAXIMIZEBOX : 0UL);
  switch (form.Border) {
  case BorderStyle::None: return WS_POPUP;
  case BorderStyle::FixedDialog: return WS_POPUP | WS_CAPTION | WS_SYSMENU;
  case BorderStyle::Sizable: return WS_POPUP | WS_CAPTION | WS_SYSMENU | WS_THICKFRAME | boxes;
  case BorderStyle::FixedSingle: break;
  }
  return WS_POPUP | WS_CAPTION | WS_SYSMENU | boxes;
}

DWORD ExtendedStyleOf(const Form& form) {
  DWORD style = form.Border == BorderStyle::FixedDialog ? WS_EX_DLGMODALFRAME : WS_EX_APPWINDOW;
  // What stands in the window is placed by us, and its pictures are not mirrored.
  if (form.RightToLeft) style |= WS_EX_LAYOUTRTL | WS_EX_NOINHERITLAYOUT;
  return style;
}

/// Finds the foremost form that stands and that nothing blocks.
BOOL CALLBACK FindOpen(HWND window, LPARAM found) noexcept {
  if (!::IsWindowVisible(window) || !::IsWindowEnabled(window)) return TRUE;
  FormWindow*& open = *reinterpret_cast<FormWindow**>(found);
  open = FormWindow::Around(window);
  return !open;
}

/// The owner of a window for as long as this lives. The system destroys what a window owns with it.
class Ownership {
 public:
  Ownership(HWND window, HWND owner) : window_(window) { Set(owner); }
  ~Ownership() { Set(nullptr); }
  Ownership(const Ownership&) = delete;
  Ownership& operator=(const Ownership&) = delete;

 private:
  void Set(HWND owner) const {
    ::SetWindowLongPtrW(window_, GWLP_HWNDPARENT, reinterpret_cast<LONG_PTR>(owner));
  }
  HWND window_;
};

/// The block of a modal form, where the form finds it to end it early, for as long as this lives.
class Standing {
 public:
  Standing(ModalBlock*& where, ModalBlock& block) : where_(where) { where_ = &block; }
  ~Standing() { where_ = nullptr; }
  Standing(const Standing&) = delete;
  Standing& operator=(const Standing&) = delete;

 private:
  ModalBlock*& where_;
};

} // namespace

FormWindow::FormWindow(const ViewContext& desktops, Form& form, WindowHandle handle, ViewMaker makeView)
    : FormContext(desktops), TopWindow(StyleOf(form), ExtendedStyleOf(form)), WindowView(shared_, form),
      handle_(handle), scroll_(Top()) {
  Create(Top());
  ::ShowWindow(Window(), SW_SHOWNA);
  AddViews(form, Body(), makeView);
}

// Windows that go tell those around them; nothing of it gets here any more.
FormWindow::~FormWindow() {
  Hide();
  Silence();
  views_.clear();
}

// NOLINTNEXTLINE(misc-no-recursion): as deep as controls stand in one another.
void FormWindow::AddViews(const Container& container, HWND parent, ViewMaker makeView) {
  for (Control* child : container.Children()) {
    MadeView made = makeView(shared_, *child, parent);
    if (!made.view) continue;
    View* const view = made.view.get();
    views_.push_back(std::move(made.view));
    if (made.window) windows_.push_back(made.window);
    child->Attach(view);
    if (const Container* inner = child->AsContainer()) AddViews(*inner, made.window->Body(), makeView);
  }
}

FormWindow* FormWindow::Around(HWND window) {
  const HWND top = window ? ::GetAncestor(window, GA_ROOT) : nullptr;
  return top ? dynamic_cast<FormWindow*>(WindowView::Of(::GetWindow(top, GW_CHILD))) : nullptr;
}

FormWindow* FormWindow::Front() {
  if (FormWindow* active = Around(::GetActiveWindow())) return active;
  FormWindow* front = nullptr;
  ::EnumThreadWindows(::GetCurrentThreadId(), FindOpen, reinterpret_cast<LPARAM>(&front));
  return front;
}

bool FormWindow::IsInUse() const {
  return IsAtWork() || std::any_of(windows_.begin(), windows_.end(),
                                   [](const WindowView* view) { return view->IsAtWork(); });
}

void FormWindow::Release() {
  if (!TheControl()) return;
  Context().active.Forget(*TheForm());
  for (const auto& view : views_) view->Release();
  WindowView::Release();
}

void FormWindow::ControlGone() {
  Context().active.Forget(*TheControl());
  WindowView::ControlGone();
  Hide();
}

void FormWindow::Hide() {
  if (block_) block_->Lift();
  state_.tip.Hide();
  ::ShowWindow(Top(), SW_HIDE);
}

void FormWindow::Paint(Drawing& drawing) { drawing.Fill(drawing.Clip(), TheForm()->BackColour()); }

void FormWindow::Apply(Aspect aspect) {
  if (Concerns(aspect, Aspect::Caption))
    ::SetWindowTextW(Top(), winapi::Wide(VisibleText(TheForm()->Caption())));
  if (aspect != Aspect::Geometry) return;
  PlaceChildren(*TheForm());
  if (IsStanding()) ComeOnScreen();
}

void FormWindow::PutInPlace() {
  const Geometry place = TheForm()->Position();
  const Scale laidOut = scale_.Unzoomed();
  const Extent screen = UsableScreen().extent;
  const Extent frame = Frame();
  const Extent room{screen.width - frame.width, screen.height - frame.height};
  const Fitting fitting = FittingScale({laidOut.PixelsX(place.width), laidOut.PixelsY(place.height)}, room);
  Zoom(fitting.scale);
  const Extent shown{scale_.PixelsX(place.width), scale_.PixelsY(place.height)};
  const Extent inside = WindowExtent(shown, room, ::GetSystemMetrics(SM_CXVSCROLL));
  ::SetWindowPos(Top(), nullptr, 0, 0, inside.width + frame.width, inside.height + frame.height,
                 SWP_NOMOVE | SWP_NOZORDER | SWP_NOACTIVATE);
  scroll_.Lay(Body(), shown, fitting.scrolls);
}

void FormWindow::Zoom(double factor) {
  if (factor == scale_.zoom) return;
  scale_ = scale_.Unzoomed().Zoomed(factor);
  for (const auto& view : views_) {
    view->Changed(Aspect::Font);
    view->Changed(Aspect::Geometry);
  }
  CutOut(true);
}

void FormWindow::Shape(std::optional<RoundRect> shape, bool redraw) {
  shape_ = shape;
  CutOut(redraw);
}

void FormWindow::CutOut(bool redraw) {
  HRGN region = nullptr;
  if (shape_) {
    const RoundRect cut = shape_->In(scale_);
    // The system leaves out one more row and column than it does with other shapes.
    region = ::CreateRoundRectRgn(cut.left, cut.top, cut.right + 1, cut.bottom + 1, cut.ellipseWidth,
                                  cut.ellipseHeight);
  }
  // The window owns it from now on, unless it doesn't take it.
  if (!::SetWindowRgn(Top(), region, redraw) && region) ::DeleteObject(region);
}

void FormWindow::PutAfter(InsertAfter place) {
  const auto before = reinterpret_cast<HWND>(static_cast<INT_PTR>(place));
  ::SetWindowPos(Top(), before, 0, 0, 0, 0, SWP_NOMOVE | SWP_NOSIZE | SWP_NOACTIVATE);
}

void FormWindow::MoveToScreen(Spot corner) {
  ::SetWindowPos(Top(), nullptr, corner.left, corner.top, 0, 0, SWP_NOSIZE | SWP_NOZORDER | SWP_NOACTIVATE);
}

void FormWindow::CentreOver(const Area& over) {
  MoveToScreen(CornerOver(OnScreen().extent, over, UsableScreen()));
}

void FormWindow::ComeOnScreen() {
  const Area window = OnScreen();
  const Spot corner = CornerOnScreen(window, UsableScreen());
  if (corner != window.corner) MoveToScreen(corner);
}

void FormWindow::Refit() {
  if (!TheForm() || ::IsIconic(Top())) return;
  PutInPlace();
  ComeOnScreen();
}

// Showing is the desktop's, which knows how and over what; hiding is the form's own.
void FormWindow::Show() {
  if (!TheForm()->Visible()) Hide();
}

void FormWindow::ShowOver(const TopWindow* owner) {
  const Work work(*this);
  if (!std::exchange(wasPlaced_, true)) {
    const Area screen = UsableScreenRound(owner ? owner->Top() : nullptr);
    MoveToScreen(screen.corner);
    PutInPlace();
    // A minimised owner lies far off its screen.
    CentreOver(owner && !::IsIconic(owner->Top()) ? owner->OnScreen() : screen);
  }
  // Handlers and descriptions, which count for a name, are plain members.
  if (!IsStanding())
    for (WindowView* view : windows_) view->Changed(Aspect::Caption);
  const bool first = !std::exchange(hadFocus_, true);
  ::ShowWindow(Top(), ::IsIconic(Top()) ? SW_RESTORE : SW_SHOW);
  ::SetForegroundWindow(Top());
  if (first) FocusFirst();
}

void FormWindow::RunModal(FormWindow* owner, const Waiter& wait) {
  const Work work(*this);
  // The owner may be closed meanwhile; its window stays until this one can do without.
  std::optional<Work> ownersWork;
  if (owner) ownersWork.emplace(*owner);
  const Ownership ownership(Top(), owner ? owner->Top() : nullptr);
  ModalBlock block(Top());
  const Standing standing(block_, block);
  // Who opens a form by the keyboard sees the ring at its first stop, too.
  if (owner) state_.usesKeys = owner->state_.usesKeys;
  ShowOver(owner);
  wait([this] { return !TheForm() || !TheForm()->Visible(); });
}

void FormWindow::FocusFirst() {
  const Control* const first = TheForm() ? FirstFocus(*TheForm()) : nullptr;
  const auto* view = first ? dynamic_cast<const WindowView*>(first->View()) : nullptr;
  ::SetFocus(view ? view->Window() : Body());
}

const Control* FormWindow::ControlWithFocus() const {
  const HWND focused = ::GetActiveWindow() == Top() ? ::GetFocus() : lastFocus_;
  const WindowView* const view = ::IsChild(Top(), focused) ? WindowView::Around(focused) : nullptr;
  return view && view != this ? view->TheControl() : nullptr;
}

void FormWindow::MoveFocus(TabDirection direction) {
  if (!TheForm()) return;
  const Control* const next = NextFocus(*TheForm(), ControlWithFocus(), direction);
  const auto* view = next ? dynamic_cast<const WindowView*>(next->View()) : nullptr;
  if (!view) return;
  ::SetFocus(view->Window());
  view->Invalidate();
  RECT place{};
  ::GetWindowRect(view->Window(), &place);
  ::MapWindowPoints(nullptr, Body(), reinterpret_cast<POINT*>(&place), 2);
  scroll_.BringIntoView(
      {{static_cast<int>(place.left), static_cast<int>(place.top)},
       {static_cast<int>(place.right - place.left), static_cast<int>(place.bottom - place.top)}});
}

void FormWindow::RestoreFocus() {
  const bool keeps = lastFocus_ && ::IsChild(Top(), lastFocus_) && ::IsWindowVisible(lastFocus_) &&
                     ::IsWindowEnabled(lastFocus_);
  const bool before = std::exchange(state_.focusComesBack, true);
  ::SetFocus(keeps ? lastFocus_ : Body());
  state_.focusComesBack = before;
}

void FormWindow::KeepFocus() {
  const HWND focused = ::GetFocus();
  if (!::IsChild(Top(), focused)) return;
  // What stands inside a view's window is made anew where a field turns.
  const WindowView* const view = WindowView::Around(focused);
  lastFocus_ = view ? view->Window() : focused;
}

void FormWindow::Activated(bool active, bool minimised) {
  if (!active) KeepFocus();
  if (active && !minimised) RestoreFocus();
  if (!TheForm()) return;
  Context().dispatcher.Dispatch([&] {
    if (active)
      Context().active.Activate(*TheForm());
    else
      Context().active.Deactivate(*TheForm());
  });
}

void FormWindow::Close() {
  // The system's own lists of windows would close one that waits behind a modal one, too.
  if (!::IsWindowEnabled(Top())) return;
  Context().dispatcher.Dispatch([this] {
    if (OnClose) return OnClose();
    if (TheForm()) Context().desktop.Unload(*TheForm());
  });
}

void FormWindow::PaintGround() {
  PAINTSTRUCT paint{};
  const HDC device = ::BeginPaint(Top(), &paint);
  ::SetDCBrushColor(device, TheForm() ? TheForm()->BackColour() : kWhite);
  ::FillRect(device, &paint.rcPaint, static_cast<HBRUSH>(::GetStockObject(DC_BRUSH)));
  ::EndPaint(Top(), &paint);
}

std::optional<LRESULT> FormWindow::AnswerTop(UINT message, WPARAM wParam, LPARAM lParam) {
  const Work work(*this);
  switch (message) {
  case WM_CLOSE: Close(); return 0;
  case WM_ACTIVATE: Activated(LOWORD(wParam) != WA_INACTIVE, HIWORD(wParam) != 0); return 0;
  case WM_SETFOCUS: RestoreFocus(); return 0;
  case WM_ERASEBKGND: return 1;
  case WM_PAINT: PaintGround(); return 0;
  case WM_ENABLE:
    // No leaving is told of a control while another window keeps the user from it.
    if (!wParam) Context().mouse.Leave();
    break;
  case WM_DISPLAYCHANGE:
  case WM_THEMECHANGED: Refit(); break;
  case WM_SETTINGCHANGE:
    if (wParam == SPI_SETWORKAREA || wParam == SPI_SETNONCLIENTMETRICS) Refit();
    break;
  default:
    if (lParam == 0 || message == WM_MOUSEWHEEL)
      if (scroll_.Takes(message, wParam)) return 0;
    break;
  }
  return std::nullopt;
}

void FormWindow::ReportThrown() noexcept {
  Context().dispatcher.Dispatch([] { throw; });
}

} // namespace quendra::forms::win32
