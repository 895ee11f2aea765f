#include "platform/windows/WindowsLoopFixture.h"

#include <algorithm>

namespace quendra::platform::windows {

namespace {

/// A window that sends itself messages must not keep a pump for ever.
constexpr int kMostMessages = 1000;

class Locked {
 public:
  explicit Locked(CRITICAL_SECTION& section) : section_(section) { ::EnterCriticalSection(&section_); }
  ~Locked() { ::LeaveCriticalSection(&section_); }
  Locked(const Locked&) = delete;
  Locked& operator=(const Locked&) = delete;

 private:
  CRITICAL_SECTION& section_;
};

} // namespace

WindowsLoop::WindowsLoop() : arrival_(::CreateEventW(nullptr, FALSE, FALSE, nullptr)) {
  ::InitializeCriticalSection(&arrivedLock_);
}

WindowsLoop::~WindowsLoop() {
  ::DeleteCriticalSection(&arrivedLock_);
  ::CloseHandle(arrival_);
}

void WindowsLoop::Post(std::function<void()> work) {
  const Locked guard(arrivedLock_);
  arrived_.push_back(std::move(work));
  ::SetEvent(arrival_);
}

void WindowsLoop::Collect() {
  const Locked guard(arrivedLock_);
  for (auto& work : arrived_) PostHere(std::move(work));
  arrived_.clear();
}

bool WindowsLoop::PumpSources() {
  MSG message;
  int count = 0;
  while (count < kMostMessages && ::PeekMessageW(&message, nullptr, 0, 0, PM_REMOVE)) {
    ++count;
    ::TranslateMessage(&message);
    ::DispatchMessageW(&message);
  }
  return count > 0;
}

bool WindowsLoop::WaitFor(const std::function<bool()>& condition, int realMilliseconds) {
  const DWORD start = ::GetTickCount();
  const std::int64_t clockAtStart = Now();
  for (;;) {
    const int passed = static_cast<int>(::GetTickCount() - start);
    Advance(static_cast<int>(std::max<std::int64_t>(0, clockAtStart + passed - Now())));
    if (condition()) return true;
    if (passed >= realMilliseconds) return false;
    if (!HasPosted()) ::MsgWaitForMultipleObjects(1, &arrival_, FALSE, 2, QS_ALLINPUT);
    PumpSources();
  }
}

} // namespace quendra::platform::windows
