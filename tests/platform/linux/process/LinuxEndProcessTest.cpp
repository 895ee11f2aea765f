#include "platform/linux/LinuxFixture.h"
#include "platform/linux/process/LinuxProcesses.h"

#include <gtest/gtest.h>
#include <signal.h>
#include <sys/wait.h>

namespace quendra::platform::linux_ {
namespace {

class LinuxEndProcessTest : public testing::Test {
 protected:
  Handle OpenToEnd(std::uint32_t processId) {
    return processes.OpenProcess(Processes::kTerminate, false, processId);
  }
  void TakeSnapshot() {
    processes.CloseHandle(processes.CreateToolhelp32Snapshot(Processes::kSnapProcess, 0));
  }

  ProcFolder folder;
  HandleTable handles;
  SystemPaths paths;
  LinuxProcesses processes{folder, handles, paths};
};

/// A child that waits, and what it ended by.
class WaitingChild {
 public:
  explicit WaitingChild(std::uint32_t user = 0) : id_(::fork()) {
    if (id_ != 0) return;
    ::alarm(60);
    if (user != 0 && ::setuid(user) != 0) ::_exit(1);
    for (;;) ::pause();
  }
  ~WaitingChild() {
    ::kill(id_, SIGKILL);
    Ending();
  }
  std::uint32_t Id() const { return static_cast<std::uint32_t>(id_); }
  /// The signal that ended it. Waits.
  int Ending() {
    int status = 0;
    if (!waited_ && ::waitpid(id_, &status, 0) == id_) signal_ = WIFSIGNALED(status) ? WTERMSIG(status) : 0;
    waited_ = true;
    return signal_;
  }

 private:
  pid_t id_;
  bool waited_ = false;
  int signal_ = 0;
};

TEST_F(LinuxEndProcessTest, A_process_is_killed_and_no_error_is_left) {
  WaitingChild child;
  TakeSnapshot();
  const Handle process = OpenToEnd(child.Id());
  ASSERT_NE(process, kNoHandle);
  processes.OpenProcess(0, false, 0); // leaves an error
  ASSERT_NE(processes.GetLastError(), 0U);
  EXPECT_TRUE(processes.TerminateProcess(process, 0));
  EXPECT_EQ(processes.GetLastError(), 0U);
  EXPECT_EQ(child.Ending(), SIGKILL);
  EXPECT_TRUE(processes.CloseHandle(process));
}

TEST_F(LinuxEndProcessTest, A_process_that_ends_meanwhile_is_refused) {
  WaitingChild child;
  const Handle process = OpenToEnd(child.Id());
  ::kill(static_cast<pid_t>(child.Id()), SIGKILL);
  child.Ending();
  EXPECT_FALSE(processes.TerminateProcess(process, 0));
  EXPECT_EQ(processes.GetLastError(), kAccessDenied);
}

TEST_F(LinuxEndProcessTest, A_process_that_has_ended_cannot_be_opened) {
  WaitingChild child;
  TakeSnapshot();
  ::kill(static_cast<pid_t>(child.Id()), SIGKILL);
  child.Ending();
  EXPECT_EQ(OpenToEnd(child.Id()), kNoHandle);
  EXPECT_EQ(processes.GetLastError(), kInvalidParameter);
}

TEST_F(LinuxEndProcessTest, A_process_that_took_over_the_id_of_a_shown_one_is_left_alone) {
  WaitingChild child;
  const std::uint32_t id = child.Id();
  FakeProc proc;
  proc.Add(id, {"old", 1, "", 'S', false, 100});
  const ProcFolder fake(proc.Path());
  LinuxProcesses others(fake, handles, paths);
  others.CloseHandle(others.CreateToolhelp32Snapshot(Processes::kSnapProcess, 0));
  proc.TakeOver(id, {"new", 1, "", 'S', false, 200});
  EXPECT_EQ(others.OpenProcess(Processes::kTerminate, false, id), kNoHandle);
  EXPECT_EQ(others.GetLastError(), kInvalidParameter);
  others.CloseHandle(others.CreateToolhelp32Snapshot(Processes::kSnapProcess, 0));
  EXPECT_NE(others.OpenProcess(Processes::kTerminate, false, id), kNoHandle);
}

TEST_F(LinuxEndProcessTest, The_first_process_and_the_kernels_own_are_refused) {
  EXPECT_EQ(OpenToEnd(1), kNoHandle);
  EXPECT_EQ(processes.GetLastError(), kAccessDenied);
  const auto id = static_cast<std::uint32_t>(::getpid());
  FakeProc proc;
  proc.Add(id, {"kworker", 2, "", 'S', true});
  const ProcFolder fake(proc.Path());
  LinuxProcesses others(fake, handles, paths);
  EXPECT_EQ(others.OpenProcess(Processes::kTerminate, false, id), kNoHandle);
  EXPECT_EQ(others.GetLastError(), kAccessDenied);
}

TEST_F(LinuxEndProcessTest, The_idle_process_is_refused) { EXPECT_EQ(OpenToEnd(0), kNoHandle); }

TEST_F(LinuxEndProcessTest, A_handle_of_nothing_or_for_another_purpose_ends_nothing) {
  WaitingChild child;
  EXPECT_FALSE(processes.TerminateProcess(kNoHandle, 0));
  EXPECT_EQ(processes.GetLastError(), kErrorInvalidHandle);
  const Handle process = processes.OpenProcess(1040, false, child.Id());
  EXPECT_FALSE(processes.TerminateProcess(process, 0));
  EXPECT_EQ(processes.GetLastError(), kAccessDenied);
  EXPECT_EQ(::kill(static_cast<pid_t>(child.Id()), 0), 0);
}

TEST_F(LinuxEndProcessTest, A_process_of_another_user_is_refused_to_who_may_not_end_it) {
  if (::geteuid() != 0) GTEST_SKIP() << "becoming another user needs root";
  WaitingChild ofRoot;
  const Child asking([&]() -> std::string {
    if (::setuid(65534) != 0) return "not another user";
    const Handle process = OpenToEnd(ofRoot.Id());
    if (process == kNoHandle) return "not opened";
    const bool ended = processes.TerminateProcess(process, 0);
    return (ended ? "ended " : "refused ") + std::to_string(processes.GetLastError());
  });
  EXPECT_EQ(asking.Answer(), "refused 5");
  EXPECT_EQ(::kill(static_cast<pid_t>(ofRoot.Id()), 0), 0);
}

TEST_F(LinuxEndProcessTest, The_program_can_end_itself) {
  const pid_t child = ::fork();
  if (child == 0) {
    processes.TerminateProcess(OpenToEnd(static_cast<std::uint32_t>(::getpid())), 0);
    ::_exit(0);
  }
  int status = 0;
  ASSERT_EQ(::waitpid(child, &status, 0), child);
  EXPECT_TRUE(WIFSIGNALED(status));
  EXPECT_EQ(WTERMSIG(status), SIGKILL);
}

TEST_F(LinuxEndProcessTest, Asking_for_the_own_process_leaves_no_error) {
  processes.OpenProcess(0, false, 0);
  ASSERT_NE(processes.GetLastError(), 0U);
  processes.GetCurrentProcess();
  EXPECT_EQ(processes.GetLastError(), 0U);
}

} // namespace
} // namespace quendra::platform::linux_
