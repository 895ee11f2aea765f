#include "platform/linux/registry/LinuxRegistry.h"

#include "platform/linux/LinuxFixture.h"
#include "platform/linux/system/Files.h"

#include <gtest/gtest.h>
#include <sched.h>
#include <sqlite3.h>
#include <sys/mount.h>
#include <sys/stat.h>
#include <unistd.h>

#include <filesystem>
#include <fstream>

namespace quendra::platform::linux_ {
namespace {

using Bytes = std::vector<std::uint8_t>;

constexpr std::size_t kFileLimit = 100'000'000;

struct LinuxRegistryTest : testing::Test {
  TemporaryFolder folder;
  std::vector<std::string> told;
  const std::string file = folder / "quendra/registry.sqlite";

  LinuxRegistry Registry() {
    return LinuxRegistry(folder / "quendra", [this](const std::string& message) { told.push_back(message); });
  }
  std::string Content(const std::string& path) const { return ReadFile(path, kFileLimit).value_or("none"); }
  static std::uint32_t Write(LinuxRegistry& registry, const std::string& path, std::uint8_t value) {
    RegistryKey key;
    if (const auto error = registry.RegCreateKeyA(kCurrentUser, path, key)) return error;
    const auto error = registry.RegSetValueExA(key, "v", kRegBinary, Bytes{value});
    registry.RegCloseKey(key);
    return error;
  }
  /// The value's one byte, or 1000 and the error.
  static std::uint32_t Read(LinuxRegistry& registry, const std::string& path) {
    RegistryKey key;
    if (const auto error = registry.RegOpenKeyExA(kCurrentUser, path, kKeyRead, key)) return 1000 + error;
    std::uint32_t type = 0;
    std::uint32_t size = 0;
    Bytes data(1);
    const auto error = registry.RegQueryValueExA(key, "v", type, data, size);
    registry.RegCloseKey(key);
    return error == kRegistrySuccess ? data[0] : 1000 + error;
  }
};

TEST_F(LinuxRegistryTest, What_one_run_wrote_the_next_one_reads) {
  {
    auto first = Registry();
    ASSERT_EQ(Write(first, "One", 7), kRegistrySuccess);
  }
  auto second = Registry();

  EXPECT_EQ(Read(second, "one"), 7u);
  EXPECT_TRUE(told.empty());
}

TEST_F(LinuxRegistryTest, Nothing_is_made_before_the_first_call) {
  auto registry = Registry();
  EXPECT_FALSE(std::filesystem::exists(folder / "quendra"));
  Write(registry, "One", 7);
  EXPECT_TRUE(std::filesystem::exists(file));
}

TEST_F(LinuxRegistryTest, Two_programs_see_each_others_values_at_once) {
  auto one = Registry();
  auto other = Registry();
  ASSERT_EQ(Write(one, "One", 1), kRegistrySuccess);
  EXPECT_EQ(Read(other, "One"), 1u);
  ASSERT_EQ(Write(other, "One", 2), kRegistrySuccess);
  EXPECT_EQ(Read(one, "One"), 2u);
}

TEST_F(LinuxRegistryTest, Two_programs_that_write_at_once_lose_nothing) {
  constexpr int kKeys = 12;
  const auto writeAll = [&](const std::string& name) {
    auto registry = Registry();
    for (int i = 0; i < kKeys; ++i)
      if (Write(registry, name + "\\" + std::to_string(i), static_cast<std::uint8_t>(i)) != 0)
        return "failed";
    return "done";
  };
  const Child child([&] { return std::string(writeAll("Child")); });
  EXPECT_EQ(std::string(writeAll("Parent")), "done");
  EXPECT_EQ(child.Answer(), "done");

  auto reader = Registry();
  for (const char* name : {"Child", "Parent"})
    for (std::uint32_t i = 0; i < kKeys; ++i)
      ASSERT_EQ(Read(reader, std::string(name) + "\\" + std::to_string(i)), i) << name;
}

TEST_F(LinuxRegistryTest, A_file_that_another_program_holds_is_busy_and_works_again_later) {
  auto registry = Registry();
  ASSERT_EQ(Write(registry, "One", 1), kRegistrySuccess);
  sqlite3* other = nullptr;
  ASSERT_EQ(sqlite3_open(file.c_str(), &other), SQLITE_OK);
  ASSERT_EQ(sqlite3_exec(other, "BEGIN EXCLUSIVE", nullptr, nullptr, nullptr), SQLITE_OK);

  EXPECT_EQ(Write(registry, "One", 2), kRegistryBusy);

  sqlite3_close(other);
  EXPECT_EQ(Write(registry, "One", 3), kRegistrySuccess);
  EXPECT_EQ(Read(registry, "One"), 3u);
}

TEST_F(LinuxRegistryTest, A_write_that_was_torn_off_is_as_if_it_never_began) {
  {
    auto registry = Registry();
    ASSERT_EQ(Write(registry, "One", 1), kRegistrySuccess);
  }
  // A program that ends in the midst of a change whose pages are in the file already.
  Child([&] {
    sqlite3* database = nullptr;
    sqlite3_open(file.c_str(), &database);
    sqlite3_exec(database, "PRAGMA cache_size = 1; BEGIN; UPDATE data SET bytes = zeroblob(200000)", nullptr,
                 nullptr, nullptr);
    return std::string("torn");
  }).End();
  ASSERT_TRUE(std::filesystem::exists(file + "-journal"));
  auto registry = Registry();

  EXPECT_EQ(Read(registry, "One"), 1u);
  EXPECT_TRUE(told.empty());
}

TEST_F(LinuxRegistryTest, A_broken_file_is_kept_under_another_name_and_told_of_once) {
  const std::string rubbish = "not a database at all, " + std::string(5000, 'x');
  folder.Write("quendra/registry.sqlite", rubbish);
  auto registry = Registry();

  EXPECT_EQ(Write(registry, "One", 1), kRegistrySuccess);
  EXPECT_EQ(Read(registry, "One"), 1u);

  EXPECT_EQ(Content(file + ".damaged-1"), rubbish);
  ASSERT_EQ(told.size(), 1u);
  EXPECT_NE(told[0].find(file + ".damaged-1"), std::string::npos) << told[0];
}

TEST_F(LinuxRegistryTest, A_second_broken_file_doesnt_overwrite_the_first) {
  const std::string one = "one, " + std::string(5000, 'x');
  const std::string two = "two, " + std::string(5000, 'x');
  for (const auto& rubbish : {one, two}) {
    folder.Write("quendra/registry.sqlite", rubbish);
    auto registry = Registry();
    EXPECT_EQ(Write(registry, "One", 1), kRegistrySuccess);
  }
  EXPECT_EQ(Content(file + ".damaged-1"), one);
  EXPECT_EQ(Content(file + ".damaged-2"), two);
}

TEST_F(LinuxRegistryTest, A_file_with_a_damaged_page_is_put_aside_whole) {
  {
    auto registry = Registry();
    ASSERT_EQ(Write(registry, "1", 1), kRegistrySuccess);
    ASSERT_EQ(registry.RegSetValueExA(kCurrentUser, "big", kRegBinary, Bytes(50'000)), kRegistrySuccess);
  }
  std::string content = Content(file);
  ASSERT_GT(content.size(), 8192u);
  for (std::size_t at = 4096; at < content.size(); ++at) content[at] = '\x5A';
  std::ofstream(file, std::ios::binary) << content;
  auto registry = Registry();

  EXPECT_EQ(Read(registry, "1"), 1000u + kKeyNotFound);
  EXPECT_EQ(Content(file + ".damaged-1"), content);
  EXPECT_EQ(told.size(), 1u);
}

TEST_F(LinuxRegistryTest, A_file_of_a_later_edition_is_left_alone) {
  {
    auto registry = Registry();
    Write(registry, "One", 1);
  }
  sqlite3* other = nullptr;
  ASSERT_EQ(sqlite3_open(file.c_str(), &other), SQLITE_OK);
  sqlite3_exec(other, "PRAGMA user_version = 2", nullptr, nullptr, nullptr);
  sqlite3_close(other);
  const std::string before = Content(file);
  auto registry = Registry();

  EXPECT_EQ(Write(registry, "One", 2), kRegistryBroken);
  EXPECT_EQ(Content(file), before);
  EXPECT_TRUE(told.empty());
}

TEST_F(LinuxRegistryTest, An_empty_file_becomes_a_fresh_registry) {
  folder.Write("quendra/registry.sqlite", "");
  auto registry = Registry();

  EXPECT_EQ(Write(registry, "One", 1), kRegistrySuccess);
  EXPECT_TRUE(told.empty());
}

TEST_F(LinuxRegistryTest, A_folder_that_cannot_be_made_denies_access) {
  folder.Write("quendra", "a file where the folder should be");
  auto registry = Registry();

  EXPECT_EQ(Write(registry, "One", 1), kRegistryAccessDenied);
  EXPECT_EQ(Read(registry, "One"), 1000u + kRegistryAccessDenied);
}

TEST_F(LinuxRegistryTest, A_folder_without_rights_denies_access) {
  std::filesystem::create_directory(folder / "quendra");
  ASSERT_EQ(::chmod((folder / "quendra").c_str(), 0500), 0);
  ASSERT_EQ(::chmod(folder.Path().c_str(), 0755), 0);
  // A user without root's rights, in a process of its own.
  Child other([&] {
    if (::geteuid() == 0 && (::setgid(65534) != 0 || ::setuid(65534) != 0)) return std::string("no user");
    auto registry = Registry();
    return std::to_string(Write(registry, "One", 1)) + " " + std::to_string(Read(registry, "One"));
  });

  EXPECT_EQ(other.Answer(), "5 1005");
}

TEST_F(LinuxRegistryTest, A_pipe_at_the_files_place_is_not_waited_on) {
  std::filesystem::create_directory(folder / "quendra");
  ASSERT_EQ(::mkfifo(file.c_str(), 0600), 0);
  auto registry = Registry();

  EXPECT_EQ(Write(registry, "One", 1), kRegistryBroken);
}

TEST_F(LinuxRegistryTest, A_full_disk_is_an_error_and_keeps_what_was_there) {
  if (::geteuid() != 0)
    GTEST_SKIP() << "needs root: mounts a small disk, seen by a process of the test alone";
  const Child other([&] {
    if (::unshare(CLONE_NEWNS) != 0 || ::mount("none", "/", nullptr, MS_REC | MS_PRIVATE, nullptr) != 0 ||
        ::mount("tmpfs", folder.Path().c_str(), "tmpfs", 0, "size=128k") != 0)
      return std::string("no disk");
    auto registry = Registry();
    const auto before = Write(registry, "One", 1);
    const auto error = registry.RegSetValueExA(kCurrentUser, "big", kRegBinary, Bytes(1'000'000));
    return std::to_string(before) + " " + std::to_string(error) + " " + std::to_string(Read(registry, "One"));
  });

  EXPECT_EQ(other.Answer(), "0 112 1");
}

TEST_F(LinuxRegistryTest, The_file_is_the_users_alone) {
  auto registry = Registry();
  Write(registry, "One", 1);
  struct stat status {};
  ASSERT_EQ(::stat((folder / "quendra").c_str(), &status), 0);
  EXPECT_EQ(status.st_mode & 0777U, 0700U);
}

} // namespace
} // namespace quendra::platform::linux_
