#include "forms/win32/loop/ArrivedWork.h"

#include <utility>

namespace quendra::forms::win32 {

namespace {

class Locked {
 public:
  explicit Locked(CRITICAL_SECTION& lock) : lock_(lock) { ::EnterCriticalSection(&lock_); }
  ~Locked() { ::LeaveCriticalSection(&lock_); }
  Locked(const Locked&) = delete;
  Locked& operator=(const Locked&) = delete;

 private:
  CRITICAL_SECTION& lock_;
};

} // namespace

bool ArrivedWork::Add(Work work) {
  const Locked locked(lock_);
  waiting_.push_back(std::move(work));
  return !waits_.exchange(true);
}

std::vector<ArrivedWork::Work> ArrivedWork::Collect() {
  const Locked locked(lock_);
  waits_ = false;
  return std::exchange(waiting_, {});
}

} // namespace quendra::forms::win32
