#include "platform/linux/LinuxFixture.h"
#include "platform/linux/process/ProcFolder.h"

#include <gtest/gtest.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>

namespace quendra::platform::linux_ {

namespace {

const std::string kFigures = " S 7 1 1 0 -1 4194304 0 0 0 0 0 0 0 0 20 0 1 0 4711 1 1\n";

TEST(LinuxProcFolder, A_line_of_figures_gives_name_state_parent_and_start) {
  const auto stat = ParseStat("12 (bash)" + kFigures);
  ASSERT_TRUE(stat);
  EXPECT_EQ(stat->comm, "bash");
  EXPECT_EQ(stat->state, 'S');
  EXPECT_EQ(stat->parent, 7u);
  EXPECT_EQ(stat->startTime, 4711u);
  EXPECT_FALSE(stat->isKernelThread);
}

TEST(LinuxProcFolder, A_name_with_brackets_blanks_and_line_breaks_does_not_shift_the_figures) {
  for (const std::string name : {"a) S 1 1", "(", ")", "a\nb", ") Z 2 (", "", " "}) {
    const auto stat = ParseStat("12 (" + name + ")" + kFigures);
    ASSERT_TRUE(stat) << name;
    EXPECT_EQ(stat->comm, name);
    EXPECT_EQ(stat->parent, 7u) << name;
  }
}

TEST(LinuxProcFolder, A_kernel_thread_is_told_by_its_flag) {
  const auto stat = ParseStat("2 (kthreadd) S 0 0 0 0 -1 2129984 0 0 0 0 0 0 0 0 20 0 1 0 3 0 0");
  ASSERT_TRUE(stat);
  EXPECT_TRUE(stat->isKernelThread);
}

TEST(LinuxProcFolder, A_line_cut_anywhere_before_its_start_time_gives_nothing) {
  const std::string line = "12 (bash)" + kFigures;
  const std::size_t start = line.find("4711");
  for (std::size_t length = 0; length <= start; ++length)
    EXPECT_FALSE(ParseStat(std::string_view(line).substr(0, length))) << length;
}

TEST(LinuxProcFolder, Processes_are_listed_in_the_order_of_their_ids_and_nothing_else_is) {
  FakeProc proc;
  for (const std::uint32_t id : {30u, 4u, 200u, 1u}) proc.Add(id, {"a"});
  ASSERT_TRUE(RunShell("cd " + proc.Path() + " && mkdir sys 12x 0 ./-5 007x 99999999999999 && touch uptime"));
  std::vector<ProcFolder::Place> places;
  ASSERT_TRUE(ProcFolder(proc.Path()).List(places));
  std::vector<std::uint32_t> ids;
  for (const auto& place : places) ids.push_back(place.processId);
  EXPECT_EQ(ids, (std::vector<std::uint32_t>{1, 4, 30, 200}));
}

TEST(LinuxProcFolder, A_folder_that_is_not_there_lists_nothing_and_fails) {
  std::vector<ProcFolder::Place> places{{1, 1}};
  const ProcFolder folder("/nowhere/at/all");
  EXPECT_FALSE(folder.List(places));
  EXPECT_TRUE(places.empty());
  EXPECT_FALSE(folder.Stat(1));
  EXPECT_FALSE(folder.Executable(1));
  EXPECT_EQ(folder.SocketOf(1, 3), 0u);
}

TEST(LinuxProcFolder, A_process_that_vanishes_between_two_questions_gives_nothing) {
  FakeProc proc;
  proc.Add(5, {"gone", 1, "/bin/gone"});
  const ProcFolder folder(proc.Path());
  std::vector<ProcFolder::Place> places;
  folder.List(places);
  const Descriptor opened = folder.Open(5);
  proc.Remove(5);
  EXPECT_FALSE(folder.Stat(5));
  EXPECT_FALSE(folder.Executable(5));
  EXPECT_FALSE(ProcFolder::Executable(opened));
  EXPECT_FALSE(folder.UserOf(5));
  EXPECT_FALSE(ProcFolder::Descriptors(folder, 5));
}

TEST(LinuxProcFolder, An_empty_line_of_figures_gives_nothing) {
  FakeProc proc;
  proc.Add(5, {"a"});
  ASSERT_TRUE(RunShell(": > " + proc.FolderOf(5) + "/stat"));
  EXPECT_FALSE(ProcFolder(proc.Path()).Stat(5));
}

TEST(LinuxProcFolder, Only_links_to_sockets_give_a_node_number) {
  FakeProc proc;
  proc.Add(5, {"a"});
  proc.AddSocket(5, 3, 4711);
  proc.AddDescriptor(5, 4, "/dev/null");
  proc.AddDescriptor(5, 5, "pipe:[4711]");
  proc.AddDescriptor(5, 6, "socket:[47x]");
  proc.AddDescriptor(5, 7, "socket:[99999999999]");
  proc.AddDescriptor(5, 8, "socket:[" + std::string(300, '1') + "]");
  const ProcFolder folder(proc.Path());
  EXPECT_EQ(folder.SocketOf(5, 3), 4711u);
  for (std::uint32_t descriptor = 4; descriptor <= 9; ++descriptor)
    EXPECT_EQ(folder.SocketOf(5, descriptor), 0u) << descriptor;
}

TEST(LinuxProcFolder, The_path_of_a_replaced_file_is_told_without_the_kernels_remark) {
  FakeProc proc;
  proc.Add(5, {"browser", 1, "/opt/browser (deleted)"});
  EXPECT_EQ(ProcFolder(proc.Path()).Executable(5), "/opt/browser");
}

/// A copy of a program that waits, started.
struct StartedCopy {
  explicit StartedCopy(const std::string& name)
      : path(folder / name), isCopied(RunShell("cp /bin/sleep '" + path + "'")), child({path, "50"}) {}
  std::optional<std::string> Path() const {
    return ProcFolder().Executable(static_cast<std::uint32_t>(child.Id()));
  }
  bool IsHere() const {
    const ProcFolder proc;
    const auto file = ProcFolder::Executable(proc.Open(static_cast<std::uint32_t>(child.Id())));
    return file && file->isHere;
  }

  TemporaryFolder folder;
  std::string path;
  bool isCopied;
  Child child;
};

TEST(LinuxProcFolder, A_file_that_is_really_named_like_a_deleted_one_keeps_its_whole_name) {
  const StartedCopy tool("tool (deleted)");
  EXPECT_EQ(tool.Path(), tool.path);
  EXPECT_TRUE(tool.IsHere());
}

TEST(LinuxProcFolder, Of_a_deleted_file_that_was_named_like_one_only_the_kernels_remark_is_cut) {
  const StartedCopy tool("tool (deleted)");
  ASSERT_EQ(::unlink(tool.path.c_str()), 0);
  EXPECT_EQ(tool.Path(), tool.path);
}

TEST(LinuxProcFolder, A_file_that_took_the_name_of_the_kernels_remark_does_not_keep_it_on_another) {
  const StartedCopy tool("tool");
  ASSERT_EQ(::unlink(tool.path.c_str()), 0);
  tool.folder.Write("tool (deleted)", "other", true);
  EXPECT_EQ(tool.Path(), tool.path);
}

TEST(LinuxProcFolder, A_process_whose_file_an_update_replaced_still_runs_the_program_of_that_path) {
  const StartedCopy tool("tool");
  ASSERT_EQ(::unlink(tool.path.c_str()), 0);
  EXPECT_TRUE(tool.IsHere());
  tool.folder.Write("tool", "newer", true);
  EXPECT_TRUE(tool.IsHere());
}

TEST(LinuxProcFolder, A_process_whose_file_another_user_replaced_does_not_run_the_program_of_that_path) {
  if (::geteuid() != 0) GTEST_SKIP() << "only the administrator can give a file to another user";
  const StartedCopy tool("tool");
  ASSERT_EQ(::unlink(tool.path.c_str()), 0);
  tool.folder.Write("tool", "other", true);
  ASSERT_EQ(::chown(tool.path.c_str(), 4242, 4242), 0);
  EXPECT_FALSE(tool.IsHere());
}

TEST(LinuxProcFolder, A_process_that_runs_another_file_under_a_path_does_not_run_the_one_that_is_here) {
  if (::geteuid() != 0) GTEST_SKIP() << "only the administrator may mount";
  const TemporaryFolder folder;
  const std::string program = folder.Write("program", "not this one", true);
  const Child child({"/usr/bin/unshare", "--mount", "/bin/sh", "-c",
                     "mount --bind /bin/sleep " + program + " && exec " + program + " 50"});
  const ProcFolder proc;
  const auto id = static_cast<std::uint32_t>(child.Id());
  ASSERT_TRUE(Wait([&] { return proc.Executable(id) == program; }));
  const auto file = ProcFolder::Executable(proc.Open(id));
  ASSERT_TRUE(file);
  EXPECT_FALSE(file->isHere);
}

TEST(LinuxProcFolder, A_process_whose_first_thread_has_ended_is_asked_about_through_another) {
  int ends[2];
  ASSERT_EQ(::socketpair(AF_UNIX, SOCK_STREAM, 0, ends), 0);
  struct stat socket {};
  ASSERT_EQ(::fstat(ends[0], &socket), 0);
  const ProcessWithoutFirstThread process;
  const ProcFolder proc;
  const std::string own = proc.Executable(static_cast<std::uint32_t>(::getpid())).value_or("(none)");
  EXPECT_TRUE(proc.HasLivingThread(process.Id()));
  EXPECT_EQ(proc.Executable(process.Id()), own);
  const auto file = ProcFolder::Executable(proc.Open(process.Id()));
  ASSERT_TRUE(file);
  EXPECT_EQ(file->path, own);
  EXPECT_TRUE(file->isHere);
  EXPECT_EQ(proc.SocketOf(process.Id(), static_cast<std::uint32_t>(ends[0])), socket.st_ino);
  ProcFolder::Descriptors descriptors(proc, process.Id());
  std::vector<std::uint32_t> numbers;
  descriptors.List(numbers);
  EXPECT_TRUE(std::ranges::count(numbers, static_cast<std::uint32_t>(ends[0])));
  EXPECT_EQ(descriptors.SocketOf(static_cast<std::uint32_t>(ends[0])), socket.st_ino);
  ::close(ends[0]);
  ::close(ends[1]);
}

TEST(LinuxProcFolder, A_process_that_has_ended_as_a_whole_has_no_living_thread) {
  FakeProc proc;
  proc.Add(5, {"a", 1, "", 'Z'});
  EXPECT_FALSE(ProcFolder(proc.Path()).HasLivingThread(5));
  for (const std::uint32_t thread : {5u, 6u}) proc.AddThread(5, thread, {"a", 1, "", 'Z'});
  EXPECT_FALSE(ProcFolder(proc.Path()).HasLivingThread(5));
}

TEST(LinuxProcFolder, The_own_process_is_found_in_the_real_folder) {
  const ProcFolder folder;
  const auto stat = folder.Stat(static_cast<std::uint32_t>(::getpid()));
  ASSERT_TRUE(stat);
  EXPECT_EQ(stat->parent, static_cast<std::uint32_t>(::getppid()));
  EXPECT_EQ(folder.UserOf(static_cast<std::uint32_t>(::getpid())), ::geteuid());
}

} // namespace

} // namespace quendra::platform::linux_
