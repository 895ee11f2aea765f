#include "forms/win32/Win32Desktop.h"

#include "forms/win32/boxes/Boxes.h"
#include "winapi/SystemLibrary.h"

#include <algorithm>
#include <iterator>

namespace quendra::forms::win32 {

namespace {

Scale ScaleOfScreen() {
  const HDC screen = ::GetDC(nullptr);
  const Scale scale{1440.0 / ::GetDeviceCaps(screen, LOGPIXELSX),
                    1440.0 / ::GetDeviceCaps(screen, LOGPIXELSY)};
  ::ReleaseDC(nullptr, screen);
  return scale;
}

bool IsDense(const Scale& scale) {
  constexpr double kTwipsOfOrdinaryPixel = 15;
  return scale.twipsPerPixelX * 2 <= kTwipsOfOrdinaryPixel;
}

/// A handler may hold the thread for a while and show its progress by Repaint. The system would take such a
/// program for a hung one and lay a blank picture over its windows.
void KeepWindowsInSight() {
  const winapi::SystemLibrary user(L"user32.dll");
  using Keep = void WINAPI();
  if (Keep* const keep = user.Find<Keep>("DisableProcessWindowsGhosting")) keep();
}

} // namespace

Win32Desktop::Win32Desktop()
    : dispatcher_([this](const Text& text) { ShowBox(text, kCritical, u"Quendra"); },
                  [this](int) { loop_.LeaveLoops(); }),
      scale_(ScaleOfScreen()), pictures_(IsDense(scale_)),
      startTimer_([this](int milliseconds, auto tick) { return StartTimer(milliseconds, std::move(tick)); }),
      context_{*this, dispatcher_, scale_, pictures_, fonts_, mouse_, startTimer_, active_, state_},
      drawing_(scale_, fonts_),
      loop_(
          dispatcher_, [this](const MSG& message) { return keys_.Takes(message); }, [this] { TidyUp(); }) {
  KeepWindowsInSight();
}

Win32Desktop::~Win32Desktop() = default;

int Win32Desktop::Run(std::function<void()> start) {
  const unsigned leavings = loop_.Leavings();
  if (start) Post(std::move(start));
  if (!dispatcher_.Ended()) loop_.RunUntil([] { return false; }, leavings);
  while (!windows_.empty()) Close(*windows_.begin()->second);
  Bury();
  return dispatcher_.Status();
}

Waiter Win32Desktop::WaiterFromNow() {
  return [this, leavings = loop_.Leavings()](const std::function<bool()>& done) {
    loop_.RunUntil(done, leavings);
  };
}

int Win32Desktop::ShowBox(const Text& text, int flags, const Text& title) {
  return win32::ShowBox(context_, FormWindow::Front(), BoxContentOf(text, flags, title), WaiterFromNow());
}

int Win32Desktop::MessageBox(const Text& text, int flags, const Text& title) {
  const Standing box(*this);
  const int answer = ShowBox(text, flags, title);
  dispatcher_.UnwindIfEnded();
  return answer;
}

CursorHandle Win32Desktop::LoadCursor(int id) {
  const HCURSOR cursor = ::LoadCursorW(nullptr, MAKEINTRESOURCEW(id));
  return CursorHandle(static_cast<std::uint32_t>(reinterpret_cast<UINT_PTR>(cursor)));
}

void Win32Desktop::SetCursor(CursorHandle cursor) {
  if (cursor != kNoCursor) mouse_.SetCursor(reinterpret_cast<HCURSOR>(static_cast<UINT_PTR>(cursor.Value())));
}

WindowHandle Win32Desktop::HandleOf(Form& form) {
  const FormWindow* window = WindowOf(form);
  return window ? window->Handle() : kNoWindow;
}

FormWindow* Win32Desktop::WindowOf(WindowHandle window) const {
  const auto found = windows_.find(window);
  return found == windows_.end() ? nullptr : found->second.get();
}

std::int32_t Win32Desktop::SendMessage(WindowHandle window, std::uint32_t message, std::uint32_t wParam,
                                       std::uint32_t lParam) {
  return Windows.Dispatch(window, message, wParam, lParam);
}

std::uint32_t Win32Desktop::RegisterWindowMessageA(const std::string& name) {
  return ::RegisterWindowMessageW(winapi::Wide(FromCodePage(name)));
}

std::int32_t Win32Desktop::HandleMessage(WindowHandle window, std::uint32_t message, std::uint32_t wParam) {
  FormWindow* view = WindowOf(window);
  if (!view || message != WM_NCLBUTTONDOWN || wParam != HTCAPTION) return 0;
  mouse_.DragWindow(view->Top(), view->Body());
  return 0;
}

RegionHandle Win32Desktop::CreateRoundRectRgn(int left, int top, int right, int bottom, int ellipseWidth,
                                              int ellipseHeight) {
  const RegionHandle handle(++lastRegion_);
  regions_[handle] = {left, top, right, bottom, ellipseWidth, ellipseHeight};
  return handle;
}

void Win32Desktop::SetWindowRgn(WindowHandle window, RegionHandle region, bool redraw) {
  FormWindow* view = WindowOf(window);
  if (!view) return;
  // A window owns the region that it was given, so the handle ends here; none takes the shape away.
  const auto found = regions_.extract(region);
  view->Shape(found ? std::optional(found.mapped()) : std::nullopt, redraw);
}

bool Win32Desktop::SetWindowPos(WindowHandle window, InsertAfter insertAfter, int x, int y, int /*cx*/,
                                int /*cy*/, unsigned flags) {
  FormWindow* view = WindowOf(window);
  if (!view || !(flags & kKeepsSize)) return false;
  if (!(flags & kKeepsOrder)) view->PutAfter(insertAfter);
  if (!(flags & kKeepsPlace)) view->MoveToScreen({x, y});
  return true;
}

void Win32Desktop::Repaint(Control& control) {
  if (auto* view = dynamic_cast<WindowView*>(control.View())) view->Repaint();
}

void Win32Desktop::CreateView(Form& form) {
  using Procedure = WindowProcedure::element_type;
  const WindowHandle handle = Windows.Add(std::make_shared<Procedure>(
      [this](WindowHandle sentTo, std::uint32_t message, std::uint32_t wParam, std::uint32_t /*lParam*/) {
        return HandleMessage(sentTo, message, wParam);
      }));
  auto window = std::make_unique<FormWindow>(context_, form, handle);
  FormWindow* const view = window.get();
  windows_[handle] = std::move(window);
  form.Attach(view);
}

void Win32Desktop::DestroyView(Form& form) {
  if (FormWindow* window = WindowOf(form)) Close(*window);
}

void Win32Desktop::Close(FormWindow& window) {
  Windows.Remove(window.Handle());
  // Its end comes later: a message of this window may be what led here.
  auto entry = windows_.extract(window.Handle());
  closed_.push_back(std::move(entry.mapped()));
  window.Release();
}

void Win32Desktop::TidyUp() {
  if (FormWindow* active = FormWindow::Around(::GetActiveWindow())) active->KeepFocus();
  Bury();
}

// Windows that go tell others, whose handlers may close more of them.
void Win32Desktop::Bury() {
  if (closed_.empty()) return;
  const auto unused =
      std::partition(closed_.begin(), closed_.end(), [](const auto& window) { return window->IsInUse(); });
  const std::vector<std::unique_ptr<FormWindow>> buried(std::make_move_iterator(unused),
                                                        std::make_move_iterator(closed_.end()));
  closed_.erase(unused, closed_.end());
}

void Win32Desktop::ShowView(Form& form, Modality modality, Form* owner) {
  FormWindow* window = WindowOf(form);
  if (!window) return;
  const Waiter wait = WaiterFromNow();
  FormWindow* const over = owner ? WindowOf(*owner) : nullptr;
  if (modality == Modality::Modeless)
    window->ShowOver(over);
  else
    window->RunModal(over, wait);
  dispatcher_.UnwindIfEnded();
}

// After what the handler does next: a program that shows another form at once goes on.
void Win32Desktop::LastFormGone() {
  Post([this] {
    if (windows_.empty()) dispatcher_.Quit(0);
  });
}

} // namespace quendra::forms::win32
