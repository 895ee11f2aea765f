#include "platform/internet/WalkedUrlCache.h"

#include "runtime/ByteFields.h"

#include <algorithm>
#include <new>

namespace quendra::platform {

bool WalkedUrlCache::LocalAlloc(UrlCacheEntry& entry, std::uint32_t size) try {
  entry.block.assign(size, 0);
  return true;
} catch (const std::bad_alloc&) {
  return false;
}

void WalkedUrlCache::LocalFree(UrlCacheEntry& entry) { entry = {}; }

bool WalkedUrlCache::Fill(const CachedUrl& url, UrlCacheEntry* entry, std::uint32_t& size) {
  const auto needed = static_cast<std::uint32_t>(UrlCacheEntry::kRecordBytes + url.name.size() + 1);
  if (entry == nullptr || entry->block.size() < needed || size < needed) {
    size = needed;
    return Succeed(false, kErrorInsufficientBuffer);
  }
  auto& block = entry->block;
  std::fill(block.begin(), block.end(), std::uint8_t{0});
  PutLittle32(block, UrlCacheEntry::kStructSizeAt, UrlCacheEntry::kRecordBytes);
  PutLittle32(block, UrlCacheEntry::kSourceUrlNameAt, UrlCacheEntry::kRecordBytes);
  PutLittle32(block, UrlCacheEntry::kEntryTypeAt, url.type);
  std::copy(url.name.begin(), url.name.end(), block.begin() + UrlCacheEntry::kRecordBytes);
  entry->sourceUrlName = url.name;
  return Succeed(true, 0);
}

UrlCacheWalk WalkedUrlCache::FindFirstUrlCacheEntryA(const char* /*pattern*/, UrlCacheEntry* entry,
                                                     std::uint32_t& size) {
  if (!asked_ || entry == nullptr) {
    asked_.emplace();
    asked_->next = Begin();
    asked_->current = asked_->next();
  }
  if (!asked_->current) {
    asked_.reset();
    Succeed(false, kErrorNoMoreItems);
    return kNoUrlCacheWalk;
  }
  if (!Fill(*asked_->current, entry, size)) return kNoUrlCacheWalk;
  asked_->current = asked_->next();
  const UrlCacheWalk walk(lastWalk_ += 4);
  walks_[walk] = std::move(*asked_);
  asked_.reset();
  return walk;
}

bool WalkedUrlCache::FindNextUrlCacheEntryA(UrlCacheWalk walk, UrlCacheEntry* entry, std::uint32_t& size) {
  const auto found = walks_.find(walk);
  if (found == walks_.end()) return Succeed(false, kErrorInvalidHandle);
  auto& [next, current] = found->second;
  if (!current) return Succeed(false, kErrorNoMoreItems);
  if (!Fill(*current, entry, size)) return false;
  current = next();
  return true;
}

bool WalkedUrlCache::FindCloseUrlCache(UrlCacheWalk walk) {
  return Succeed(walks_.erase(walk) > 0, kErrorInvalidHandle);
}

} // namespace quendra::platform
