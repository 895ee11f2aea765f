#include "platform/linux/internet/LinuxUrlCache.h"

#include "platform/linux/internet/LinuxUrlCacheFixture.h"

#include <sys/stat.h>
#include <unistd.h>

namespace quendra::platform::linux_ {
namespace {

TEST_F(LinuxUrlCacheTest, A_folder_without_browsers_is_an_empty_cache) {
  std::uint32_t size = 0;
  EXPECT_EQ(cache.FindFirstUrlCacheEntryA(nullptr, nullptr, size), kNoUrlCacheWalk);
  EXPECT_EQ(cache.GetLastError(), UrlCache::kErrorNoMoreItems);
  LinuxUrlCache nowhere(folder / "missing");
  EXPECT_EQ(nowhere.FindFirstUrlCacheEntryA(nullptr, nullptr, size), kNoUrlCacheWalk);
}

TEST_F(LinuxUrlCacheTest, Entries_of_every_browser_and_profile_are_named_by_their_addresses) {
  folder.Write(FirefoxName(1), FirefoxFile(":http://a/"));
  folder.Write("mozilla/firefox/other/cache2/entries/" + std::string(40, 'B'), FirefoxFile("a,:http://b/"));
  folder.Write(ChromiumName(1), ChromiumFile("1/0/_dk_https://c https://c http://c/"));
  folder.Write("google-chrome/Profile 1/Cache/Cache_Data/" + std::string(16, 'b') + "_0",
               ChromiumFile("http://d/"));
  folder.Write("opera/Cache/Cache_Data/" + std::string(16, 'b') + "_0", ChromiumFile("http://e/"));

  EXPECT_EQ(List(), (Names{"http://a/", "http://b/", "http://c/", "http://d/", "http://e/"}));
}

TEST_F(LinuxUrlCacheTest, A_file_that_tells_no_address_is_named_by_its_path) {
  folder.Write(FirefoxName(1), "rubbish");
  folder.Write(ChromiumName(1), "");
  folder.Write(kChromium + "f_00000a", "content of a block file's entry");

  EXPECT_EQ(List(),
            (Names{folder / FirefoxName(1), folder / ChromiumName(1), folder / (kChromium + "f_00000a")}));
}

TEST_F(LinuxUrlCacheTest, Deleted_entries_are_gone_and_a_browsers_own_books_stay) {
  const Names books{"mozilla/firefox/abc.default/cache2/index",
                    kFirefox + "index",
                    kFirefox + "index.log",
                    kChromium + "index",
                    kChromium + "data_0",
                    kChromium + "data_3",
                    kChromium + "index-dir/the-real-index",
                    kChromium + "todelete_" + std::string(16, 'a') + "_0",
                    "chromium/Default/Code Cache/js/" + std::string(16, 'a') + "_0"};
  for (const auto& name : books) folder.Write(name, ChromiumFile("http://book/"));
  folder.Write(FirefoxName(1), FirefoxFile(":http://a/"));
  folder.Write(ChromiumName(1), ChromiumFile("http://b/"));
  folder.Write(ChromiumName(1, "1"), ChromiumFile("http://b/"));
  folder.Write(ChromiumName(1, "s"), ChromiumFile("http://b/"));

  EXPECT_EQ(List(), (Names{"http://a/", "http://b/", "http://b/", "http://b/"}));
  DeleteAll();

  EXPECT_EQ(List().size(), 0u);
  for (const auto& name : books) EXPECT_TRUE(Exists(name)) << name;
}

TEST_F(LinuxUrlCacheTest, Of_entries_with_one_name_each_call_deletes_one) {
  for (int i = 0; i < 3; ++i) folder.Write(ChromiumName(i), ChromiumFile("http://a/"));
  ASSERT_EQ(List().size(), 3u);

  for (int i = 0; i < 3; ++i) EXPECT_TRUE(cache.DeleteUrlCacheEntryA("http://a/"));
  EXPECT_FALSE(cache.DeleteUrlCacheEntryA("http://a/"));
  EXPECT_EQ(cache.GetLastError(), UrlCache::kErrorFileNotFound);
}

TEST_F(LinuxUrlCacheTest, An_empty_or_unknown_name_or_a_path_of_the_callers_own_deletes_nothing) {
  const std::string own = folder.Write("precious", "x");
  folder.Write(ChromiumName(1), ChromiumFile(own));
  for (const auto& name : {std::string(), std::string("http://a/"), own, folder / ChromiumName(1)})
    EXPECT_FALSE(cache.DeleteUrlCacheEntryA(name)) << name;

  // An entry that tells somebody's file as its address is the entry, not the file.
  EXPECT_EQ(List(), Names{own});
  EXPECT_TRUE(cache.DeleteUrlCacheEntryA(own));
  EXPECT_TRUE(Exists("precious"));
  EXPECT_FALSE(Exists(ChromiumName(1)));
}

TEST_F(LinuxUrlCacheTest, Links_are_never_followed) {
  TemporaryFolder outside;
  const std::string target = outside.Write(std::string(16, 'c') + "_0", ChromiumFile("http://outside/"));
  outside.Write("cache2/entries/" + std::string(40, 'C'), FirefoxFile(":http://outside/"));
  folder.Write(ChromiumName(1), ChromiumFile("http://inside/"));
  files::create_symlink(target, folder / ChromiumName(2));
  files::create_directories(folder / "mozilla/firefox/one");
  files::create_directory_symlink(outside.Path(), folder / "mozilla/firefox/linked");
  files::create_directory_symlink(outside / "cache2", folder / "mozilla/firefox/one/cache2");
  files::create_directories(folder / "chromium/Linked/Cache");
  files::create_directory_symlink(outside.Path(), folder / "chromium/Linked/Cache/Cache_Data");
  files::create_directory_symlink(outside.Path(), folder / "vivaldi");

  EXPECT_EQ(List(), Names{"http://inside/"});
  DeleteAll();

  EXPECT_TRUE(files::exists(target));
  EXPECT_TRUE(files::exists(outside / ("cache2/entries/" + std::string(40, 'C'))));
  EXPECT_TRUE(Exists(ChromiumName(2)));
}

TEST_F(LinuxUrlCacheTest, A_link_that_takes_an_entrys_place_goes_without_its_target) {
  TemporaryFolder outside;
  const std::string target = outside.Write("precious", "x");
  const std::string entry = folder.Write(ChromiumName(1), ChromiumFile("http://a/"));
  List();
  files::remove(entry);
  files::create_symlink(target, entry);

  cache.DeleteUrlCacheEntryA("http://a/");

  EXPECT_TRUE(files::exists(target));
}

TEST_F(LinuxUrlCacheTest, Pipes_and_folders_under_an_entrys_name_are_passed_over) {
  folder.Write(ChromiumName(1), ChromiumFile("http://a/"));
  ASSERT_EQ(::mkfifo((folder / ChromiumName(2)).c_str(), 0600), 0);
  files::create_directory(folder / ChromiumName(3));

  EXPECT_EQ(List(), Names{"http://a/"});
}

TEST_F(LinuxUrlCacheTest, Entries_that_vanish_on_the_way_are_left_out_or_not_found) {
  for (int i = 0; i < 3; ++i) folder.Write(ChromiumName(i), ChromiumFile("http://a/"));
  UrlCacheEntry entry;
  std::uint32_t size = 1000;
  ASSERT_TRUE(cache.LocalAlloc(entry, size));
  const UrlCacheWalk walk = cache.FindFirstUrlCacheEntryA(nullptr, &entry, size);
  ASSERT_NE(walk, kNoUrlCacheWalk);
  files::remove_all(folder / "chromium");

  int rest = 0;
  while (cache.FindNextUrlCacheEntryA(walk, &entry, size)) ++rest;
  EXPECT_LE(rest, 1);
  EXPECT_FALSE(cache.DeleteUrlCacheEntryA("http://a/"));
  EXPECT_EQ(cache.GetLastError(), UrlCache::kErrorFileNotFound);
}

TEST_F(LinuxUrlCacheTest, A_file_that_cannot_be_read_is_named_by_its_path_and_can_be_deleted) {
  const std::string path = folder.Write(ChromiumName(1), ChromiumFile("http://a/"));
  ASSERT_EQ(::chmod(path.c_str(), 0), 0);
  // A user without root's rights, to whom the folders belong.
  const Child other([&] {
    for (const auto& entry : files::recursive_directory_iterator(folder.Path()))
      if (::geteuid() == 0 && ::chown(entry.path().c_str(), 65534, 65534) != 0)
        return std::string("not given");
    if (::geteuid() == 0 && (::chown(folder.Path().c_str(), 65534, 65534) != 0 || ::setuid(65534) != 0))
      return std::string("no user");
    const Names names = List();
    return *names.begin() + (cache.DeleteUrlCacheEntryA(path) ? " deleted" : " kept");
  });

  EXPECT_EQ(other.Answer(), path + " deleted");
}

TEST_F(LinuxUrlCacheTest, A_name_of_4_KB_and_one_with_controls_come_in_the_code_page) {
  const std::string address = "http://a/" + std::string(4096, 'x');
  folder.Write(ChromiumName(1), ChromiumFile(address));
  folder.Write(ChromiumName(2), ChromiumFile(std::string("http://\x01\0\xD7\x90/", 12)));

  EXPECT_EQ(List(), (Names{address, "http://??\xE0/"}));
}

} // namespace
} // namespace quendra::platform::linux_
