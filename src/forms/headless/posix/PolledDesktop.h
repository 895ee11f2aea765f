#pragma once

#include "forms/headless/HeadlessDesktop.h"
#include "platform/DescriptorWatch.h"

#include <mutex>

namespace quendra::forms::headless {

/// A headless desktop over a real machine, on systems with descriptors: it also watches descriptors, takes
/// what other threads post and can let real time pass.
class PolledDesktop : public HeadlessDesktop, public platform::DescriptorWatch {
 public:
  /// From any thread.
  void Post(std::function<void()> work) override;
  std::unique_ptr<Subscription> WatchDescriptor(int descriptor, std::function<void()> ready) override;

  /// Pumps, with the clock following real time, until the condition holds. False when it doesn't hold in
  /// time.
  bool WaitFor(const std::function<bool()>& condition, int realMilliseconds);

 protected:
  void Collect() override;
  /// Each descriptor that can be read, once.
  bool PumpSources() override { return PumpDescriptors(0); }

 private:
  struct Watch {
    const int descriptor;
    const std::function<void()> ready;
  };

  bool PumpDescriptors(int realMilliseconds);

  std::mutex arrivedLock_;
  std::vector<PostedWork::Work> arrived_;
  std::vector<std::weak_ptr<Watch>> watches_;
};

} // namespace quendra::forms::headless
