#include "platform/linux/system/UserFolders.h"

#include "platform/linux/LinuxFixture.h"

#include <gtest/gtest.h>

#include <cstdlib>

namespace quendra::platform::linux_ {

TEST(LinuxUserFolders, The_environment_names_the_folders_and_relative_ones_are_passed_over) {
  const Child child([] {
    ::setenv("HOME", "/h", 1);
    ::unsetenv("XDG_DATA_HOME");
    ::unsetenv("XDG_CONFIG_HOME");
    ::setenv("XDG_DATA_DIRS", "/a::relative:/b", 1);
    ::setenv("PATH", ".:/p", 1);
    const UserFolders folders = UserFolders::OfEnvironment();
    std::string text = folders.configHome;
    for (const auto& data : folders.dataDirs) text += " " + data;
    for (const auto& program : folders.programDirs) text += " " + program;
    return text;
  });
  EXPECT_EQ(child.Answer(), "/h/.config /h/.local/share /a /b /p");
}

} // namespace quendra::platform::linux_
