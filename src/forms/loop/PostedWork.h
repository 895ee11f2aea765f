#pragma once

#include <cstdint>
#include <deque>
#include <functional>

namespace quendra::forms {

/// The work that a loop was given to run, oldest first. One thread: a desktop that takes work from other
/// threads collects it where it may lock and hands it over here.
class PostedWork {
 public:
  using Work = std::function<void()>;
  /// Runs one piece of work, as the desktop's dispatcher does.
  using Run = std::function<void(const Work&)>;

  void Add(Work work) { waiting_.push_back(std::move(work)); }
  bool IsEmpty() const { return waiting_.empty(); }

  /// The oldest, for a toolkit that gives each piece of work its turn between other events.
  void RunNext(const Run& run);
  /// Whatever was added before the call. What it adds in turn waits for the next call, so that work that
  /// posts itself again lets a pump end. Work that pumps lets the work after it run first.
  void RunWaiting(const Run& run);

 private:
  std::deque<Work> waiting_;
  std::uint64_t taken_ = 0;
};

} // namespace quendra::forms
