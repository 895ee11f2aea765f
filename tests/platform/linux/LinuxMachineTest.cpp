#include "platform/linux/LinuxMachine.h"
#include "forms/headless/posix/PolledDesktop.h"
#include "platform/linux/LinuxFixture.h"
#include "platform/linux/system/Descriptor.h"
#include "platform/linux/system/FileManager.h"
#include "platform/linux/system/Files.h"
#include "platform/linux/system/LinuxShellStart.h"
#include "platform/linux/system/LinuxSystem.h"
#include "platform/net/HostNames.h"
#include "platform/net/IpHelper.h"
#include "platform/net/Sockets.h"
#include "platform/process/Handles.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <ctime>
#include <filesystem>
#include <fstream>

namespace quendra::platform::linux_ {

namespace {

TEST(LinuxSystemTest, The_version_is_of_the_family_with_a_TCP_owner_table) {
  LinuxSystem system;
  OsVersion version;
  ASSERT_TRUE(system.GetVersionExA(version));
  EXPECT_EQ(version.platformId, 2u);
  EXPECT_EQ(version.majorVersion, 5u);
  EXPECT_EQ(version.minorVersion, 1u);
}

TEST(LinuxSystemTest, The_tick_is_in_milliseconds) {
  std::uint64_t now = 777;
  LinuxSystem system([&] { return now; });
  const std::uint32_t before = system.GetTickCount();
  now += 1500;
  EXPECT_EQ(system.GetTickCount() - before, 1500u);
}

TEST(LinuxSystemTest, The_first_tick_lies_far_above_any_day_number_and_below_the_sign_whatever_the_uptime) {
  for (const std::uint64_t uptime :
       {0ull, 5'000ull, 0x7FFFFFFFull, 0x80000000ull, 0xFFFFFFFFull, 0x1'2345'6789ull}) {
    LinuxSystem system([=] { return uptime; });
    EXPECT_GT(system.GetTickCount(), 1'000'000u) << uptime;
    EXPECT_LT(system.GetTickCount(), 0x40000000u) << uptime;
  }
}

TEST(LinuxSystemTest, The_tick_of_this_machine_does_not_go_back) {
  LinuxSystem system;
  const std::uint32_t before = system.GetTickCount();
  EXPECT_LT(system.GetTickCount() - before, 1000u);
}

TEST(LinuxSystemTest, The_day_is_counted_so_that_day_1_is_31_December_1899) {
  const Child child([] {
    ::setenv("TZ", "UTC", 1);
    ::tzset();
    LinuxSystem system;
    const std::time_t before = std::time(nullptr) / 86400;
    const std::int32_t day = system.DayNumber();
    const std::time_t after = std::time(nullptr) / 86400;
    // 1 January 1970 is day 25569.
    return std::string(day - 25569 >= before && day - 25569 <= after ? "right" : "wrong");
  });
  EXPECT_EQ(child.Answer(), "right");
}

TEST(LinuxShellStartTest, A_command_line_is_parted_at_blanks_that_are_not_in_quotes) {
  using Words = std::vector<std::string>;
  EXPECT_EQ(CommandWords("regsvr32.exe -s \"packetvb.dll\""), (Words{"regsvr32.exe", "-s", "packetvb.dll"}));
  EXPECT_EQ(CommandWords("  \"a b\"c  d\t\"\" "), (Words{"a bc", "d", ""}));
  EXPECT_EQ(CommandWords(""), Words{});
  EXPECT_EQ(CommandWords("\"open"), Words{"open"});
}

TEST(LinuxShellStartTest, A_program_that_does_not_exist_cannot_be_started) {
  SystemPaths paths;
  LinuxShellStart shell{paths};
  EXPECT_FALSE(shell.Shell("quendra-no-such-program.exe -s \"x.dll\"", ShellStart::kNormalWindow));
  EXPECT_FALSE(shell.Shell("", ShellStart::kNormalWindow));
  EXPECT_FALSE(shell.Shell("\"\"", ShellStart::kNormalWindow));
}

TEST(LinuxShellStartTest, A_file_that_is_no_program_cannot_be_started) {
  const TemporaryFolder folder;
  SystemPaths paths;
  LinuxShellStart shell{paths};
  EXPECT_FALSE(shell.Shell(folder.Write("text", "touch x\n", true), ShellStart::kNormalWindow));
  EXPECT_FALSE(shell.Shell(folder.Path(), ShellStart::kNormalWindow));
}

TEST(LinuxShellStartTest, A_program_that_has_not_ended_is_not_waited_for) {
  const TemporaryFolder folder;
  ASSERT_EQ(::mkfifo((folder / "pipe").c_str(), 0600), 0);
  SystemPaths paths;
  LinuxShellStart shell{paths};
  // It waits until somebody opens the pipe's other end, which the test does only after the call.
  ASSERT_TRUE(shell.Shell("cat " + (folder / "pipe"), ShellStart::kNormalWindow));
  const Descriptor end(::open((folder / "pipe").c_str(), O_WRONLY | O_CLOEXEC));
  EXPECT_TRUE(end);
}

TEST(LinuxShellStartTest, A_program_that_was_started_leaves_no_child_behind) {
  const TemporaryFolder folder;
  const std::string done = folder / "with blank";
  SystemPaths paths;
  LinuxShellStart shell{paths};
  ASSERT_TRUE(shell.Shell("touch \"" + done + "\"", ShellStart::kNormalWindow));
  for (int i = 0; i < 5000 && !std::filesystem::exists(done); ++i) ::usleep(1000);
  EXPECT_TRUE(std::filesystem::exists(done));
  EXPECT_EQ(::waitpid(-1, nullptr, WNOHANG), -1);
  EXPECT_EQ(errno, ECHILD);
}

/// A session without a bus, whose only programs are scripts that write down what they were given.
class LinuxSessionTest : public testing::Test {
 protected:
  LinuxSessionTest() {
    ::setenv("PATH", folder_.Path().c_str(), 1);
    ::setenv("DBUS_SESSION_BUS_ADDRESS", ("unix:path=" + (folder_ / "no-bus")).c_str(), 1);
  }
  ~LinuxSessionTest() override {
    Restore("PATH", path_);
    Restore("DBUS_SESSION_BUS_ADDRESS", bus_);
  }
  void AddProgram(const std::string& name) {
    folder_.Write(name,
                  "#!/bin/sh\necho \"$*\" > " + (folder_ / name) + ".part\n/bin/mv " + (folder_ / name) +
                      ".part " + (folder_ / name) + ".given\n",
                  true);
  }
  /// Waits for the program.
  std::string GivenTo(const std::string& name) {
    std::optional<std::string> given;
    Wait([&] { return (given = ReadFile((folder_ / name) + ".given", 1000)).has_value(); });
    return given.value_or("not started");
  }

  SystemPaths paths;
  LinuxShellStart shell{paths};

 private:
  static std::optional<std::string> Now(const char* name) {
    const char* value = ::getenv(name);
    return value == nullptr ? std::nullopt : std::optional<std::string>(value);
  }
  static void Restore(const char* name, const std::optional<std::string>& value) {
    value ? ::setenv(name, value->c_str(), 1) : ::unsetenv(name);
  }

  TemporaryFolder folder_;
  std::optional<std::string> path_ = Now("PATH");
  std::optional<std::string> bus_ = Now("DBUS_SESSION_BUS_ADDRESS");
};

TEST_F(LinuxSessionTest, A_file_is_shown_by_opening_its_folder_where_no_file_manager_can_be_asked) {
  AddProgram("xdg-open");
  EXPECT_TRUE(
      shell.Shell("explorer.exe /n, /e, /select, /usr/lib/some program/file", ShellStart::kNormalWindow));
  EXPECT_EQ(GivenTo("xdg-open"), "/usr/lib/some program\n");
}

TEST_F(LinuxSessionTest, A_file_whose_path_the_code_page_lacks_is_found_by_its_number) {
  AddProgram("xdg-open");
  const std::string path = paths.ToSystem("/usr/\u4e16/file");
  EXPECT_TRUE(shell.Shell("explorer.exe /n, /e, /select, " + path, ShellStart::kNormalWindow));
  EXPECT_EQ(GivenTo("xdg-open"), "/usr/\u4e16\n");
}

TEST_F(LinuxSessionTest, The_applet_for_programs_is_the_first_software_centre_that_is_there) {
  AddProgram("plasma-discover");
  EXPECT_TRUE(shell.Shell("rundll32.exe shell32.dll,Control_RunDLL appwiz.cpl,,", ShellStart::kAsItIsShown));
  EXPECT_EQ(GivenTo("plasma-discover"), "\n");
}

TEST_F(LinuxSessionTest, A_session_without_such_programs_starts_nothing) {
  EXPECT_FALSE(shell.Shell("explorer.exe /n, /e, /select, /usr/file", ShellStart::kNormalWindow));
  EXPECT_FALSE(shell.Shell("explorer.exe /n, /e, /select, //9/file", ShellStart::kNormalWindow));
  EXPECT_FALSE(shell.Shell("rundll32.exe shell32.dll,Control_RunDLL appwiz.cpl,,", ShellStart::kAsItIsShown));
}

TEST(FileUriTest, Escapes_all_but_letters_digits_and_harmless_signs) {
  EXPECT_EQ(FileUri("/a b/\xD7\x90#%?.txt"), "file:///a%20b/%D7%90%23%25%3F.txt");
}

TEST(LinuxShellStartTest, Signs_that_a_shell_would_understand_are_plain_words) {
  const TemporaryFolder folder;
  SystemPaths paths;
  LinuxShellStart shell{paths};
  ASSERT_TRUE(shell.Shell("touch " + (folder / "a;b") + " " + (folder / "$HOME"), ShellStart::kNormalWindow));
  for (int i = 0; i < 5000 && !std::filesystem::exists(folder / "$HOME"); ++i) ::usleep(1000);
  EXPECT_TRUE(std::filesystem::exists(folder / "a;b"));
  EXPECT_TRUE(std::filesystem::exists(folder / "$HOME"));
}

struct LinuxMachineTest : testing::Test {
  forms::headless::PolledDesktop desktop;
  LinuxMachine machine{desktop, desktop};
  Machine operations = machine.Operations();
};

TEST_F(LinuxMachineTest, Operations_that_this_system_lacks_answer_that_they_are_not_available) {
  std::uint8_t buffer[64] = {};
  std::uint32_t returned = 1;
  EXPECT_EQ(operations.handles.NtQuerySystemInformation(16, buffer, returned),
            Handles::kStatusNotImplemented);
  EXPECT_EQ(operations.handles.NtQueryObject(Handle(4), 1, buffer, returned), Handles::kStatusNotImplemented);
  EXPECT_EQ(operations.handles.NtDeviceIoControlFile(Handle(4), Handle(), 0x210012, buffer, buffer),
            Handles::kStatusNotImplemented);
  Handle duplicate;
  EXPECT_FALSE(operations.handles.DuplicateHandle(Handle(4), Handle(4), Handle(4), duplicate, 0, false, 0));
  EXPECT_EQ(operations.sockets.recv(SocketHandle(4), buffer, 0), -1);
  EXPECT_EQ(operations.sockets.WSAAsyncSelect(SocketHandle(4), WindowHandle(1), 1, 1), -1);
  EXPECT_EQ(operations.sockets.closesocket(SocketHandle(4)), -1);
  EXPECT_FALSE(operations.sockets.WSAIsBlocking());
}

TEST_F(LinuxMachineTest, The_own_process_is_in_the_snapshot_under_its_file_name) {
  const Handle snapshot = operations.processes.CreateToolhelp32Snapshot(Processes::kSnapProcess, 0);
  ASSERT_NE(snapshot, kInvalidHandle);
  Processes::Entry entry;
  std::string name = "(none)";
  for (bool more = operations.processes.Process32First(snapshot, entry); more;
       more = operations.processes.Process32Next(snapshot, entry))
    if (entry.processId == static_cast<std::uint32_t>(::getpid())) name = entry.exeFile.data();
  EXPECT_EQ(name, "platform_test");
  EXPECT_TRUE(operations.processes.CloseHandle(snapshot));
}

TEST_F(LinuxMachineTest, A_user_without_rights_gets_snapshot_table_and_host_addresses) {
  if (::geteuid() != 0) GTEST_SKIP() << "needs the administrator to become another user";
  const Child user([] {
    if (::setgid(65534) != 0 || ::setuid(65534) != 0) return std::string("no other user");
    forms::headless::PolledDesktop loop;
    LinuxMachine limited(loop, loop);
    const Machine machine = limited.Operations();
    std::string text;
    Processes::Entry entry;
    const Handle snapshot = machine.processes.CreateToolhelp32Snapshot(Processes::kSnapProcess, 0);
    for (bool more = machine.processes.Process32First(snapshot, entry); more;
         more = machine.processes.Process32Next(snapshot, entry))
      if (entry.processId == 1) text += entry.exeFile.data();
    const Handle first = machine.processes.OpenProcess(1040, false, 1);
    ModuleHandle modules[50] = {};
    if (!machine.processes.EnumProcessModules(first, modules)) text += ", no path";
    IpHelper::TcpTable table;
    if (machine.ipHelper.AllocateAndGetTcpExTableFromStack(table) == 0) text += ", a table";
    if (machine.hostNames.gethostname()) text += ", a name";
    return text;
  });
  EXPECT_EQ(user.Answer(), "services.exe, no path, a table, a name");
}

} // namespace

} // namespace quendra::platform::linux_
