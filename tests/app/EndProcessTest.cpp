#include "app/Program.h"
#include "forms/headless/posix/PolledDesktop.h"
#include "monitor/ProcessRow.h"
#include "platform/linux/LinuxFixture.h"
#include "platform/linux/LinuxMachine.h"

#include <gtest/gtest.h>
#include <signal.h>
#include <sys/wait.h>
#include <unistd.h>

// The button that ends processes, on this machine and in the hands of an ordinary user.

namespace quendra::app {
namespace {

using platform::linux_::Child;

constexpr uid_t kOrdinaryUser = 65534;

/// The whole program of a user, on its monitor page.
class UsersProgram {
 public:
  UsersProgram() {
    program_.Start();
    desktop_.Click(program_.frmSplash.Label2);
    desktop_.Click(program_.frmMenu.lblCaption[0]);
    desktop_.Boxes.clear();
  }

  /// Selects the process's row and clicks the button: what became of the row, and each box that came.
  std::string End(pid_t process) {
    const Text key = monitor::KeyOfProcess(static_cast<std::uint32_t>(process));
    forms::ListView& list = program_.monitorPage.table.main_ListView1;
    if (list.Find(key) == nullptr) return "no row";
    list.Select(list.Find(key));
    desktop_.Click(program_.monitorPage.main_lblEndProcess);
    std::string result = list.Find(key) == nullptr ? "gone" : "stays";
    for (const auto& box : desktop_.Boxes) result += "; " + ToUtf8(box.text);
    return result;
  }

 private:
  forms::headless::PolledDesktop desktop_;
  platform::linux_::LinuxMachine machine_{desktop_, desktop_};
  Program program_{machine_.Operations(), desktop_};
};

bool BecomeOrdinary() { return ::setgid(kOrdinaryUser) == 0 && ::setuid(kOrdinaryUser) == 0; }

pid_t StartWaiting() {
  const pid_t process = ::fork();
  if (process != 0) return process;
  ::alarm(60);
  for (;;) ::pause();
}

std::string SignalThatEnded(pid_t process) {
  int status = 0;
  if (platform::linux_::Wait([&] { return ::waitpid(process, &status, WNOHANG) == process; }))
    return std::to_string(WTERMSIG(status));
  ::kill(process, SIGKILL);
  return "nothing";
}

TEST(EndProcessTest, A_user_ends_processes_of_his_own_without_a_box) {
  const Child user([]() -> std::string {
    if (::geteuid() == 0 && !BecomeOrdinary()) return "not an ordinary user";
    const pid_t processes[] = {StartWaiting(), StartWaiting()};
    UsersProgram program;
    std::string result;
    for (const pid_t process : processes) {
      result += program.End(process);
      result += " by " + SignalThatEnded(process) + "\n";
    }
    return result;
  });
  EXPECT_EQ(user.Answer(), "gone by 9\ngone by 9\n");
}

TEST(EndProcessTest, A_user_who_may_not_end_a_process_is_told_so_and_of_nothing_else) {
  if (::geteuid() != 0) GTEST_SKIP() << "needs root: a process that its user may not end";
  const Child ofRoot([] { return std::string(); });
  const Child user([&]() -> std::string {
    if (!BecomeOrdinary()) return "not an ordinary user";
    return UsersProgram().End(ofRoot.Id());
  });
  EXPECT_EQ(user.Answer(), "stays; אין אפשרות לסיים את התהליך!");
  EXPECT_EQ(::kill(ofRoot.Id(), 0), 0);
}

} // namespace
} // namespace quendra::app
