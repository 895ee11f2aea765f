#include "platform/linux/system/FileManager.h"

#include "platform/linux/system/Descriptor.h"
#include "platform/linux/system/LinuxShellStart.h"
#include "platform/linux/system/SessionFixture.h"

#include <sys/socket.h>
#include <sys/un.h>

#include <chrono>

namespace quendra::platform::linux_ {
namespace {

TEST(FileUriTest, Escapes_all_but_letters_digits_and_harmless_signs) {
  EXPECT_EQ(FileUri("/a b/\xD7\x90#%?.txt"), "file:///a%20b/%D7%90%23%25%3F.txt");
}

/// A session whose bus may have a file manager, and whose programs can open a folder.
struct FileManagerTest : SessionTest {
  FileManagerTest() { AddProgram("xdg-open"); }

  bool JumpTo(const std::string& path) {
    return shell.Shell("explorer.exe /n, /e, /select, " + paths.ToSystem(path), ShellStart::kNormalWindow);
  }
  template <typename Work> static double SecondsOf(const Work& work) {
    const auto start = std::chrono::steady_clock::now();
    work();
    return std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
  }

  SystemPaths paths;
  DriveFolder drive{"/nowhere"};
  LinuxShellStart shell{paths, drive};
};

TEST_F(FileManagerTest, The_file_manager_is_asked_for_the_file_and_no_folder_is_opened) {
  StartBus();
  StartService("file-manager shows");
  EXPECT_TRUE(JumpTo("/usr/lib/some program/100%/\u05D3\u05E0\u05D4 #1?"));
  EXPECT_EQ(Asked(), "ShowItems file:///usr/lib/some%20program/100%25/%D7%93%D7%A0%D7%94%20%231%3F\n");
  EXPECT_FALSE(WasStarted("xdg-open"));
}

TEST_F(FileManagerTest, Bytes_that_are_no_text_arrive_as_they_are) {
  StartBus();
  StartService("file-manager shows");
  EXPECT_TRUE(ShowInFileManager("/usr/\xFF\x80\n"));
  EXPECT_EQ(Asked(), "ShowItems file:///usr/%FF%80%0A\n");
}

TEST_F(FileManagerTest, A_file_manager_that_does_not_run_is_started) {
  AddService("org.freedesktop.FileManager1", "file-manager shows");
  StartBus();
  EXPECT_TRUE(ShowInFileManager("/usr/file"));
  EXPECT_EQ(Asked(), "ShowItems file:///usr/file\n");
}

TEST_F(FileManagerTest, A_file_manager_that_does_not_come_up_is_waited_for_three_seconds) {
  folder.Write("services/org.freedesktop.FileManager1.service",
               "[D-BUS Service]\nName=org.freedesktop.FileManager1\nExec=/bin/sleep 10\n");
  StartBus();
  const double seconds = SecondsOf([&] { EXPECT_TRUE(JumpTo("/usr/lib/file")); });
  EXPECT_GT(seconds, 2.9);
  EXPECT_LT(seconds, 6);
  EXPECT_EQ(GivenTo("xdg-open"), "/usr/lib\n");
}

TEST_F(FileManagerTest, A_file_manager_that_refuses_has_the_folder_opened) {
  StartBus();
  StartService("file-manager refuses");
  EXPECT_TRUE(JumpTo("/usr/lib/file"));
  EXPECT_EQ(Asked(), "ShowItems file:///usr/lib/file\n");
  EXPECT_EQ(GivenTo("xdg-open"), "/usr/lib\n");
}

TEST_F(FileManagerTest, A_file_manager_that_never_answers_is_waited_for_a_second_and_the_folder_opened) {
  StartBus();
  StartService("file-manager silent");
  const double seconds = SecondsOf([&] { EXPECT_TRUE(JumpTo("/usr/lib/file")); });
  EXPECT_GT(seconds, 0.9);
  EXPECT_LT(seconds, 3);
  EXPECT_EQ(GivenTo("xdg-open"), "/usr/lib\n");
}

TEST_F(FileManagerTest, A_bus_without_a_file_manager_has_the_folder_opened_at_once) {
  StartBus();
  const double seconds = SecondsOf([&] { EXPECT_TRUE(JumpTo("/usr/lib/file")); });
  EXPECT_LT(seconds, 0.9);
  EXPECT_EQ(GivenTo("xdg-open"), "/usr/lib\n");
}

TEST_F(FileManagerTest, A_bus_that_lets_nobody_in_is_waited_for_a_second) {
  const Descriptor listening(::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0));
  sockaddr_un address{};
  address.sun_family = AF_UNIX;
  (folder / "bus").copy(address.sun_path, sizeof address.sun_path - 1);
  ASSERT_EQ(::bind(listening.Number(), reinterpret_cast<const sockaddr*>(&address), sizeof address), 0);
  ASSERT_EQ(::listen(listening.Number(), 1), 0);
  const double seconds = SecondsOf([] { EXPECT_FALSE(ShowInFileManager("/usr/file")); });
  EXPECT_GT(seconds, 0.9);
  EXPECT_LT(seconds, 3);
}

TEST_F(FileManagerTest, A_file_in_the_root_folder_has_the_root_opened) {
  EXPECT_TRUE(JumpTo("/file"));
  EXPECT_EQ(GivenTo("xdg-open"), "/\n");
}

} // namespace
} // namespace quendra::platform::linux_
