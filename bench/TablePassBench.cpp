// What a pass of the process table costs on this machine, beside what the system's own tools take to tell the
// same.
//
//   table_pass_bench PROCESSES SOCKETS PASSES
//
// Starts PROCESSES idle processes that hold SOCKETS connected TCP sockets between them, in a network
// namespace of its own, and runs PASSES warm passes, one a second as the program does. Prints CPU time, user
// and system, in milliseconds:
//   first F pass P ps A ss B ratio R rows N owned M

#include "TablePassBenchCrowd.h"

#include "forms/headless/HeadlessDesktop.h"
#include "monitor/MonitorControls.h"
#include "monitor/ProcessRow.h"
#include "monitor/ProcessTable.h"
#include "platform/System.h"
#include "platform/linux/LinuxMachine.h"

#include <fcntl.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <stdexcept>

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

/// The monitor page's table over this machine.
class Table {
 public:
  /// A pass as the page's caller makes it; its CPU time.
  double Pass() {
    const double before = OwnMilliseconds();
    table_.RefreshProcessTable(u"");
    fields_.LastRefreshTick = static_cast<std::int32_t>(operations_.system.GetTickCount());
    return OwnMilliseconds() - before;
  }

  /// Traffic of every tenth row, so that there are rates to write and to sort.
  void Charge() {
    forms::ListView& list = controls_.main_ListView1;
    for (int i = 1; i <= list.Count(); i += 10)
      for (const int cell : {monitor::kUploadCell, monitor::kDownloadCell})
        list.Row(i).CellTag(cell) = list.Row(i).CellTag(cell).Number() + 1.5 * (i % 97);
  }

  int Rows() const { return controls_.main_ListView1.Count(); }
  int RowsWithPorts() {
    int count = 0;
    for (int i = 1; i <= Rows(); ++i)
      count += !controls_.main_ListView1.Row(i).CellText(monitor::kPortsCell).empty();
    return count;
  }

 private:
  forms::HeadlessDesktop desktop_;
  platform::linux_::LinuxMachine machine_{desktop_};
  platform::Machine operations_ = machine_.Operations();
  monitor::MonitorControls controls_;
  monitor::MonitorFields fields_{2002, 0};
  monitor::mdlFileInfo fileInfo_{operations_, desktop_};
  monitor::modProcPort procPort_{operations_, desktop_, controls_.main_ListView1, fileInfo_};
  monitor::ProcessTable table_{operations_, desktop_, controls_.Page(), fields_, fileInfo_, procPort_};
};

void Measure(int processes, int sockets, int passes) {
  const TableCrowd crowd(processes, sockets);
  Table table;
  const double first = table.Pass();
  std::vector<double> pass, ps, ss;
  for (int i = 0; i < kWarmUpPasses + passes; ++i) {
    ::sleep(1);
    table.Charge();
    const double taken = table.Pass();
    if (i >= kWarmUpPasses) pass.push_back(taken);
    // In between, so that all are measured on the same machine in the same state.
    if (i < kWarmUpPasses || static_cast<int>(ps.size()) >= kToolRuns) continue;
    ps.push_back(ToolMilliseconds({"ps", "-eo", "pid,ppid,comm"}));
    ss.push_back(ToolMilliseconds({"ss", "-tnp"}));
  }
  double sum = 0;
  for (const double taken : pass) sum += taken;
  // The mean, since a pass that looks at more than the others is part of the price.
  const double mean = sum / static_cast<double>(pass.size());
  const double tools = Median(ps) + Median(ss);
  std::printf("first %.1f pass %.2f ps %.1f ss %.1f ratio %.3f rows %d owned %d\n", first, mean, Median(ps),
              Median(ss), mean / tools, table.Rows(), table.RowsWithPorts());
}

} // namespace

} // namespace quendra::bench

int main(int count, char** words) {
  if (count != 4) {
    std::fprintf(stderr, "usage: %s PROCESSES SOCKETS PASSES\n", words[0]);
    return 2;
  }
  try {
    quendra::bench::Measure(std::atoi(words[1]), std::atoi(words[2]), std::atoi(words[3]));
  } catch (const std::exception& failure) {
    std::fprintf(stderr, "%s: %s\n", words[0], failure.what());
    return 1;
  }
}
