#include "platform/linux/system/LinuxShellStart.h"

#include "platform/linux/system/Descriptor.h"
#include "platform/linux/system/SessionFixture.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <filesystem>

namespace quendra::platform::linux_ {
namespace {

TEST(LinuxShellStartTest, A_command_line_is_parted_at_blanks_that_are_not_in_quotes) {
  using Words = std::vector<std::string>;
  EXPECT_EQ(CommandWords("regsvr32.exe -s \"packetvb.dll\""), (Words{"regsvr32.exe", "-s", "packetvb.dll"}));
  EXPECT_EQ(CommandWords("  \"a b\"c  d\t\"\" "), (Words{"a bc", "d", ""}));
  EXPECT_EQ(CommandWords(""), Words{});
  EXPECT_EQ(CommandWords("\"open"), Words{"open"});
}

TEST(LinuxShellStartTest, A_program_that_does_not_exist_cannot_be_started) {
  SystemPaths paths;
  DriveFolder drive{"/nowhere"};
  LinuxShellStart shell{paths, drive};
  EXPECT_FALSE(shell.Shell("quendra-no-such-program.exe -s \"x.dll\"", ShellStart::kNormalWindow));
  EXPECT_FALSE(shell.Shell("", ShellStart::kNormalWindow));
  EXPECT_FALSE(shell.Shell("\"\"", ShellStart::kNormalWindow));
}

TEST(LinuxShellStartTest, A_file_that_is_no_program_cannot_be_started) {
  const TemporaryFolder folder;
  SystemPaths paths;
  DriveFolder drive{"/nowhere"};
  LinuxShellStart shell{paths, drive};
  EXPECT_FALSE(shell.Shell(folder.Write("text", "touch x\n", true), ShellStart::kNormalWindow));
  EXPECT_FALSE(shell.Shell(folder.Path(), ShellStart::kNormalWindow));
}

TEST(LinuxShellStartTest, A_program_that_has_not_ended_is_not_waited_for) {
  const TemporaryFolder folder;
  ASSERT_EQ(::mkfifo((folder / "pipe").c_str(), 0600), 0);
  SystemPaths paths;
  DriveFolder drive{"/nowhere"};
  LinuxShellStart shell{paths, drive};
  // It waits until somebody opens the pipe's other end, which the test does only after the call.
  ASSERT_TRUE(shell.Shell("cat " + (folder / "pipe"), ShellStart::kNormalWindow));
  const Descriptor end(::open((folder / "pipe").c_str(), O_WRONLY | O_CLOEXEC));
  EXPECT_TRUE(end);
}

TEST(LinuxShellStartTest, A_program_that_was_started_leaves_no_child_behind) {
  const TemporaryFolder folder;
  const std::string done = folder / "with blank";
  SystemPaths paths;
  DriveFolder drive{"/nowhere"};
  LinuxShellStart shell{paths, drive};
  ASSERT_TRUE(shell.Shell("touch \"" + done + "\"", ShellStart::kNormalWindow));
  for (int i = 0; i < 5000 && !std::filesystem::exists(done); ++i) ::usleep(1000);
  EXPECT_TRUE(std::filesystem::exists(done));
  EXPECT_EQ(::waitpid(-1, nullptr, WNOHANG), -1);
  EXPECT_EQ(errno, ECHILD);
}

TEST(LinuxShellStartTest, Signs_that_a_shell_would_understand_are_plain_words) {
  const TemporaryFolder folder;
  SystemPaths paths;
  DriveFolder drive{"/nowhere"};
  LinuxShellStart shell{paths, drive};
  ASSERT_TRUE(shell.Shell("touch " + (folder / "a;b") + " " + (folder / "$HOME"), ShellStart::kNormalWindow));
  for (int i = 0; i < 5000 && !std::filesystem::exists(folder / "$HOME"); ++i) ::usleep(1000);
  EXPECT_TRUE(std::filesystem::exists(folder / "a;b"));
  EXPECT_TRUE(std::filesystem::exists(folder / "$HOME"));
}

/// In a session without a bus.
struct LinuxShellStartInSessionTest : SessionTest {
  SystemPaths paths;
  DriveFolder drive{folder / "drive_c"};
  LinuxShellStart shell{paths, drive};
};

TEST_F(LinuxShellStartInSessionTest,
       A_file_is_shown_by_opening_its_folder_where_no_file_manager_can_be_asked) {
  AddProgram("xdg-open");
  EXPECT_TRUE(
      shell.Shell("explorer.exe /n, /e, /select, /usr/lib/some program/file", ShellStart::kNormalWindow));
  EXPECT_EQ(GivenTo("xdg-open"), "/usr/lib/some program\n");
}

TEST_F(LinuxShellStartInSessionTest, A_file_whose_path_the_code_page_lacks_is_found_by_its_number) {
  AddProgram("xdg-open");
  const std::string path = paths.ToSystem("/usr/\u4e16/file");
  EXPECT_TRUE(shell.Shell("explorer.exe /n, /e, /select, " + path, ShellStart::kNormalWindow));
  EXPECT_EQ(GivenTo("xdg-open"), "/usr/\u4e16\n");
}

TEST_F(LinuxShellStartInSessionTest, The_applet_for_programs_is_the_first_software_centre_that_is_there) {
  AddProgram("plasma-discover");
  EXPECT_TRUE(shell.Shell("rundll32.exe shell32.dll,Control_RunDLL appwiz.cpl,,", ShellStart::kAsItIsShown));
  EXPECT_EQ(GivenTo("plasma-discover"), "\n");
}

TEST_F(LinuxShellStartInSessionTest, A_session_without_such_programs_starts_nothing) {
  EXPECT_FALSE(shell.Shell("explorer.exe /n, /e, /select, /usr/file", ShellStart::kNormalWindow));
  EXPECT_FALSE(shell.Shell("explorer.exe /n, /e, /select, //9/file", ShellStart::kNormalWindow));
  EXPECT_FALSE(shell.Shell("rundll32.exe shell32.dll,Control_RunDLL appwiz.cpl,,", ShellStart::kAsItIsShown));
}

TEST_F(LinuxShellStartInSessionTest, A_file_given_to_the_command_interpreter_is_opened_by_the_desktop) {
  AddProgram("xdg-open");
  const std::string file = folder.Write("drive_c/WINDOWS/bi.prf", "text");
  EXPECT_TRUE(shell.Shell("CMD /c \"C:\\WINDOWS\\bi.prf\"", ShellStart::kHiddenWindow));
  EXPECT_EQ(GivenTo("xdg-open"), file + "\n");
}

TEST_F(LinuxShellStartInSessionTest,
       A_file_with_blanks_signs_and_Hebrew_in_its_name_is_one_word_to_the_opener) {
  AddProgram("xdg-open");
  const std::string file = folder.Write("drive_c/a b/$(x) `;\u05D0", "text");
  EXPECT_TRUE(shell.Shell("CMD /c \"C:\\a b\\$(x) `;\xE0\"", ShellStart::kHiddenWindow));
  EXPECT_EQ(GivenTo("xdg-open"), file + "\n");
}

TEST_F(LinuxShellStartInSessionTest, The_command_interpreter_starts_also_where_nothing_opens_files) {
  folder.Write("drive_c/WINDOWS/bi.prf", "text");
  EXPECT_TRUE(shell.Shell("CMD /c \"C:\\WINDOWS\\bi.prf\"", ShellStart::kHiddenWindow));
}

TEST_F(LinuxShellStartInSessionTest, What_is_no_file_of_the_drive_is_opened_by_nothing) {
  AddProgram("xdg-open");
  folder.Write("outside", "text");
  folder.Write("drive_c/here", "text");
  std::filesystem::create_symlink(folder / "outside", folder / "drive_c/link");
  for (const char* path : {"C:\\missing", "C:\\link", "C:\\..\\outside", "C:\\", "C:\\/here"})
    EXPECT_TRUE(shell.Shell(std::string("CMD /c \"") + path + "\"", ShellStart::kHiddenWindow)) << path;
  EXPECT_FALSE(WasStarted("xdg-open"));
}

TEST_F(LinuxShellStartInSessionTest, Nothing_else_of_the_command_interpreter_is_understood) {
  folder.Write("drive_c/bi.prf", "text");
  for (const char* line : {"CMD", "CMD /c", "CMD /c \"", "CMD /c C:\\bi.prf", "cmd /c \"C:\\bi.prf\"",
                           "CMD /k \"C:\\bi.prf\"", "CMD /c \"C:\\bi.prf\" & \"C:\\bi.prf\"",
                           "CMD /c \"D:\\bi.prf\"", "CMD /c \"bi.prf\"", "CMD /c \"/bin/true\""})
    EXPECT_FALSE(shell.Shell(line, ShellStart::kHiddenWindow)) << line;
}

} // namespace
} // namespace quendra::platform::linux_
