#include "app/Program.h"
#include "app/windows/StartedProgram.h"
#include "forms/win32/Win32Driver.h"
#include "platform/windows/WindowsMachine.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <iostream>
#include <memory>

// How long the user waits. The best of several runs, for whatever else the machine does comes on top.

namespace quendra::app::windows {
namespace {

int Milliseconds(const std::function<void()>& work) {
  const DWORD start = ::GetTickCount();
  work();
  return static_cast<int>(::GetTickCount() - start);
}

int Best(const char* what, std::vector<int> figures) {
  std::sort(figures.begin(), figures.end());
  std::cout << what << ", ms:";
  for (const int figure : figures) std::cout << ' ' << figure;
  std::cout << '\n';
  return figures.front();
}

void ReadListOfProcesses(platform::Processes& processes) {
  const platform::Handle snapshot = processes.CreateToolhelp32Snapshot(platform::Processes::kSnapProcess, 0);
  platform::Processes::Entry entry;
  for (bool more = processes.Process32First(snapshot, entry); more;
       more = processes.Process32Next(snapshot, entry)) {
  }
  processes.CloseHandle(snapshot);
}

TEST(Speed, The_splash_is_painted_within_a_second_of_the_birth_of_the_process) {
  std::vector<int> figures;
  for (int i = 0; i < 5; ++i) {
    const StartedProgram start(FolderOfBuild() + u"\\timed_start.exe");
    ASSERT_TRUE(start.Ends());
    figures.push_back(static_cast<int>(start.Status()));
  }

  const int best = Best("start to splash", figures);

  EXPECT_GT(best, 5);
  EXPECT_LT(best, 1000);
}

TEST(Speed, A_pass_of_the_table_with_300_processes_takes_less_than_20_milliseconds) {
  constexpr std::size_t kProcesses = 300;
  constexpr std::size_t kFewestPasses = 30;
  constexpr std::size_t kMostPasses = 150;
  constexpr int kGoal = 20;
  std::vector<std::unique_ptr<StartedProgram>> crowd;
  while (crowd.size() < kProcesses)
    crowd.push_back(std::make_unique<StartedProgram>(FolderOfBuild() + u"\\idle_program.exe"));
  forms::win32::Win32Driver user;
  platform::windows::WindowsMachine machine(user.Win32());
  Program program(machine.Operations(), user.Win32());
  user.Win32().Show(program.frmMenu);
  const auto pass = [&] {
    program.processTable.LastRefreshTick = static_cast<std::int32_t>(::GetTickCount() - 1000);
    program.processTable.RefreshProcessTable({});
    user.Win32().PumpOnce();
  };
  const int first = Milliseconds([&] { user.Click(program.frmMenu.lblCaption[shell::kMonitorPage]); });
  pass();

  // Wine makes its list of processes by reading several files of each from the system below it, and asks its
  // server for each step through the list. More passes than a few are made where something else on the
  // machine has held up each of these.
  std::vector<int> passes, lists;
  const auto beyondTheList = [&] { return std::ranges::min(passes) - std::ranges::min(lists); };
  do {
    passes.push_back(Milliseconds(pass));
    lists.push_back(Milliseconds([&] { ReadListOfProcesses(machine.Operations().processes); }));
  } while (passes.size() < kFewestPasses || (beyondTheList() >= kGoal && passes.size() < kMostPasses));

  std::cout << program.monitorPage.table.main_ListView1.Count() << " rows, the page came after " << first
            << " ms\n";
  EXPECT_GE(program.monitorPage.table.main_ListView1.Count(), static_cast<int>(kProcesses));
  Best("the system's list of processes alone", lists);
  Best("a pass", passes);
  EXPECT_LT(beyondTheList(), kGoal);
}

} // namespace
} // namespace quendra::app::windows
