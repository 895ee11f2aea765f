#pragma once

#include "platform/internet/UrlCache.h"

#include <functional>
#include <map>
#include <memory>
#include <optional>

namespace quendra::platform {

/// What a walk tells of an entry.
struct CachedUrl {
  std::string name{};
  std::uint32_t type = UrlCacheEntry::kNormalEntry;
};

/// Gives the entries of a cache one after the other, nothing behind the last.
using CachedUrls = std::function<std::optional<CachedUrl>()>;

/// The rules of a walk over any cache: sizes asked for first, images filled then.
class WalkedUrlCache : public UrlCache {
 public:
  bool LocalAlloc(UrlCacheEntry& entry, std::uint32_t size) override;
  void LocalFree(UrlCacheEntry& entry) override;
  UrlCacheWalk FindFirstUrlCacheEntryA(const char* pattern, UrlCacheEntry* entry,
                                       std::uint32_t& size) override;
  bool FindNextUrlCacheEntryA(UrlCacheWalk walk, UrlCacheEntry* entry, std::uint32_t& size) override;
  bool FindCloseUrlCache(UrlCacheWalk walk) override;
  std::uint32_t GetLastError() override { return lastError_; }

 protected:
  /// A walk from the first entry on.
  virtual CachedUrls Begin() = 0;

  bool Succeed(bool succeeds, std::uint32_t error) {
    lastError_ = succeeds ? 0 : error;
    return succeeds;
  }

 private:
  struct Walk {
    CachedUrls next;
    std::optional<CachedUrl> current;
  };

  bool Fill(const CachedUrl& url, UrlCacheEntry* entry, std::uint32_t& size);

  /// A walk whose first entry was only asked for its size: the call with the block goes on with it, so that
  /// it finds the entry that the size is of.
  std::optional<Walk> asked_;
  std::map<UrlCacheWalk, Walk> walks_;
  std::uint32_t lastWalk_ = 0;
  std::uint32_t lastError_ = 0;
};

} // namespace quendra::platform
