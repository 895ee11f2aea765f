#include "forms/loop/PostedWork.h"

namespace quendra::forms {

void PostedWork::RunNext(const Run& run) {
  if (waiting_.empty()) return;
  const Work work = std::move(waiting_.front());
  waiting_.pop_front();
  ++taken_;
  run(work);
}

void PostedWork::RunWaiting(const Run& run) {
  const std::uint64_t last = taken_ + waiting_.size();
  while (taken_ < last) RunNext(run);
}

} // namespace quendra::forms
