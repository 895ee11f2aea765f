#pragma once

#include "platform/capture/CaptureAdapters.h"
#include "platform/capture/CaptureCounters.h"

namespace quendra::platform {

/// The source of frames on the adapter of a name, from opening to closing, and the counts of all sources that
/// it has had.
class AdapterSession {
 public:
  AdapterSession(CaptureAdapters& adapters, FrameQueue& queue) : adapters_(adapters), shaper_(queue) {}

  /// Has no source when there is no such adapter that is up or it can't be opened.
  void Open(const std::string& name);
  void Close();

  /// Whether it has a source, be it one that has failed.
  bool HasSource() const { return source_ != nullptr; }
  bool IsLive() const { return HasSource() && !failed_; }
  bool HasFailed() const { return HasSource() && failed_; }
  /// Whether the source before it had failed, too, and no packet came between.
  bool FailsAgain() const { return HasFailed() && failuresInARow_ > 1; }
  /// Whether it is on the adapter that bears the name now.
  bool Follows(const std::string& name) const;

  /// As the source's, which is live.
  int Fill();
  [[nodiscard]] std::unique_ptr<EventLoop::Subscription> Watch(std::function<void()> ready) {
    return source_->Watch(std::move(ready));
  }

  CaptureCounters Counters() const;

 private:
  /// 0 for the name of no adapter.
  unsigned NumberOf(const std::string& name) const;

  CaptureAdapters& adapters_;
  FrameShaper shaper_;
  std::unique_ptr<FrameSource> source_;
  bool failed_ = false;
  int failuresInARow_ = 0;
  unsigned number_ = 0;      // of the adapter that it was opened on, 0 for none
  CaptureCounters counters_; // without what the source that is open has dropped
};

} // namespace quendra::platform
