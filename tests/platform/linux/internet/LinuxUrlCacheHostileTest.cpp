// What stands in a user's cache folder that no browser put there, and what changes under a walk's feet:
// nothing outside the browsers' folders is ever touched, and no walk hangs.

#include "platform/linux/internet/LinuxUrlCacheFixture.h"

#include <fcntl.h>
#include <sched.h>
#include <sys/mount.h>
#include <sys/resource.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/sysmacros.h>
#include <sys/un.h>
#include <unistd.h>

namespace quendra::platform::linux_ {
namespace {

const std::string kEntries = "chromium/Default/Cache/Cache_Data";

/// A socket's file under an entry's name; the folder is gone to first, as addresses of sockets are short.
bool MakeSocket(const std::string& path) {
  const int folder = ::open(files::path(path).parent_path().c_str(), O_RDONLY | O_DIRECTORY);
  const std::string shortPath =
      "/proc/self/fd/" + std::to_string(folder) + "/" + files::path(path).filename().string();
  const int made = ::socket(AF_UNIX, SOCK_STREAM, 0);
  sockaddr_un address{};
  address.sun_family = AF_UNIX;
  shortPath.copy(address.sun_path, sizeof address.sun_path - 1);
  const bool done = ::bind(made, reinterpret_cast<const sockaddr*>(&address), sizeof address) == 0;
  ::close(made);
  ::close(folder);
  return done;
}

/// Mounts of a process of the test's own, which nobody else sees.
bool HasMountsOfItsOwn() {
  return ::unshare(CLONE_NEWNS) == 0 && ::mount("none", "/", nullptr, MS_REC | MS_PRIVATE, nullptr) == 0;
}

/// The folder and all in it belong to a user without rights from now on, and this process is that user.
bool BecomeUser(const TemporaryFolder& folder) {
  constexpr uid_t kNobody = 65534;
  if (::geteuid() != 0) return true;
  for (const auto& entry : files::recursive_directory_iterator(folder.Path()))
    if (::lchown(entry.path().c_str(), kNobody, kNobody) != 0) return false;
  return ::chown(folder.Path().c_str(), kNobody, kNobody) == 0 && ::setuid(kNobody) == 0;
}

TEST_F(LinuxUrlCacheTest, Sockets_and_devices_under_an_entrys_name_are_passed_over) {
  folder.Write(ChromiumName(1), ChromiumFile("http://a/"));
  ASSERT_TRUE(MakeSocket(folder / ChromiumName(2)));
  // /dev/zero, which never ends. Only root makes a device.
  const bool hasDevice =
      ::mknod((folder / ChromiumName(3)).c_str(), S_IFCHR | 0600, ::makedev(1, 5)) == 0 || ::geteuid() != 0;
  ASSERT_TRUE(hasDevice);

  EXPECT_EQ(List(), Names{"http://a/"});
  DeleteAll();

  EXPECT_TRUE(Exists(ChromiumName(2)));
  EXPECT_EQ(Exists(ChromiumName(3)), ::geteuid() == 0);
}

TEST_F(LinuxUrlCacheTest, A_folder_that_a_link_replaces_after_the_walk_leads_nowhere) {
  TemporaryFolder outside;
  const std::string name = files::path(ChromiumName(1)).filename();
  const std::string precious = outside.Write(name, ChromiumFile("http://a/"));
  folder.Write(ChromiumName(1), ChromiumFile("http://a/"));
  ASSERT_EQ(List(), Names{"http://a/"});
  files::rename(folder / kEntries, folder / "chromium/Default/moved");
  files::create_directory_symlink(outside.Path(), folder / kEntries);

  cache.DeleteUrlCacheEntryA("http://a/");

  EXPECT_TRUE(files::exists(precious));
  EXPECT_FALSE(Exists("chromium/Default/moved/" + name));
}

TEST_F(LinuxUrlCacheTest, A_folder_that_a_link_replaces_during_the_walk_leads_nowhere) {
  TemporaryFolder outside;
  for (int i = 1; i <= 50; ++i) {
    folder.Write(ChromiumName(i), ChromiumFile("http://inside/"));
    outside.Write(files::path(ChromiumName(i)).filename(), ChromiumFile("http://outside/"));
  }
  UrlCacheEntry entry;
  std::uint32_t size = 1000;
  ASSERT_TRUE(cache.LocalAlloc(entry, size));
  const UrlCacheWalk walk = cache.FindFirstUrlCacheEntryA(nullptr, &entry, size);
  ASSERT_NE(walk, kNoUrlCacheWalk);
  files::rename(folder / kEntries, folder / "chromium/Default/moved");
  files::create_directory_symlink(outside.Path(), folder / kEntries);

  Names names{entry.sourceUrlName};
  while (cache.FindNextUrlCacheEntryA(walk, &entry, size)) names.insert(entry.sourceUrlName);

  EXPECT_EQ(names.count("http://inside/"), 50U);
  EXPECT_EQ(names.size(), 50U);
}

TEST_F(LinuxUrlCacheTest, Files_that_become_pipes_folders_or_links_during_the_walk_are_passed_over) {
  TemporaryFolder outside;
  const std::string precious = outside.Write("precious", ChromiumFile("http://outside/"));
  for (int i = 1; i <= 30; ++i) folder.Write(ChromiumName(i), ChromiumFile("http://inside/"));
  UrlCacheEntry entry;
  std::uint32_t size = 1000;
  ASSERT_TRUE(cache.LocalAlloc(entry, size));
  const UrlCacheWalk walk = cache.FindFirstUrlCacheEntryA(nullptr, &entry, size);
  ASSERT_NE(walk, kNoUrlCacheWalk);
  for (int i = 1; i <= 30; ++i) {
    const std::string path = folder / ChromiumName(i);
    files::remove(path);
    switch (i % 3) {
    case 0: ASSERT_EQ(::mkfifo(path.c_str(), 0600), 0); break;
    case 1: files::create_directory(path); break;
    default: files::create_symlink(precious, path);
    }
  }

  // The first entry, and one that was read ahead.
  int told = 1;
  while (cache.FindNextUrlCacheEntryA(walk, &entry, size)) {
    EXPECT_EQ(entry.sourceUrlName, "http://inside/");
    ++told;
  }
  EXPECT_EQ(told, 2);
}

TEST_F(LinuxUrlCacheTest, A_folder_that_takes_an_entrys_place_stays_with_all_in_it) {
  const std::string entry = folder.Write(ChromiumName(1), ChromiumFile("http://a/"));
  List();
  files::remove(entry);
  folder.Write(ChromiumName(1) + "/precious", "x");

  EXPECT_FALSE(cache.DeleteUrlCacheEntryA("http://a/"));
  EXPECT_EQ(cache.GetLastError(), UrlCache::kErrorAccessDenied);
  EXPECT_TRUE(Exists(ChromiumName(1) + "/precious"));
}

TEST_F(LinuxUrlCacheTest, A_file_that_an_entry_shares_keeps_its_other_name_and_its_bytes) {
  TemporaryFolder outside;
  const std::string precious = outside.Write("precious", ChromiumFile("http://a/", "all of it"));
  files::create_directories(folder / kEntries);
  files::create_hard_link(precious, folder / ChromiumName(1));

  DeleteAll();

  EXPECT_FALSE(Exists(ChromiumName(1)));
  EXPECT_EQ(files::file_size(precious), ChromiumFile("http://a/", "all of it").size());
}

TEST_F(LinuxUrlCacheTest, Profiles_whose_names_are_no_UTF_8_are_cleaned_like_others) {
  const std::string file = "/Cache/Cache_Data/" + std::string(16, 'a') + "_0";
  // In the code page both paths read alike.
  for (const char* profile : {"\xFF\xFE", "\xC3\x28", "\xD7\x90 \x01"})
    folder.Write("chromium/" + std::string(profile) + file, "no address");

  EXPECT_EQ(List().size(), 3U);
  DeleteAll();

  EXPECT_EQ(List().size(), 0U);
}

TEST_F(LinuxUrlCacheTest, Names_of_files_that_are_almost_an_entrys_are_passed_over) {
  const std::string digits(40, 'A');
  const std::string small(16, 'a');
  for (const std::string& name : {digits + "A", digits.substr(1), digits.substr(1) + "a",
                                  digits.substr(1) + "G", digits.substr(1) + "\xFF", digits.substr(1) + "\n"})
    folder.Write(kFirefox + name, FirefoxFile(":http://a/"));
  for (const std::string& name : {small + "_2", small + "_00", small + "-0", small + "_",
                                  small.substr(1) + "_0", small.substr(1) + "A_0", std::string("f_00000A"),
                                  std::string("f_0000001"), std::string("f_00001"), std::string("g_000001")})
    folder.Write(kChromium + name, ChromiumFile("http://a/"));

  EXPECT_EQ(List(), Names{});
}

TEST_F(LinuxUrlCacheTest, Folders_that_may_not_be_entered_or_read_are_passed_over) {
  folder.Write(ChromiumName(1), ChromiumFile("http://a/"));
  folder.Write("chromium/Closed/Cache/Cache_Data/" + std::string(16, 'a') + "_0", ChromiumFile("http://b/"));
  folder.Write(FirefoxName(1), FirefoxFile(":http://c/"));
  const Child other([&] {
    if (!BecomeUser(folder)) return std::string("no user");
    files::permissions(folder / "chromium/Closed", files::perms::none);
    files::permissions(folder / kFirefox, files::perms::owner_exec);
    const Names names = List();
    files::permissions(folder / "chromium/Closed", files::perms::owner_all);
    files::permissions(folder / kFirefox, files::perms::owner_all);
    return std::to_string(names.size()) + " " + *names.begin();
  });

  EXPECT_EQ(other.Answer(), "1 http://a/");
}

TEST_F(LinuxUrlCacheTest, An_entry_of_a_folder_that_may_not_be_changed_stays_and_says_why) {
  folder.Write(ChromiumName(1), ChromiumFile("http://a/"));
  const Child other([&] {
    if (!BecomeUser(folder)) return std::string("no user");
    files::permissions(folder / kEntries, files::perms::owner_read | files::perms::owner_exec);
    const std::size_t count = List().size();
    const bool isGone = cache.DeleteUrlCacheEntryA("http://a/");
    const auto error = cache.GetLastError();
    files::permissions(folder / kEntries, files::perms::owner_all);
    return std::to_string(count) + (isGone ? " gone " : " stays ") + std::to_string(error);
  });

  EXPECT_EQ(other.Answer(), "1 stays 5");
  EXPECT_TRUE(Exists(ChromiumName(1)));
}

TEST_F(LinuxUrlCacheTest, A_file_mounted_over_an_entry_stays_and_a_cache_on_a_disk_of_its_own_is_emptied) {
  if (::geteuid() != 0) GTEST_SKIP() << "needs root: mounts, seen by a process of the test alone";
  TemporaryFolder outside;
  const std::string precious = outside.Write("precious", ChromiumFile("http://outside/"));
  const std::string entry = folder.Write(ChromiumName(1), ChromiumFile("http://a/"));
  folder.Write(FirefoxName(1), FirefoxFile(":http://b/"));
  const Child other([&] {
    if (!HasMountsOfItsOwn() || ::mount(precious.c_str(), entry.c_str(), nullptr, MS_BIND, nullptr) != 0 ||
        ::mount("tmpfs", (folder / kFirefox).c_str(), "tmpfs", 0, "size=128k") != 0)
      return std::string("no mounts");
    folder.Write(FirefoxName(2), FirefoxFile(":http://c/"));
    DeleteAll();
    return std::string(files::exists(entry) ? "stays " : "gone ") + std::to_string(List().count("http://c/"));
  });

  EXPECT_EQ(other.Answer(), "stays 0");
  EXPECT_TRUE(files::exists(precious));
  EXPECT_TRUE(Exists(FirefoxName(1)));
}

TEST_F(LinuxUrlCacheTest, Of_more_profiles_than_256_the_rest_is_left_alone) {
  for (int i = 0; i < 300; ++i)
    folder.Write("chromium/" + std::to_string(i) + "/Cache/Cache_Data/" + std::string(16, 'a') + "_0",
                 ChromiumFile("http://a/" + std::to_string(i)));

  EXPECT_EQ(List().size(), 256U);
}

TEST_F(LinuxUrlCacheTest, Without_a_descriptor_left_the_walk_ends_and_later_goes_on_as_before) {
  for (int i = 1; i <= 3; ++i) folder.Write(ChromiumName(i), ChromiumFile("http://a/"));
  const Child other([&] {
    rlimit before{};
    if (::getrlimit(RLIMIT_NOFILE, &before) != 0) return std::string("no limit");
    List(); // the sanitizers need a descriptor when they see a type for the first time
    const rlimit few{3, before.rlim_max};
    ::setrlimit(RLIMIT_NOFILE, &few);
    std::uint32_t size = 0;
    const bool isWalk = cache.FindFirstUrlCacheEntryA(nullptr, nullptr, size) != kNoUrlCacheWalk;
    const auto error = cache.GetLastError();
    ::setrlimit(RLIMIT_NOFILE, &before);
    return std::to_string(isWalk) + " " + std::to_string(error) + " " + std::to_string(List().size());
  });

  EXPECT_EQ(other.Answer(), "0 259 3");
}

TEST_F(LinuxUrlCacheTest, A_file_of_five_gigabytes_costs_a_few_reads) {
  const std::string path = folder.Write(FirefoxName(1), "");
  files::resize_file(path, 5'000'000'000);
  const std::string end = FirefoxFile(":http://a/", "");
  const int file = ::open(path.c_str(), O_WRONLY);
  // What stands at the end tells an empty content, so the header would have to stand near the start.
  ASSERT_EQ(::pwrite(file, end.data(), end.size(), 5'000'000'000), static_cast<ssize_t>(end.size()));
  ::close(file);

  EXPECT_EQ(List(), Names{path});
  DeleteAll();
  EXPECT_FALSE(Exists(FirefoxName(1)));
}

} // namespace
} // namespace quendra::platform::linux_
