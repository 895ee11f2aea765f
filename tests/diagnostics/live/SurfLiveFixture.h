#pragma once

#include "app/Program.h"
#include "diagnostics/live/HurriedSystem.h"
#include "diagnostics/live/PortsDialog.h"
#include "forms/headless/posix/PolledDesktop.h"
#include "integration/LoopbackNetwork.h"
#include "integration/ScratchHome.h"
#include "platform/ReplacedFamilies.h"
#include "platform/linux/LinuxMachine.h"
#include "report/live/Peer.h"
#include "runtime/Settings.h"

#include <gtest/gtest.h>

#include <optional>

namespace quendra::diagnostics {

/// The whole program on this machine, in a network of its own with nothing but loopback.
class SurfLive : public testing::Test {
 protected:
  void SetUp() override {
    if (!integration::NetworkNamespace::Possible())
      GTEST_SKIP() << integration::NetworkNamespace::kSkipReason;
    network_.emplace();
    // A connection that nobody answers is given up after some three seconds instead of two minutes.
    integration::NetworkNamespace::Set("net/ipv4/tcp_syn_retries", "1");
    machine = std::make_unique<platform::linux_::LinuxMachine>(desktop, desktop);
    hurried_ = std::make_unique<HurriedSystem>(machine->Operations().system);
    program = std::make_unique<app::Program>(
        platform::WithReplaced(machine->Operations(), {.system = hurried_.get()}), desktop);
  }
  void TearDown() override {
    program.reset();
    machine.reset();
  }

  /// Ports with their manners, as in "80:answer".
  void Serve(const std::vector<std::string>& ports) {
    std::vector<std::string> command{"python3", QUENDRA_SOURCE_DIR "/tests/standins/odd_server.py"};
    command.insert(command.end(), ports.begin(), ports.end());
    peer_ = std::make_unique<report::Peer>(command);
    ASSERT_EQ(peer_->FirstLine(), "ready");
  }
  void OpenPage() {
    program->Start();
    ASSERT_TRUE(desktop.Click(program->frmSplash.Label2));
    ASSERT_TRUE(desktop.Click(program->frmMenu.lblCaption[1]));
  }
  bool Await(const std::function<bool()>& condition, int milliseconds = 20'000) {
    return desktop.WaitFor(condition, milliseconds);
  }
  /// A step begins when its row stands in the list.
  bool AwaitStep(int step) {
    return Await([&] { return List().Count() >= step; });
  }

  forms::ListView& List() { return program->surfPage.surf_ListView1; }
  Text Detail(int row) { return List().Row(row).CellText(1); }
  int Icon(int row) {
    forms::ListRow& shown = List().Row(row);
    return shown.CellCount() < 3 ? 0 : shown.CellIcon(3);
  }

  frmPortsChecks& OpenPortsDialog() {
    program->Start();
    EXPECT_TRUE(desktop.Click(program->frmSplash.Label2));
    desktop.Show(program->frmPortsChecks);
    return program->frmPortsChecks;
  }

 private:
  std::optional<integration::LoopbackNetwork> network_;
  /// The fifth check empties the caches of the user's browsers and writes the registry.
  integration::ScratchHome home_;
  std::unique_ptr<report::Peer> peer_;

 protected:
  static constexpr int kTick = 1;
  static constexpr int kCross = 2;
  const std::string& folder = home_.Path();
  forms::headless::PolledDesktop desktop;
  std::unique_ptr<platform::linux_::LinuxMachine> machine;

 private:
  std::unique_ptr<HurriedSystem> hurried_;

 protected:
  std::unique_ptr<app::Program> program;
};

} // namespace quendra::diagnostics
