#pragma once

#include "forms/headless/HeadlessDesktop.h"
#include "winapi/Winapi.h"

#include <functional>
#include <vector>

namespace quendra::platform::windows {

/// A headless desktop over a real machine with Windows: it also dispatches the thread's window messages,
/// takes what other threads post and can let real time pass.
class WindowsLoop : public forms::headless::HeadlessDesktop {
 public:
  WindowsLoop();
  ~WindowsLoop() override;

  /// From any thread.
  void Post(std::function<void()> work) override;

  /// Pumps, with the clock following real time, until the condition holds. False when it doesn't hold in
  /// time.
  bool WaitFor(const std::function<bool()>& condition, int realMilliseconds);

 protected:
  void Collect() override;
  /// The window messages that wait when it begins.
  bool PumpSources() override;

 private:
  CRITICAL_SECTION arrivedLock_;
  HANDLE arrival_; ///< is set while something has arrived
  std::vector<std::function<void()>> arrived_;
};

} // namespace quendra::platform::windows
