#include "platform/linux/LinuxFixture.h"
#include "platform/linux/process/ProcessList.h"
#include "platform/linux/system/Files.h"
#include "runtime/Text.h"

#include <gtest/gtest.h>
#include <linux/sched.h>
#include <signal.h>
#include <sys/syscall.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>

namespace quendra::platform::linux_ {

namespace {

struct LinuxProcessList : testing::Test {
  FakeProc proc;
  TestClock clock;
  ProcFolder folder{proc.Path()};
  ProcessList list{folder, clock.AsClock()};

  std::vector<ProcessList::Row> Rows() {
    std::vector<ProcessList::Row> rows;
    EXPECT_TRUE(list.Read(rows));
    return rows;
  }
  /// The process's name, "(none)" without a row.
  std::string NameOf(std::uint32_t processId) {
    for (const auto& row : Rows())
      if (row.processId == processId) return row.name;
    return "(none)";
  }
};

TEST_F(LinuxProcessList, Process_1_stands_as_services_exe) {
  proc.Add(1, {"systemd", 0, "/usr/lib/systemd/systemd"});
  EXPECT_EQ(NameOf(1), "services.exe");
}

TEST_F(LinuxProcessList, The_parent_of_the_kernels_threads_stands_as_System_and_they_under_their_own_names) {
  proc.Add(2, {"kthreadd", 0, "", 'S', true});
  proc.Add(3, {"kworker/0:1-events", 2, "", 'I', true});
  EXPECT_EQ(NameOf(2), "System");
  EXPECT_EQ(NameOf(3), "kworker/0:1-events");
}

TEST_F(LinuxProcessList, A_process_that_calls_itself_kthreadd_is_not_System) {
  proc.Add(2, {"kthreadd", 0, "/home/user/kthreadd"});
  EXPECT_EQ(NameOf(2), "kthreadd");
}

TEST_F(LinuxProcessList, A_process_goes_by_its_executables_file_name) {
  proc.Add(9, {"Web Content", 4, "/usr/lib/browser/browser-bin"});
  const auto rows = Rows();
  ASSERT_EQ(rows.size(), 1u);
  EXPECT_EQ(rows[0].name, "browser-bin");
  EXPECT_EQ(rows[0].parentProcessId, 4u);
}

TEST_F(LinuxProcessList, A_process_whose_executable_is_not_to_be_seen_goes_by_the_kernels_name_for_it) {
  proc.Add(9, {"sshd", 1});
  EXPECT_EQ(NameOf(9), "sshd");
}

TEST_F(LinuxProcessList, A_process_without_any_name_is_a_question_mark) {
  proc.Add(9, {"", 1});
  EXPECT_EQ(NameOf(9), "?");
}

TEST_F(LinuxProcessList, The_desktop_shell_stands_as_explorer_exe) {
  proc.Add(9, {"gnome-shell", 1, "/usr/bin/gnome-shell"});
  EXPECT_EQ(NameOf(9), "explorer.exe");
}

TEST_F(LinuxProcessList, Of_several_desktop_shells_the_first_of_the_preferred_kind_is_explorer_exe) {
  proc.Add(8, {"openbox", 1, "/usr/bin/openbox"});
  proc.Add(9, {"xfce4-panel", 1, "/usr/bin/xfce4-panel"});
  proc.Add(10, {"xfce4-panel", 1, "/usr/bin/xfce4-panel"});
  EXPECT_EQ(NameOf(8), "openbox");
  EXPECT_EQ(NameOf(9), "explorer.exe");
  EXPECT_EQ(NameOf(10), "xfce4-panel");
}

TEST_F(LinuxProcessList, The_next_desktop_shell_becomes_explorer_exe_when_the_first_has_ended) {
  proc.Add(8, {"openbox", 1, "/usr/bin/openbox"});
  proc.Add(9, {"xfce4-panel", 1, "/usr/bin/xfce4-panel"});
  Rows();
  proc.Remove(9);
  EXPECT_EQ(NameOf(8), "explorer.exe");
}

TEST_F(LinuxProcessList, Another_users_desktop_shell_keeps_its_name) {
  if (::geteuid() != 0) GTEST_SKIP() << "only the administrator can give a folder to another user";
  ::setenv("SUDO_UID", "4242", 1);
  proc.Add(8, {"gnome-shell", 1, "/usr/bin/gnome-shell"});
  proc.Add(9, {"openbox", 1, "/usr/bin/openbox"});
  ASSERT_EQ(::chown(proc.FolderOf(9).c_str(), 4242, 4242), 0);
  EXPECT_EQ(NameOf(8), "gnome-shell");
  EXPECT_EQ(NameOf(9), "explorer.exe");
  ::unsetenv("SUDO_UID");
}

TEST_F(LinuxProcessList, A_process_that_has_ended_and_waits_for_its_parent_is_left_out) {
  proc.Add(9, {"done", 1, "", 'Z'});
  EXPECT_EQ(NameOf(9), "(none)");
}

TEST_F(LinuxProcessList, A_process_whose_first_thread_alone_has_ended_keeps_its_row_and_its_name) {
  proc.Add(9, {"Main", 4, "", 'Z'});
  proc.AddThread(9, 9, {"Main", 4, "", 'Z'});
  proc.AddThread(9, 10, {"Worker", 4, "/usr/bin/worker"});
  EXPECT_EQ(NameOf(9), "worker");
}

TEST_F(LinuxProcessList, System_comes_first_as_the_parent_of_itself_and_of_process_1) {
  proc.Add(1, {"systemd", 0, "/usr/lib/systemd/systemd", 'S', false, 1});
  proc.Add(2, {"kthreadd", 0, "", 'S', true, 1});
  proc.Add(3, {"kworker/0:1", 2, "", 'I', true, 1});
  const auto rows = Rows();
  ASSERT_EQ(rows.size(), 3u);
  EXPECT_EQ(rows[0].name, "System");
  EXPECT_EQ(rows[0].parentProcessId, 2u);
  EXPECT_EQ(rows[1].name, "services.exe");
  EXPECT_EQ(rows[1].parentProcessId, 2u);
  EXPECT_EQ(rows[2].parentProcessId, 2u);
}

TEST_F(LinuxProcessList, A_parent_that_cannot_be_seen_is_no_processs_id) {
  proc.Add(1, {"init", 0, "/sbin/init"});
  EXPECT_EQ(Rows()[0].parentProcessId, 0xFFFFFFFFu);
}

TEST_F(LinuxProcessList, Processes_come_in_the_order_of_their_starts_also_when_the_ids_have_begun_anew) {
  proc.Add(300, {"young", 32000, "/bin/young", 'S', false, 900});
  proc.Add(32000, {"old", 1, "/bin/old", 'S', false, 800});
  proc.Add(31000, {"older", 1, "/bin/older", 'S', false, 700});
  std::vector<std::uint32_t> ids;
  for (const auto& row : Rows()) ids.push_back(row.processId);
  EXPECT_EQ(ids, (std::vector<std::uint32_t>{31000, 32000, 300}));
}

TEST_F(LinuxProcessList, A_Hebrew_file_name_comes_in_the_code_page) {
  proc.Add(9, {"x", 1, "/home/user/דפדפן"});
  EXPECT_EQ(NameOf(9), ToCodePage(u"דפדפן"));
}

TEST_F(LinuxProcessList, Line_breaks_controls_and_direction_overrides_become_question_marks) {
  proc.Add(9, {"x", 1,
               "/home/user/a\nb\rc\x1B"
               "d\x7F"
               "e\u202Ef\u2066g\u200Fh"});
  EXPECT_EQ(NameOf(9), "a?b?c?d?e?f?g?h");
}

TEST_F(LinuxProcessList, Bytes_that_are_no_text_become_question_marks) {
  proc.Add(9, {"\xFF\xFE", 1});
  EXPECT_EQ(NameOf(9), "??");
}

TEST_F(LinuxProcessList, A_name_of_4_KB_is_cut_to_259_bytes) {
  proc.Add(9, {"x", 1, "/" + std::string(3000, 'n')});
  EXPECT_EQ(NameOf(9), std::string(259, 'n'));
}

TEST_F(LinuxProcessList, A_young_process_that_becomes_another_program_gets_the_new_name) {
  proc.Add(9, {"bash", 1, "/bin/bash"});
  Rows();
  proc.Change(9, {"curl", 1, "/usr/bin/curl"});
  clock.now += ProcessList::kYoungMilliseconds;
  EXPECT_EQ(NameOf(9), "curl");
}

TEST_F(LinuxProcessList, An_older_process_that_becomes_another_program_gets_the_new_name_within_15_seconds) {
  proc.Add(9, {"bash", 1, "/bin/bash"});
  for (int second = 0; second < 5; ++second, clock.now += 1000) Rows();
  proc.Change(9, {"curl", 1, "/usr/bin/curl"});
  EXPECT_EQ(NameOf(9), "bash");
  for (int second = 0; second < 15; ++second, clock.now += 1000) Rows();
  EXPECT_EQ(NameOf(9), "curl");
}

TEST_F(LinuxProcessList, After_a_pause_every_process_is_looked_at_again) {
  for (std::uint32_t id = 100; id < 200; ++id) proc.Add(id, {"bash", 1, "/bin/bash"});
  Rows();
  for (std::uint32_t id = 100; id < 200; ++id) proc.Change(id, {"curl", 1, "/usr/bin/curl"});
  clock.now += 60'000;
  for (const auto& row : Rows()) EXPECT_EQ(row.name, "curl");
}

TEST_F(LinuxProcessList, A_process_that_takes_over_an_id_gets_its_own_name_at_once) {
  proc.Add(9, {"bash", 1, "/bin/bash"});
  for (int second = 0; second < 5; ++second, clock.now += 1000) Rows();
  proc.TakeOver(9, {"bash", 3, "/opt/other/shell", 'S', false, 200});
  const auto rows = Rows();
  ASSERT_EQ(rows.size(), 1u);
  EXPECT_EQ(rows[0].name, "shell");
  EXPECT_EQ(rows[0].parentProcessId, 3u);
}

TEST_F(LinuxProcessList, A_process_without_figures_is_left_out) {
  proc.Add(8, {"a", 1, "/bin/a"});
  proc.Add(9, {"b", 1, "/bin/b"});
  ASSERT_TRUE(RunShell("rm " + proc.FolderOf(8) + "/stat"));
  EXPECT_EQ(NameOf(8), "(none)");
  EXPECT_EQ(NameOf(9), "b");
}

TEST(LinuxProcessListOfThisMachine, Programs_under_hostile_file_names_are_listed_under_cleaned_ones) {
  const TemporaryFolder folder;
  const std::vector<std::pair<std::string, std::string>> cases = {
      {"two\nlines", "two?lines"},
      {"תוכנה", ToCodePage(u"תוכנה")},
      {"txt.\u202Eexe.cod", "txt.?exe.cod"},
      {std::string(255, 'w'), std::string(255, 'w')},
      {"a) R 1 (b", "a) R 1 (b"},
  };
  const ProcFolder proc;
  ProcessList list(proc);
  for (const auto& [fileName, name] : cases) {
    ASSERT_EQ(::symlink("/bin/sleep", (folder / "unused").c_str()), 0);
    ::unlink((folder / "unused").c_str());
    ASSERT_TRUE(RunShell("cp /bin/sleep " + folder.Path() + "/program"));
    ASSERT_EQ(::rename((folder / "program").c_str(), (folder / fileName).c_str()), 0);
    const Child child(std::vector<std::string>{folder / fileName, "50"});
    ASSERT_EQ(child.Answer(), "");
    std::vector<ProcessList::Row> rows;
    ASSERT_TRUE(list.Read(rows));
    std::string found = "(none)";
    for (const auto& row : rows)
      if (row.processId == static_cast<std::uint32_t>(child.Id())) found = row.name;
    EXPECT_EQ(found, name);
  }
}

TEST(LinuxProcessListOfThisMachine, A_process_whose_first_thread_has_ended_has_its_row) {
  const ProcessWithoutFirstThread process;
  const ProcFolder proc;
  ProcessList list(proc);
  std::vector<ProcessList::Row> rows;
  ASSERT_TRUE(list.Read(rows));
  const auto row = std::ranges::find(rows, process.Id(), &ProcessList::Row::processId);
  ASSERT_NE(row, rows.end());
  EXPECT_EQ(row->name, "platform_test");
}

TEST(LinuxProcessListOfThisMachine, Processes_that_vanish_while_they_are_read_do_no_harm) {
  const ProcFolder proc;
  ProcessList list(proc);
  const auto own = static_cast<std::uint32_t>(::getpid());
  // A child that starts 400 short-lived children while the list is read.
  const pid_t busy = ::fork();
  if (busy == 0) {
    ::alarm(30);
    for (int i = 0; i < 400; ++i) {
      const pid_t child = ::fork();
      if (child == 0) ::_exit(0);
      if (child > 0) ::waitpid(child, nullptr, 0);
    }
    ::_exit(0);
  }
  ASSERT_GT(busy, 0);
  std::vector<ProcessList::Row> rows;
  int passes = 0;
  while (::waitpid(busy, nullptr, WNOHANG) == 0 && ++passes < 100'000) {
    ASSERT_TRUE(list.Read(rows));
    int self = 0;
    for (const auto& row : rows) self += row.processId == own;
    ASSERT_EQ(self, 1);
  }
  EXPECT_GT(passes, 0);
}

/// A process under an id of choice that becomes `program`.
pid_t StartUnder(pid_t id, const char* program) {
  clone_args arguments{};
  arguments.exit_signal = SIGCHLD;
  arguments.set_tid = reinterpret_cast<std::uint64_t>(&id);
  arguments.set_tid_size = 1;
  const pid_t child = static_cast<pid_t>(::syscall(SYS_clone3, &arguments, sizeof arguments));
  if (child == 0) {
    ::execl(program, program, "50", nullptr);
    ::_exit(127);
  }
  return child;
}

TEST(LinuxProcessListOfThisMachine, A_real_process_that_takes_over_an_id_is_told_from_the_one_before) {
  if (::geteuid() != 0) GTEST_SKIP() << "only the administrator can choose a process id";
  const TemporaryFolder folder;
  ASSERT_TRUE(RunShell("cp /bin/sleep " + folder.Path() + "/one && cp /bin/sleep " + folder.Path() + "/two"));
  const ProcFolder proc;
  TestClock clock;
  ProcessList list(proc, clock.AsClock());
  const auto nameOf = [&](pid_t id) {
    std::vector<ProcessList::Row> rows;
    list.Read(rows);
    for (const auto& row : rows)
      if (row.processId == static_cast<std::uint32_t>(id)) return row.name;
    return std::string("(none)");
  };
  const auto waitForName = [&](pid_t id, const std::string& name) {
    for (int i = 0; i < 2000 && proc.Executable(static_cast<std::uint32_t>(id)) != folder / name; ++i)
      ::usleep(1000);
  };
  // An id that no other process gets meanwhile: one of the last, which the system gives out after all others.
  pid_t wanted = std::stoi(ReadFile("/proc/sys/kernel/pid_max", 100).value_or("32768"));
  pid_t first = -1;
  for (int i = 0; i < 20 && first < 0; ++i) first = StartUnder(--wanted, (folder / "one").c_str());
  if (first < 0 && errno != EEXIST) GTEST_SKIP() << "this kernel lets nobody choose a process id";
  ASSERT_EQ(first, wanted);
  waitForName(first, "one");
  for (int second = 0; second < 5; ++second, clock.now += 1000) EXPECT_EQ(nameOf(first), "one");
  ::kill(first, SIGKILL);
  ::waitpid(first, nullptr, 0);
  const pid_t second = StartUnder(wanted, (folder / "two").c_str());
  ASSERT_EQ(second, wanted);
  waitForName(second, "two");
  EXPECT_EQ(nameOf(second), "two");
  ::kill(second, SIGKILL);
  ::waitpid(second, nullptr, 0);
}

} // namespace

} // namespace quendra::platform::linux_
