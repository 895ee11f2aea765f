#include "forms/win32/loop/Win32EventLoop.h"

#include "forms/win32/windows/WindowClass.h"

namespace quendra::forms::win32 {

namespace {

constexpr UINT kWake = WM_APP;
/// Wakes a loop of the system's, such as that of a window's move.
constexpr UINT_PTR kWakeTimer = 0x7FFFFFFF;
/// So that windows that send each other messages without an end let a pump end.
constexpr int kMostMessages = 500;

} // namespace

Win32EventLoop::Win32EventLoop(Dispatcher& dispatcher, Filter filter, std::function<void()> afterEach)
    : dispatcher_(dispatcher), filter_(std::move(filter)), afterEach_(std::move(afterEach)),
      window_(::CreateWindowExW(0, OwnClass(L"QuendraLoop", Procedure), L"", 0, 0, 0, 0, 0, HWND_MESSAGE,
                                nullptr, ThisProgram(), nullptr)) {
  if (!window_) throw Fault(Fault::kOutOfMemory);
  ::SetWindowLongPtrW(window_, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(this));
  timers_.Open(window_);
}

Win32EventLoop::~Win32EventLoop() {
  timers_.Close();
  ::SetWindowLongPtrW(window_, GWLP_USERDATA, 0);
  ::DestroyWindow(window_);
}

void Win32EventLoop::Post(std::function<void()> work) {
  if (arrived_.Add(std::move(work))) Wake();
}

// The system serves posted messages before the user's and before timers: work that posts itself again would
// leave its own loops no time for anything else.
void Win32EventLoop::Wake() {
  constexpr UINT kSoon = 10;
  if (inForeignLoop_ && ::SetTimer(window_, kWakeTimer, kSoon, nullptr)) return;
  ::PostMessageW(window_, kWake, 0, 0);
}

void Win32EventLoop::RunWork() {
  for (PostedWork::Work& work : arrived_.Collect()) posted_.Add(std::move(work));
  posted_.RunWaiting([this](const PostedWork::Work& work) { dispatcher_.Dispatch(work); });
  afterEach_();
}

LRESULT CALLBACK Win32EventLoop::Procedure(HWND window, UINT message, WPARAM wParam, LPARAM lParam) noexcept {
  auto* const loop = reinterpret_cast<Win32EventLoop*>(::GetWindowLongPtrW(window, GWLP_USERDATA));
  if (!loop || (message != kWake && message != WM_TIMER))
    return ::DefWindowProcW(window, message, wParam, lParam);
  try {
    loop->Handle(message, wParam);
  } catch (...) {
    loop->dispatcher_.Dispatch([] { throw; });
  }
  return 0;
}

void Win32EventLoop::Handle(UINT message, WPARAM wParam) {
  if (message == kWake || wParam == kWakeTimer) {
    // Our own loops see the work by themselves: this comes from one of the system's.
    ::KillTimer(window_, kWakeTimer);
    const bool before = std::exchange(inForeignLoop_, true);
    RunWork();
    inForeignLoop_ = before;
    return;
  }
  if (const auto tick = timers_.TickOf(wParam)) dispatcher_.Dispatch(*tick);
}

void Win32EventLoop::Dispatch(const MSG& message) {
  if (message.hwnd == window_ && message.message == kWake) return;
  const bool before = std::exchange(inForeignLoop_, false);
  if (!filter_(message)) {
    ::TranslateMessage(&message);
    ::DispatchMessageW(&message);
  }
  inForeignLoop_ = before;
  afterEach_();
}

bool Win32EventLoop::HandleMessages() {
  MSG message{};
  for (int count = 0; count < kMostMessages; ++count) {
    if (!::PeekMessageW(&message, nullptr, 0, 0, PM_REMOVE)) return true;
    Dispatch(message);
  }
  return false;
}

void Win32EventLoop::PumpOnce() {
  RunWork();
  if (HandleMessages()) gate_.Pumped();
  dispatcher_.UnwindIfEnded();
}

void Win32EventLoop::RunUntil(const std::function<bool()>& done, unsigned leavings) {
  const auto isOver = [&] { return leavings_ != leavings || done(); };
  while (!isOver()) {
    RunWork();
    if (isOver()) return;
    // One message a round, so that what it brought about is seen before the next.
    MSG message{};
    if (::PeekMessageW(&message, nullptr, 0, 0, PM_REMOVE)) Dispatch(message);
    // The look has handled what other threads and programs sent; no message tells of that.
    else if (!isOver() && !arrived_.IsWaiting() && posted_.IsEmpty())
      ::WaitMessage();
  }
}

void Win32EventLoop::LeaveLoops() {
  ++leavings_;
  ::EndMenu(); // else the system's loop would wait for the user
  ::PostMessageW(window_, kWake, 0, 0);
}

} // namespace quendra::forms::win32
