#pragma once

#include "platform/internet/WalkedUrlCache.h"
#include "platform/simulated/SimulatedCore.h"

#include "runtime/ByteFields.h"

namespace quendra::platform::simulated {

/// A cache that is a list.
class SimulatedUrlCache : public WalkedUrlCache {
 public:
  std::vector<CachedUrl> Entries;
  void Add(const std::string& name) { Entries.push_back({name}); }
  /// Names that were asked to be deleted, found or not.
  std::vector<std::string> Deleted;
  /// Blocks that can be had before memory is out.
  int BlocksLeft = 0x7FFFFFFF;
  /// Blocks that weren't freed yet.
  int BlocksInUse = 0;
  /// Calls in their order, as in "FindNext 0" or "FindNext 97", with the size that the caller states.
  std::vector<std::string> Calls;

  bool LocalAlloc(UrlCacheEntry& entry, std::uint32_t size) override {
    Calls.push_back("LocalAlloc " + std::to_string(size));
    if (BlocksLeft == 0 || !WalkedUrlCache::LocalAlloc(entry, size)) return false;
    --BlocksLeft;
    if (size > 0) ++BlocksInUse;
    return true;
  }
  void LocalFree(UrlCacheEntry& entry) override {
    Calls.emplace_back("LocalFree");
    if (!entry.block.empty()) --BlocksInUse;
    WalkedUrlCache::LocalFree(entry);
  }
  UrlCacheWalk FindFirstUrlCacheEntryA(const char* pattern, UrlCacheEntry* entry,
                                       std::uint32_t& size) override {
    Calls.push_back(std::string("FindFirst ") + (pattern == nullptr ? "all" : pattern) + " " +
                    Told(entry, size));
    return WalkedUrlCache::FindFirstUrlCacheEntryA(pattern, entry, size);
  }
  bool FindNextUrlCacheEntryA(UrlCacheWalk walk, UrlCacheEntry* entry, std::uint32_t& size) override {
    Calls.push_back("FindNext " + Told(entry, size));
    return WalkedUrlCache::FindNextUrlCacheEntryA(walk, entry, size);
  }
  bool FindCloseUrlCache(UrlCacheWalk walk) override {
    Calls.push_back(walk == kNoUrlCacheWalk ? "FindClose none" : "FindClose");
    return WalkedUrlCache::FindCloseUrlCache(walk);
  }
  bool DeleteUrlCacheEntryA(const std::string& name) override {
    Deleted.push_back(CutText(name));
    for (auto entry = Entries.begin(); entry != Entries.end(); ++entry)
      if (entry->name == Deleted.back()) {
        Entries.erase(entry);
        return Succeed(true, 0);
      }
    return Succeed(false, kErrorFileNotFound);
  }

 protected:
  CachedUrls Begin() override {
    return [this, at = std::size_t{0}]() mutable -> std::optional<CachedUrl> {
      if (at >= Entries.size()) return {};
      return Entries[at++];
    };
  }

 private:
  /// The size that the caller states, and the one that it wrote into the block.
  static std::string Told(const UrlCacheEntry* entry, std::uint32_t size) {
    if (entry == nullptr) return std::to_string(size);
    return std::to_string(size) + " " +
           (entry->block.size() < 4 ? "no block" : std::to_string(Little32(entry->block, 0)));
  }
};

} // namespace quendra::platform::simulated
