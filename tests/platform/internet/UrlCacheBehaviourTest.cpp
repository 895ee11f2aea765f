#include "platform/BehaviourFixture.h"
#include "platform/internet/UrlCache.h"
#include "runtime/ByteFields.h"

#include <set>

namespace quendra::platform {
namespace {

struct UrlCacheBehaviourTest : BehaviourTest {
  UrlCache& cache = machine.urlCache;
  UrlCacheEntry entry;

  ~UrlCacheBehaviourTest() override { cache.LocalFree(entry); }

  /// Asks for the first entry with a block of its size.
  UrlCacheWalk First() {
    std::uint32_t size = 0;
    EXPECT_EQ(cache.FindFirstUrlCacheEntryA(nullptr, nullptr, size), kNoUrlCacheWalk);
    if (cache.GetLastError() != UrlCache::kErrorInsufficientBuffer) return kNoUrlCacheWalk;
    EXPECT_TRUE(cache.LocalAlloc(entry, size));
    return cache.FindFirstUrlCacheEntryA(nullptr, &entry, size);
  }
  bool Next(UrlCacheWalk walk) {
    std::uint32_t size = 0;
    EXPECT_FALSE(cache.FindNextUrlCacheEntryA(walk, nullptr, size));
    if (cache.GetLastError() != UrlCache::kErrorInsufficientBuffer) return false;
    cache.LocalFree(entry);
    EXPECT_TRUE(cache.LocalAlloc(entry, size));
    return cache.FindNextUrlCacheEntryA(walk, &entry, size);
  }
  std::multiset<std::string> All() {
    std::multiset<std::string> names;
    const UrlCacheWalk walk = First();
    for (bool more = walk != kNoUrlCacheWalk; more; more = Next(walk)) names.insert(entry.sourceUrlName);
    EXPECT_EQ(cache.GetLastError(), UrlCache::kErrorNoMoreItems);
    EXPECT_EQ(cache.FindCloseUrlCache(walk), walk != kNoUrlCacheWalk);
    return names;
  }
};

TEST_P(UrlCacheBehaviourTest, An_empty_cache_has_no_walk_and_no_more_items) {
  std::uint32_t size = 0;
  EXPECT_EQ(cache.FindFirstUrlCacheEntryA(nullptr, nullptr, size), kNoUrlCacheWalk);
  EXPECT_EQ(cache.GetLastError(), UrlCache::kErrorNoMoreItems);
}

TEST_P(UrlCacheBehaviourTest, A_walk_tells_every_entry_once) {
  const std::multiset<std::string> kept{"http://one.example/", "http://two.example/a b", "http://3.example/"};
  for (const auto& url : kept) backend->KeepInCache(url);

  EXPECT_EQ(All(), kept);
}

TEST_P(UrlCacheBehaviourTest, An_entry_is_a_normal_one_with_its_sizes_in_its_image) {
  backend->KeepInCache("http://one.example/");

  const UrlCacheWalk walk = First();

  ASSERT_NE(walk, kNoUrlCacheWalk);
  EXPECT_EQ(cache.GetLastError(), 0U);
  EXPECT_EQ(Little32(entry.block, UrlCacheEntry::kStructSizeAt), 80U);
  EXPECT_NE(Little32(entry.block, UrlCacheEntry::kSourceUrlNameAt), 0U);
  EXPECT_EQ(Little32(entry.block, UrlCacheEntry::kEntryTypeAt) & UrlCacheEntry::kNormalEntry, 1U);
  EXPECT_EQ(entry.sourceUrlName, "http://one.example/");
  cache.FindCloseUrlCache(walk);
}

TEST_P(UrlCacheBehaviourTest, A_block_that_is_a_byte_too_small_is_refused_with_the_size_that_is_needed) {
  backend->KeepInCache("http://one.example/");
  std::uint32_t needed = 0;
  cache.FindFirstUrlCacheEntryA(nullptr, nullptr, needed);
  ASSERT_TRUE(cache.LocalAlloc(entry, needed - 1));
  std::uint32_t size = needed - 1;

  EXPECT_EQ(cache.FindFirstUrlCacheEntryA(nullptr, &entry, size), kNoUrlCacheWalk);

  EXPECT_EQ(cache.GetLastError(), UrlCache::kErrorInsufficientBuffer);
  EXPECT_EQ(size, needed);
}

TEST_P(UrlCacheBehaviourTest, An_entry_that_was_told_can_be_deleted_once) {
  backend->KeepInCache("http://one.example/");
  backend->KeepInCache("http://two.example/");
  ASSERT_EQ(All().size(), 2U);

  EXPECT_TRUE(cache.DeleteUrlCacheEntryA("http://one.example/"));
  EXPECT_EQ(cache.GetLastError(), 0U);
  EXPECT_FALSE(cache.DeleteUrlCacheEntryA("http://one.example/"));
  EXPECT_EQ(cache.GetLastError(), UrlCache::kErrorFileNotFound);

  EXPECT_EQ(All(), std::multiset<std::string>{"http://two.example/"});
}

TEST_P(UrlCacheBehaviourTest, A_walk_is_closed_once_and_tells_nothing_afterwards) {
  backend->KeepInCache("http://one.example/");
  const UrlCacheWalk walk = First();
  std::uint32_t size = 0;

  EXPECT_TRUE(cache.FindCloseUrlCache(walk));
  for (const UrlCacheWalk closed : {walk, kNoUrlCacheWalk}) {
    EXPECT_FALSE(cache.FindCloseUrlCache(closed));
    EXPECT_EQ(cache.GetLastError(), UrlCache::kErrorInvalidHandle);
    EXPECT_FALSE(cache.FindNextUrlCacheEntryA(closed, nullptr, size));
    EXPECT_EQ(cache.GetLastError(), UrlCache::kErrorInvalidHandle);
  }
}

INSTANTIATE_TEST_SUITE_P(, UrlCacheBehaviourTest, kEveryBackend, NameOfBackend);

} // namespace
} // namespace quendra::platform
