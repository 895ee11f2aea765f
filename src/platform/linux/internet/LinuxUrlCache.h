#pragma once

#include "platform/internet/WalkedUrlCache.h"
#include "platform/linux/internet/CacheFolders.h"

#include <unordered_map>

namespace quendra::platform::linux_ {

/// The disk caches of the browsers in the user's cache folder, one entry a file, named by the address that
/// the file tells, else by its path. A running browser finds its entries gone, as after its own cleaning:
/// indexes and shared files stay, and no lock is taken. An entry can be deleted when a walk has told it since
/// the last walk began; of several with one name each call deletes one.
class LinuxUrlCache : public WalkedUrlCache {
 public:
  explicit LinuxUrlCache(std::string cacheHome) : cacheHome_(std::move(cacheHome)) {}

  bool DeleteUrlCacheEntryA(const std::string& name) override;

 protected:
  CachedUrls Begin() override;

 private:
  struct Place {
    std::shared_ptr<CacheFolder> folder;
    std::string file;
  };
  class Walk;

  std::string cacheHome_;
  /// Shared with the walks, which may outlive it in the caller's hands.
  std::shared_ptr<std::unordered_multimap<std::string, Place>> places_;
};

} // namespace quendra::platform::linux_
