#pragma once

#include "app/Program.h"
#include "forms/headless/posix/PolledDesktop.h"
#include "integration/NetworkNamespace.h"
#include "platform/linux/LinuxMachine.h"
#include "platform/system/System.h"
#include "report/live/Peer.h"
#include "runtime/Settings.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>

namespace quendra::diagnostics {

/// A machine's clock and memory, with pauses that take no time: the measurements' three seconds are theirs.
class HurriedSystem : public platform::System {
 public:
  explicit HurriedSystem(platform::System& system) : system_(system) {}

  std::uint32_t GetTickCount() override { return system_.GetTickCount(); }
  bool GetVersionExA(platform::OsVersion& version) override { return system_.GetVersionExA(version); }
  void Sleep(std::uint32_t) override {}
  void GetSystemInfo(platform::SystemInfo& info) override { system_.GetSystemInfo(info); }
  void GlobalMemoryStatus(platform::MemoryStatus& status) override { system_.GlobalMemoryStatus(status); }
  bool SystemTimeToFileTime(std::span<const std::uint8_t, 16> systemTime, std::uint64_t& fileTime) override {
    return system_.SystemTimeToFileTime(systemTime, fileTime);
  }
  std::int32_t DayNumber() override { return system_.DayNumber(); }
  std::int32_t SecondOfDay() override { return system_.SecondOfDay(); }

 private:
  platform::System& system_;
};

/// The whole program on this machine, in a network of its own with nothing but loopback.
class SurfLive : public testing::Test {
 protected:
  void SetUp() override {
    if (!integration::NetworkNamespace::Possible())
      GTEST_SKIP() << integration::NetworkNamespace::kSkipReason;
    space_ = std::make_unique<integration::NetworkNamespace>();
    integration::RunCommand("ip link set lo up");
    integration::NetworkNamespace::Set("net/ipv4/ip_local_port_range", "1025 5000");
    // A connection that nobody answers is given up after some three seconds instead of two minutes.
    integration::NetworkNamespace::Set("net/ipv4/tcp_syn_retries", "1");
    MakeFolder();
    machine = std::make_unique<platform::linux_::LinuxMachine>(desktop, desktop);
    hurried_ = std::make_unique<HurriedSystem>(machine->Operations().system);
    program = std::make_unique<app::Program>(HurriedMachine(), desktop);
  }
  void TearDown() override {
    program.reset();
    machine.reset();
    if (!folder.empty()) std::filesystem::remove_all(folder);
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

 private:
  /// The fifth check empties the caches of the user's browsers and writes the registry: those of this folder.
  void MakeFolder() {
    std::string pattern = testing::TempDir() + "quendra-surf-XXXXXX";
    if (!mkdtemp(pattern.data())) throw std::runtime_error("no temporary folder");
    folder = pattern;
    setenv("XDG_CACHE_HOME", (folder + "/caches").c_str(), 1);
    setenv("XDG_DATA_HOME", (folder + "/data").c_str(), 1);
  }

  platform::Machine HurriedMachine() {
    const platform::Machine own = machine->Operations();
    return {own.captureControls, own.captureLibrary, own.handles,        own.hostNames,       own.icmp,
            own.icons,           own.ipHelper,       own.keyboardLayout, own.performanceData, own.processes,
            own.registry,        own.shellStart,     own.sockets,        *hurried_,           own.tokens,
            own.urlCache,        own.versionInfo};
  }

  std::unique_ptr<integration::NetworkNamespace> space_;
  std::unique_ptr<report::Peer> peer_;

 protected:
  static constexpr int kTick = 1;
  static constexpr int kCross = 2;
  std::string folder;
  forms::headless::PolledDesktop desktop;
  std::unique_ptr<platform::linux_::LinuxMachine> machine;

 private:
  std::unique_ptr<HurriedSystem> hurried_;

 protected:
  std::unique_ptr<app::Program> program;
};

} // namespace quendra::diagnostics
