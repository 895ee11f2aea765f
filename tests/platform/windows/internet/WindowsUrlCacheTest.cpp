#include "platform/windows/internet/WindowsUrlCache.h"

#include <wininet.h>

#include <gtest/gtest.h>

#include <array>

namespace quendra::platform::windows {
namespace {

struct WindowsUrlCacheTest : testing::Test {
  ~WindowsUrlCacheTest() override {
    const auto erase = wininet.Find<decltype(::DeleteUrlCacheEntryW)>("DeleteUrlCacheEntryW");
    for (const Text& url : kept) erase(winapi::Wide(url));
  }

  void Keep(const Text& url) {
    std::array<wchar_t, MAX_PATH> path{};
    wininet.Find<decltype(::CreateUrlCacheEntryW)>("CreateUrlCacheEntryW")(winapi::Wide(url), 0, L"txt",
                                                                           path.data(), 0);
    ::CloseHandle(::CreateFileW(path.data(), GENERIC_WRITE, 0, nullptr, CREATE_ALWAYS, 0, nullptr));
    ASSERT_TRUE(wininet.Find<decltype(::CommitUrlCacheEntryW)>("CommitUrlCacheEntryW")(
        winapi::Wide(url), path.data(), {}, {}, NORMAL_CACHE_ENTRY, nullptr, 0, nullptr, nullptr));
    kept.push_back(url);
  }
  std::vector<std::string> All() {
    std::vector<std::string> names;
    UrlCacheEntry entry;
    cache.LocalAlloc(entry, 10'000);
    std::uint32_t size = 10'000;
    const UrlCacheWalk walk = cache.FindFirstUrlCacheEntryA(nullptr, &entry, size);
    for (bool more = walk != kNoUrlCacheWalk; more; more = cache.FindNextUrlCacheEntryA(walk, &entry, size))
      names.push_back(entry.sourceUrlName);
    cache.FindCloseUrlCache(walk);
    return names;
  }

  winapi::SystemLibrary wininet{L"wininet.dll"};
  std::vector<Text> kept;
  WindowsUrlCache cache;
};

TEST_F(WindowsUrlCacheTest, An_address_longer_than_a_first_buffer_is_told_whole_and_deleted) {
  const Text url = u"http://one.example/" + Text(1500, u'x');
  Keep(url);

  EXPECT_EQ(All(), std::vector{ToCodePage(url)});

  EXPECT_TRUE(cache.DeleteUrlCacheEntryA(ToCodePage(url)));
  EXPECT_TRUE(All().empty());
}

TEST_F(WindowsUrlCacheTest, A_walk_that_is_still_open_may_outlive_nothing) {
  Keep(u"http://one.example/");
  Keep(u"http://two.example/");
  WindowsUrlCache other;
  UrlCacheEntry entry;
  other.LocalAlloc(entry, 10'000);
  std::uint32_t size = 10'000;
  EXPECT_NE(other.FindFirstUrlCacheEntryA(nullptr, &entry, size), kNoUrlCacheWalk);
  // The cache goes with its walk.
}

} // namespace
} // namespace quendra::platform::windows
