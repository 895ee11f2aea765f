#include "platform/linux/registry/LinuxRegistryFixture.h"

#include <sched.h>
#include <sqlite3.h>
#include <sys/mount.h>
#include <sys/stat.h>
#include <unistd.h>

#include <filesystem>

namespace quendra::platform::linux_ {
namespace {

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
  static constexpr int kKeys = 100;
  const auto writeAll = [&](const std::string& name) -> std::function<std::string()> {
    return [this, name] {
      auto registry = Registry();
      for (int i = 0; i < kKeys; ++i)
        if (Write(registry, name + "\\" + std::to_string(i), static_cast<std::uint8_t>(i)) != 0)
          return "failed at " + std::to_string(i);
      return std::string("done");
    };
  };

  EXPECT_EQ(AtOnce({writeAll("One"), writeAll("Other")}), (std::vector<std::string>{"done", "done"}));

  auto reader = Registry();
  for (const char* name : {"One", "Other"})
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
