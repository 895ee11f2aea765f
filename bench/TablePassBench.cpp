// What a pass of the process table costs on this machine, beside what the system's own tools take to tell the
// same.
//
//   table_pass_bench PROCESSES SOCKETS PASSES [window]
//
// Starts PROCESSES idle processes that hold SOCKETS connected TCP sockets between them, in a network
// namespace of its own, and runs PASSES warm passes, one a second as the program does: of the table alone, or
// of the whole program with its window open on the monitor page. Prints CPU time, user and system, in
// milliseconds:
//   first F pass P ps A ss B ratio R rows N owned M

#include "TablePassBenchCrowd.h"

#include "app/Program.h"
#include "forms/headless/posix/PolledDesktop.h"
#include "forms/qt/QtDesktop.h"
#include "monitor/MonitorControls.h"
#include "monitor/ProcessRow.h"
#include "monitor/ProcessTable.h"
#include "platform/linux/LinuxMachine.h"
#include "platform/system/System.h"

#include <fcntl.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <functional>
#include <numeric>
#include <stdexcept>
#include <string_view>

namespace quendra::bench {

namespace {

constexpr int kWarmUpPasses = 6;
constexpr int kToolRuns = 7;

double Milliseconds(const rusage& usage) {
  const auto time = [](const timeval& value) { return value.tv_sec * 1e3 + value.tv_usec / 1e3; };
  return time(usage.ru_utime) + time(usage.ru_stime);
}

double OwnMilliseconds() {
  rusage usage{};
  ::getrusage(RUSAGE_SELF, &usage);
  return Milliseconds(usage);
}

/// CPU time of one run of a tool.
double ToolMilliseconds(const std::vector<const char*>& command) {
  const pid_t child = ::fork();
  if (child == 0) {
    ::dup2(::open("/dev/null", O_WRONLY), STDOUT_FILENO);
    std::vector<char*> words;
    for (const char* word : command) words.push_back(const_cast<char*>(word));
    words.push_back(nullptr);
    ::execvp(words[0], words.data());
    ::_exit(127);
  }
  int status = 0;
  rusage usage{};
  if (child < 0 || ::wait4(child, &status, 0, &usage) != child || status != 0)
    throw std::runtime_error(std::string("can't run ") + command[0]);
  return Milliseconds(usage);
}

double Median(std::vector<double> values) {
  std::nth_element(values.begin(), values.begin() + static_cast<std::ptrdiff_t>(values.size() / 2),
                   values.end());
  return values[values.size() / 2];
}

/// What is measured: a list, how a pass over it is made, and what the program does until the next.
struct Subject {
  forms::ListView& list;
  std::function<void()> pass;
  std::function<void()> rest;
};

/// Traffic of every tenth row, so that there are rates to write and to sort.
void Charge(forms::ListView& list) {
  for (int i = 1; i <= list.Count(); i += 10)
    for (const int cell : {monitor::kUploadCell, monitor::kDownloadCell})
      list.Row(i).CellTag(cell) = list.Row(i).CellTag(cell).Number() + 1.5 * (i % 97);
}

int RowsWithPorts(forms::ListView& list) {
  int count = 0;
  for (int i = 1; i <= list.Count(); ++i) count += !list.Row(i).CellText(monitor::kPortsCell).empty();
  return count;
}

/// CPU time of a pass and of all that it leads to.
double TimePass(const Subject& subject) {
  const double before = OwnMilliseconds();
  subject.pass();
  subject.rest();
  return OwnMilliseconds() - before;
}

void Measure(const Subject& subject, double first, int passes) {
  std::vector<double> pass, ps, ss;
  for (int i = 0; i < kWarmUpPasses + passes; ++i) {
    ::sleep(1);
    Charge(subject.list);
    const double taken = TimePass(subject);
    if (i >= kWarmUpPasses) pass.push_back(taken);
    // In between, so that all are measured on the same machine in the same state.
    if (i < kWarmUpPasses || static_cast<int>(ps.size()) >= kToolRuns) continue;
    ps.push_back(ToolMilliseconds({"ps", "-eo", "pid,ppid,comm"}));
    ss.push_back(ToolMilliseconds({"ss", "-tnp"}));
  }
  // The mean, since a pass that looks at more than the others is part of the price.
  const double mean = std::accumulate(pass.begin(), pass.end(), 0.0) / static_cast<double>(pass.size());
  const double tools = Median(ps) + Median(ss);
  std::printf("first %.1f pass %.2f ps %.1f ss %.1f ratio %.3f rows %d owned %d\n", first, mean, Median(ps),
              Median(ss), mean / tools, subject.list.Count(), RowsWithPorts(subject.list));
}

/// The table alone: no window shows it.
void MeasureTable(int passes) {
  forms::headless::PolledDesktop desktop;
  platform::linux_::LinuxMachine machine(desktop, desktop);
  const platform::Machine operations = machine.Operations();
  monitor::MonitorControls controls;
  monitor::SystemVersion version(operations.system, desktop);
  version.OsVersionCode = 2002;
  monitor::mdlFileInfo fileInfo(operations.processes, operations.tokens, operations.versionInfo, desktop);
  monitor::modProcPort procPort(operations.ipHelper, {operations.processes, operations.handles}, desktop,
                                controls.main_ListView1, fileInfo);
  monitor::ProcessRowAdder adder(operations.icons, operations.system, desktop, controls.table, fileInfo);
  monitor::PortSource ports(version, fileInfo, procPort);
  monitor::ProcessTable table(operations.processes, operations.system, controls.table, adder, ports);
  const Subject subject{controls.main_ListView1,
                        [&] {
                          table.RefreshProcessTable(u"");
                          table.StampLastRefresh();
                        },
                        [] {}};
  const double first = TimePass(subject);
  Measure(subject, first, passes);
}

/// The whole program with its window on the monitor page; painting counts.
int MeasureProgram(int passes) {
  forms::qt::QtDesktop desktop("table_pass_bench");
  platform::linux_::LinuxMachine machine(desktop, desktop);
  app::Program program(machine.Operations(), desktop);
  const Subject subject{program.monitorPage.table.main_ListView1,
                        [&] {
                          program.processTable.RefreshProcessTable(u"");
                          program.processTable.StampLastRefresh();
                        },
                        [&] {
                          // Painting is put off by the toolkit, so it gets some time to come.
                          for (int i = 0; i < 10; ++i) {
                            desktop.PumpOnce();
                            ::usleep(5000);
                          }
                        }};
  return desktop.Run([&] {
    desktop.Show(program.frmMenu);
    const double before = OwnMilliseconds();
    program.frmMenu.lblCaption[0].Click();
    subject.rest();
    Measure(subject, OwnMilliseconds() - before, passes);
    desktop.End();
  });
}

} // namespace

} // namespace quendra::bench

int main(int count, char** words) {
  using namespace quendra::bench;
  const bool withWindow = count == 5 && std::string_view(words[4]) == "window";
  if (count != 4 && !withWindow) {
    std::fprintf(stderr, "usage: %s PROCESSES SOCKETS PASSES [window]\n", words[0]);
    return 2;
  }
  try {
    const TableCrowd crowd(std::atoi(words[1]), std::atoi(words[2]));
    const int passes = std::max(std::atoi(words[3]), 1);
    if (withWindow) return MeasureProgram(passes);
    MeasureTable(passes);
  } catch (const std::exception& failure) {
    std::fprintf(stderr, "%s: %s\n", words[0], failure.what());
    return 1;
  }
}
