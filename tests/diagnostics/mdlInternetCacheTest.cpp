#include "diagnostics/mdlInternetCache.h"

#include "platform/simulated/internet/SimulatedUrlCache.h"

#include <gtest/gtest.h>

namespace quendra::diagnostics {
namespace {

struct InternetCacheTest : testing::Test {
  platform::simulated::SimulatedUrlCache cache;
  mdlInternetCache lister{cache};
  std::vector<Text> list{Text()};
};

TEST_F(InternetCacheTest, An_empty_cache_leaves_the_list_with_its_element_0_alone) {
  lister.GetCacheURLList(list);

  EXPECT_EQ(list, std::vector<Text>{u""});
  EXPECT_EQ(cache.Calls, (std::vector<std::string>{"FindFirst 0 0", "LocalFree", "FindClose none"}));
}

TEST_F(InternetCacheTest, Each_entry_is_asked_for_its_size_and_then_fetched_into_a_block_of_its_own) {
  cache.Add("http://a/");
  cache.Add("http://bb/");

  lister.GetCacheURLList(list);

  EXPECT_EQ(list, (std::vector<Text>{u"", u"http://a/", u"http://bb/"}));
  EXPECT_EQ(cache.Calls, (std::vector<std::string>{
                             "FindFirst 0 0", "LocalAlloc 90", "FindFirst all 90 90", "LocalFree",
                             "FindNext 0", "LocalAlloc 91", "FindNext 91 91", "LocalFree", "FindNext 0",
                             "LocalAlloc 0", "FindNext 0 no block", "LocalFree", "FindClose"}));
  EXPECT_EQ(cache.BlocksInUse, 0);
}

TEST_F(InternetCacheTest, Names_are_appended_behind_what_the_caller_had) {
  cache.Add("http://a/");
  list = {u"", u"before"};

  lister.GetCacheURLList(list);

  EXPECT_EQ(list, (std::vector<Text>{u"", u"before", u"http://a/"}));
}

TEST_F(InternetCacheTest, An_entry_that_is_no_normal_one_is_not_listed) {
  cache.Entries = {{"http://a/", 0x00000008}, {"Cookie:user@a", 0x00100001}, {"Visited:b", 0x00200000}};

  lister.GetCacheURLList(list);

  EXPECT_EQ(list, (std::vector<Text>{u"", u"Cookie:user@a"}));
}

TEST_F(InternetCacheTest, A_name_ends_at_its_NUL_and_comes_from_the_code_page) {
  cache.Add(std::string("http://\xE0/\0x", 10));

  lister.GetCacheURLList(list);

  EXPECT_EQ(list.at(1), u"http://\u05D0/");
}

TEST_F(InternetCacheTest, An_entry_whose_record_points_to_no_name_is_listed_with_an_empty_one) {
  struct NamelessCache : platform::simulated::SimulatedUrlCache {
    platform::UrlCacheWalk FindFirstUrlCacheEntryA(const char* pattern, platform::UrlCacheEntry* entry,
                                                   std::uint32_t& size) override {
      const auto walk = SimulatedUrlCache::FindFirstUrlCacheEntryA(pattern, entry, size);
      if (entry) PutLittle32(entry->block, platform::UrlCacheEntry::kSourceUrlNameAt, 0);
      return walk;
    }
  } nameless;
  nameless.Add("http://a/");

  mdlInternetCache(nameless).GetCacheURLList(list);

  EXPECT_EQ(list, (std::vector<Text>{u"", u""}));
}

TEST_F(InternetCacheTest, A_name_of_4_KB_is_listed_whole) {
  cache.Add("http://a/" + std::string(4096, 'x'));

  lister.GetCacheURLList(list);

  EXPECT_EQ(list.at(1), u"http://a/" + Text(4096, u'x'));
}

TEST_F(InternetCacheTest, Without_memory_for_the_first_block_nothing_is_listed) {
  cache.Add("http://a/");
  cache.BlocksLeft = 0;

  lister.GetCacheURLList(list);

  EXPECT_EQ(list, std::vector<Text>{u""});
  EXPECT_EQ(cache.Calls.back(), "FindClose none");
}

TEST_F(InternetCacheTest, Without_memory_in_between_the_walk_ends_with_what_it_has) {
  cache.Add("http://a/");
  cache.Add("http://b/");
  cache.BlocksLeft = 1;

  lister.GetCacheURLList(list);

  EXPECT_EQ(list, (std::vector<Text>{u"", u"http://a/"}));
  EXPECT_EQ(cache.Calls.back(), "FindClose");
  EXPECT_EQ(cache.BlocksInUse, 0);
}

/// A cache whose first answer is a walk although it was given no room.
struct EagerCache : platform::simulated::SimulatedUrlCache {
  platform::UrlCacheWalk FindFirstUrlCacheEntryA(const char*, platform::UrlCacheEntry*,
                                                 std::uint32_t&) override {
    return platform::UrlCacheWalk(4);
  }
};

TEST_F(InternetCacheTest, A_walk_that_opens_where_only_a_size_was_asked_for_is_closed_again) {
  EagerCache eager;
  eager.Add("http://a/");

  mdlInternetCache(eager).GetCacheURLList(list);

  EXPECT_EQ(list, std::vector<Text>{u""});
  EXPECT_EQ(eager.Calls.back(), "FindClose");
}

TEST_F(InternetCacheTest, A_first_entry_that_grows_between_its_two_calls_leaves_the_list_as_it_was) {
  struct GrowingCache : platform::simulated::SimulatedUrlCache {
    bool LocalAlloc(platform::UrlCacheEntry& entry, std::uint32_t size) override {
      return SimulatedUrlCache::LocalAlloc(entry, size - 1);
    }
  } growing;
  growing.Add("http://a/");

  mdlInternetCache(growing).GetCacheURLList(list);

  EXPECT_EQ(list, std::vector<Text>{u""});
  EXPECT_EQ(growing.Calls, (std::vector<std::string>{"FindFirst 0 0", "LocalAlloc 89", "FindFirst all 90 90",
                                                     "LocalFree", "FindClose none"}));
  EXPECT_EQ(growing.BlocksInUse, 0);
}

TEST_F(InternetCacheTest, Any_other_error_than_too_small_a_block_ends_the_walk_before_it_begins) {
  struct ClosedCache : platform::simulated::SimulatedUrlCache {
    std::uint32_t GetLastError() override { return kErrorAccessDenied; }
  } closed;
  closed.Add("http://a/");

  mdlInternetCache(closed).GetCacheURLList(list);

  EXPECT_EQ(list, std::vector<Text>{u""});
  EXPECT_EQ(closed.Calls, (std::vector<std::string>{"FindFirst 0 0", "LocalFree", "FindClose none"}));
}

TEST_F(InternetCacheTest, An_entry_that_grows_between_its_two_calls_ends_the_walk) {
  struct GrowingCache : platform::simulated::SimulatedUrlCache {
    bool LocalAlloc(platform::UrlCacheEntry& entry, std::uint32_t size) override {
      return SimulatedUrlCache::LocalAlloc(entry, Calls.size() > 4 ? size - 1 : size);
    }
  } growing;
  growing.Add("http://a/");
  growing.Add("http://b/");
  growing.Add("http://c/");

  mdlInternetCache(growing).GetCacheURLList(list);

  EXPECT_EQ(list, (std::vector<Text>{u"", u"http://a/"}));
  EXPECT_EQ(growing.BlocksInUse, 0);
}

TEST_F(InternetCacheTest, Its_list_grows_beyond_the_16_bit_count_of_its_caller) {
  for (int i = 0; i < 32768; ++i) cache.Add("http://a/" + std::to_string(i));

  lister.GetCacheURLList(list);

  EXPECT_EQ(list.size(), 32769u);
  EXPECT_EQ(list.back(), u"http://a/32767");
}

} // namespace
} // namespace quendra::diagnostics
