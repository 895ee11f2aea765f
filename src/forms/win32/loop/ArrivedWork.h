#pragma once

#include "winapi/Winapi.h"

#include <atomic>
#include <functional>
#include <vector>

namespace quendra::forms::win32 {

/// Work that other threads give to the loop's, until that one collects it. The compiler's own library has no
/// locks on this system.
class ArrivedWork {
 public:
  using Work = std::function<void()>;

  ArrivedWork() { ::InitializeCriticalSection(&lock_); }
  ~ArrivedWork() { ::DeleteCriticalSection(&lock_); }
  ArrivedWork(const ArrivedWork&) = delete;
  ArrivedWork& operator=(const ArrivedWork&) = delete;

  /// True for the first that waits, for which the loop is to be woken.
  bool Add(Work work);
  std::vector<Work> Collect();
  /// A look without the lock: work that comes at this very moment is seen the next time.
  bool IsWaiting() const { return waits_.load(std::memory_order_relaxed); }

 private:
  CRITICAL_SECTION lock_{};
  std::vector<Work> waiting_;
  std::atomic<bool> waits_ = false;
};

} // namespace quendra::forms::win32
