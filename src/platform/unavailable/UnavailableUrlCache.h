#pragma once

#include "platform/internet/UrlCache.h"

namespace quendra::platform::unavailable {

/// A system without an internet cache.
class UnavailableUrlCache : public UrlCache {
 public:
  bool LocalAlloc(UrlCacheEntry&, std::uint32_t) override { return false; }
  void LocalFree(UrlCacheEntry&) override {}
  UrlCacheWalk FindFirstUrlCacheEntryA(const char*, UrlCacheEntry*, std::uint32_t&) override {
    return kNoUrlCacheWalk;
  }
  bool FindNextUrlCacheEntryA(UrlCacheWalk, UrlCacheEntry*, std::uint32_t&) override { return false; }
  bool FindCloseUrlCache(UrlCacheWalk) override { return false; }
  bool DeleteUrlCacheEntryA(const std::string&) override { return false; }
  std::uint32_t GetLastError() override { return kErrorCallNotImplemented; }
};

} // namespace quendra::platform::unavailable
