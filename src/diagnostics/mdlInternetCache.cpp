#include "diagnostics/mdlInternetCache.h"

#include "runtime/ByteFields.h"

#include <algorithm>
#include <array>

namespace quendra::diagnostics {

namespace {

using platform::UrlCacheEntry;

void AppendEntry(const UrlCacheEntry& entry, std::vector<Text>& list) {
  std::array<std::uint8_t, UrlCacheEntry::kRecordBytes> record{};
  std::copy_n(entry.block.begin(), std::min(entry.block.size(), record.size()), record.begin());
  if ((Little32(record, UrlCacheEntry::kEntryTypeAt) & UrlCacheEntry::kNormalEntry) == 0) return;
  const bool isNamed = Little32(record, UrlCacheEntry::kSourceUrlNameAt) != 0;
  list.push_back(isNamed ? FromCodePage(CutAtNul(std::string_view(entry.sourceUrlName))) : Text());
}

} // namespace

void mdlInternetCache::GetCacheURLList(std::vector<Text>& list) {
  UrlCacheEntry block;
  platform::UrlCacheWalk walk;
  std::uint32_t size = 0;
  if (PrepareFirst(walk, block, size)) {
    walk = cache_.FindFirstUrlCacheEntryA(nullptr, &block, size);
    for (bool more = walk != platform::kNoUrlCacheWalk; more; more = FetchNext(walk, block))
      AppendEntry(block, list);
  }
  cache_.LocalFree(block);
  cache_.FindCloseUrlCache(walk);
}

bool mdlInternetCache::AllocateFor(UrlCacheEntry& block, std::uint32_t size) {
  if (!cache_.LocalAlloc(block, size)) return false;
  // Behind the last entry no size is told, and a block of no bytes has no room for one.
  if (block.block.size() >= sizeof size) PutLittle32(block.block, UrlCacheEntry::kStructSizeAt, size);
  return true;
}

bool mdlInternetCache::PrepareFirst(platform::UrlCacheWalk& walk, UrlCacheEntry& block, std::uint32_t& size) {
  walk = cache_.FindFirstUrlCacheEntryA("0", nullptr, size);
  return walk == platform::kNoUrlCacheWalk &&
         cache_.GetLastError() == platform::UrlCache::kErrorInsufficientBuffer && AllocateFor(block, size);
}

bool mdlInternetCache::FetchNext(platform::UrlCacheWalk walk, UrlCacheEntry& block) {
  cache_.LocalFree(block);
  std::uint32_t size = 0;
  cache_.FindNextUrlCacheEntryA(walk, nullptr, size);
  return AllocateFor(block, size) && cache_.FindNextUrlCacheEntryA(walk, &block, size);
}

} // namespace quendra::diagnostics
