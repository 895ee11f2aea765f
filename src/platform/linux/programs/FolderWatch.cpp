#include "platform/linux/programs/FolderWatch.h"

#include <sys/stat.h>

#include <algorithm>

namespace quendra::platform::linux_ {

namespace {

std::int64_t ChangeTime(const std::string& path) {
  struct stat folder {};
  if (::stat(path.c_str(), &folder) != 0) return 0;
  return std::int64_t{folder.st_mtim.tv_sec} * 1'000'000'000 + folder.st_mtim.tv_nsec;
}

} // namespace

void FolderWatch::Add(const std::string& path) { folders_.push_back({path, ChangeTime(path)}); }

bool FolderWatch::HasChanged() {
  const std::uint64_t now = clock_();
  if (now - lastLook_ < kLookMilliseconds) return false;
  lastLook_ = now;
  return std::any_of(folders_.begin(), folders_.end(),
                     [](const Folder& folder) { return ChangeTime(folder.path) != folder.changed; });
}

} // namespace quendra::platform::linux_
