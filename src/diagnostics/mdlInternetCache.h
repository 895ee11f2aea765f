#pragma once

#include "platform/internet/UrlCache.h"
#include "runtime/Text.h"

#include <vector>

namespace quendra::diagnostics {

/// Lists the entries of the system's internet cache.
class mdlInternetCache {
 public:
  explicit mdlInternetCache(platform::UrlCache& cache) : cache_(cache) {}

  /// Appends the addresses of the cache's normal entries, cookies too. A failure ends the walk with what was
  /// found so far and says nothing.
  void GetCacheURLList(std::vector<Text>& list);

 private:
  /// A block for the first entry; false when there is none. A walk that opens at once is handed over to be
  /// closed.
  bool PrepareFirst(platform::UrlCacheWalk& walk, platform::UrlCacheEntry& block, std::uint32_t& size);
  bool AllocateFor(platform::UrlCacheEntry& block, std::uint32_t size);
  bool FetchNext(platform::UrlCacheWalk walk, platform::UrlCacheEntry& block);

  platform::UrlCache& cache_;
};

} // namespace quendra::diagnostics
