#pragma once

#include "platform/process/Processes.h"

namespace quendra::monitor {

/// A handle that is closed when its owner goes; one that stands for nothing is left alone.
class OwnedHandle {
 public:
  OwnedHandle(platform::Processes& processes, platform::Handle handle)
      : processes_(processes), handle_(handle) {}
  ~OwnedHandle() {
    if (handle_ != platform::kNoHandle && handle_ != platform::kInvalidHandle)
      processes_.CloseHandle(handle_);
  }
  OwnedHandle(const OwnedHandle&) = delete;
  OwnedHandle& operator=(const OwnedHandle&) = delete;

  platform::Handle Get() const { return handle_; }

 private:
  platform::Processes& processes_;
  platform::Handle handle_;
};

} // namespace quendra::monitor
