#include "platform/linux/LinuxFixture.h"
#include "platform/linux/system/Files.h"

#include <gtest/gtest.h>
#include <sys/stat.h>

#include <cerrno>

namespace quendra::platform::linux_ {

namespace {

TEST(LinuxFiles, A_file_up_to_the_limit_is_read_whole_and_a_longer_one_not_at_all) {
  const TemporaryFolder folder;
  const std::string path = folder.Write("file", std::string(100, 'x'));
  EXPECT_EQ(ReadFile(path, 100), std::string(100, 'x'));
  EXPECT_FALSE(ReadFile(path, 99));
}

TEST(LinuxFiles, An_empty_file_is_an_empty_text) {
  const TemporaryFolder folder;
  EXPECT_EQ(ReadFile(folder.Write("file", ""), 100), "");
}

TEST(LinuxFiles, Folders_pipes_and_devices_are_not_read) {
  const TemporaryFolder folder;
  ASSERT_EQ(::mkfifo((folder / "pipe").c_str(), 0644), 0);
  EXPECT_FALSE(ReadFile(folder / "pipe", 100));
  EXPECT_FALSE(ReadFile(folder.Path(), 100));
  EXPECT_FALSE(ReadFile("/dev/null", 100));
  EXPECT_FALSE(ReadFile(folder / "missing", 100));
}

TEST(LinuxFiles, A_file_that_says_it_is_empty_is_read_up_to_the_limit_all_the_same) {
  const auto text = ReadFile("/proc/self/stat", 100'000);
  ASSERT_TRUE(text);
  EXPECT_FALSE(text->empty());
  EXPECT_FALSE(ReadFile("/proc/self/stat", 10));
}

TEST(LinuxFiles, Folders_are_made_with_all_above_them_for_the_user_alone) {
  const TemporaryFolder folder;
  EXPECT_EQ(MakeFolders(folder / "one/two"), 0);
  EXPECT_EQ(MakeFolders(folder / "one/two"), 0);
  struct stat made {};
  for (const char* name : {"one", "one/two"}) {
    ASSERT_EQ(::stat((folder / name).c_str(), &made), 0);
    EXPECT_EQ(made.st_mode & 0777U, 0700U);
  }
}

TEST(LinuxFiles, A_folder_that_cannot_be_made_says_why_the_first_one_could_not) {
  const TemporaryFolder folder;
  folder.Write("file", "");
  EXPECT_EQ(MakeFolders(folder / "file/two/three"), ENOTDIR);
  EXPECT_EQ(MakeFolders("/proc/one/two/three"), ENOENT);
}

TEST(LinuxFiles, A_number_is_all_of_its_text) {
  EXPECT_EQ(WholeNumber("4294967295"), 4294967295u);
  for (const char* text : {"", "4294967296", "-1", "+1", " 1", "1 ", "1x", "x"})
    EXPECT_FALSE(WholeNumber(text)) << text;
}

TEST(LinuxFiles, A_list_is_parted_at_its_separators_without_empty_parts) {
  using Parts = std::vector<std::string>;
  EXPECT_EQ(Split(":a::bc:", ':'), (Parts{"a", "bc"}));
  EXPECT_EQ(Split("", ':'), Parts{});
  EXPECT_EQ(Split("abc", ':'), Parts{"abc"});
}

} // namespace

} // namespace quendra::platform::linux_
