#pragma once

#include "platform/linux/LinuxFixture.h"
#include "platform/linux/internet/CacheFilesFixture.h"
#include "platform/linux/internet/LinuxUrlCache.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <set>

namespace quendra::platform::linux_ {

namespace files = std::filesystem;
using Names = std::multiset<std::string>;

inline const std::string kFirefox = "mozilla/firefox/abc.default/cache2/entries/";
inline const std::string kChromium = "chromium/Default/Cache/Cache_Data/";

/// The name of an entry's file, by number.
inline std::string FirefoxName(int number) {
  const std::string digits = std::to_string(number);
  return kFirefox + std::string(40 - digits.size(), 'A') + digits;
}
inline std::string ChromiumName(int number, const char* stream = "0") {
  const std::string digits = std::to_string(number);
  return kChromium + std::string(16 - digits.size(), 'a') + digits + "_" + stream;
}

/// The caches of a user's browsers in a folder of the test's own.
struct LinuxUrlCacheTest : testing::Test {
  TemporaryFolder folder;
  LinuxUrlCache cache{folder.Path()};

  Names List() {
    Names names;
    UrlCacheEntry entry;
    std::uint32_t size = 0;
    EXPECT_EQ(cache.FindFirstUrlCacheEntryA("0", nullptr, size), kNoUrlCacheWalk);
    EXPECT_TRUE(cache.LocalAlloc(entry, size));
    const UrlCacheWalk walk = cache.FindFirstUrlCacheEntryA(nullptr, &entry, size);
    for (bool more = walk != kNoUrlCacheWalk; more;) {
      names.insert(entry.sourceUrlName);
      size = 0;
      EXPECT_FALSE(cache.FindNextUrlCacheEntryA(walk, nullptr, size));
      EXPECT_TRUE(cache.LocalAlloc(entry, size));
      more = cache.FindNextUrlCacheEntryA(walk, &entry, size);
    }
    cache.FindCloseUrlCache(walk);
    return names;
  }
  void DeleteAll() {
    for (const auto& name : List()) cache.DeleteUrlCacheEntryA(name);
  }
  bool Exists(const std::string& name) const { return files::exists(files::symlink_status(folder / name)); }
};

} // namespace quendra::platform::linux_
