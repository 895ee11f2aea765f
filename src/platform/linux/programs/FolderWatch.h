#pragma once

#include "platform/linux/system/Clock.h"

#include <string>
#include <vector>

namespace quendra::platform::linux_ {

/// Tells when one of some folders has changed, by looking every few seconds at most.
class FolderWatch {
 public:
  explicit FolderWatch(Clock clock) : clock_(std::move(clock)) {}

  void Clear() { folders_.clear(); }
  /// A folder that doesn't exist has changed when it comes.
  void Add(const std::string& path);
  /// True when a folder changed since it was added. The time to the next look starts here.
  bool HasChanged();

  static constexpr std::uint64_t kLookMilliseconds = 3000;

 private:
  struct Folder {
    std::string path;
    std::int64_t changed = 0; ///< nanoseconds, 0 for one that isn't there
  };

  Clock clock_;
  std::vector<Folder> folders_;
  std::uint64_t lastLook_ = 0;
};

} // namespace quendra::platform::linux_
