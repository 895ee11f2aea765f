#pragma once

#include "app/Program.h"
#include "integration/FrameLedger.h"
#include "integration/LinkedNamespaces.h"
#include "integration/Worker.h"
#include "monitor/ProcessRow.h"
#include "platform/linux/LinuxMachine.h"

#include <cmath>
#include <deque>
#include <gtest/gtest.h>
#include <optional>

namespace quendra::integration {

/// The program on its monitor page, a process that downloads beside it, a server on another host and a second
/// capture on the link between them. The desktop is the test's.
class MonitoredDownload : public testing::Test {
 protected:
  void SetUp() override {
    if (!NetworkNamespace::Possible()) GTEST_SKIP() << NetworkNamespace::kSkipReason;
    hosts.emplace();
    workers.push_back(Worker::Server(hosts->Far(), LinkedNamespaces::kFarAddress, 80));
    workers.push_back(Worker::Client(hosts->Near(), LinkedNamespaces::kFarAddress, 80));
    workers.push_back(Worker::Client(hosts->Near(), LinkedNamespaces::kFarAddress, 80));
  }

  void TearDown() override {
    program.reset();
    machine.reset();
    ledger.reset();
    workers.clear();
    hosts.reset();
  }

  /// Runs the desktop's loop until the condition holds; false when it doesn't in time.
  virtual bool WaitFor(const std::function<bool()>& condition, int milliseconds) = 0;

  /// Connects the download, opens the page and starts both captures.
  template <typename DesktopAndLoop> void OpenPage(DesktopAndLoop& desktop) {
    Download().Tell({Order::Kind::Connect, 1});
    port = Await(Download()).localPorts.at(0);
    machine.emplace(desktop, desktop);
    program.emplace(machine->Operations(), desktop);
    program->Start();
    program->frmSplash.Label2.Click();
    program->frmMenu.lblCaption[0].Click();
    ASSERT_TRUE(program->captureSession.CaptureRunning);
    ledger.emplace(LinkedNamespaces::kNearLink, LinkedNamespaces::kNearAddress);
    ledger->Watch(port);
  }

  Worker& Download() { return workers[1]; }
  Worker& Datagrams() { return workers[2]; }

  Answer Await(Worker& worker) {
    Answer answer;
    if (!WaitFor([&] { return worker.HasAnswered(answer); }, 30000))
      throw std::runtime_error("waited in vain for a worker's answer");
    return answer;
  }
  void Settle() {
    WaitFor([] { return false; }, 150);
  }

  forms::ListRow& Row() {
    auto* row = program->monitorPage.table.main_ListView1.Find(
        monitor::KeyOfProcess(static_cast<std::uint32_t>(Download().Process())));
    return row != nullptr ? *row : throw std::runtime_error("the download has no row");
  }
  /// A running total of the row, in bytes.
  std::uint64_t Charged(monitor::ProcessCell cell) {
    return static_cast<std::uint64_t>(std::lround(Row().CellTag(cell).Number() * 1024));
  }

  std::optional<LinkedNamespaces> hosts;
  std::deque<Worker> workers;
  std::uint16_t port = 0; ///< of the download, on this host
  std::optional<FrameLedger> ledger;
  std::optional<platform::linux_::LinuxMachine> machine;
  std::optional<app::Program> program;
};

} // namespace quendra::integration
