#include "app/Program.h"
#include "forms/headless/posix/PolledDesktop.h"
#include "integration/NetworkNamespace.h"
#include "integration/Steady.h"
#include "platform/linux/LinuxMachine.h"
#include "platform/linux/system/LinuxSystem.h"
#include "platform/simulated/SimulatedMachine.h"
#include "report/live/Peer.h"

#include <gtest/gtest.h>

namespace quendra::diagnostics {
namespace {

using platform::Machine;

constexpr int kOrdinaryRun = 200;
constexpr int kWaitMilliseconds = 20'000;

/// This system, save that nobody waits.
class ImpatientSystem : public platform::linux_::LinuxSystem {
 public:
  void Sleep(std::uint32_t) override {}
};

/// The whole program with real sockets and names, in a network of its own whose web and mail servers answer.
class Soak : public testing::Test {
 protected:
  void SetUp() override {
    if (!integration::NetworkNamespace::Possible())
      GTEST_SKIP() << integration::NetworkNamespace::kSkipReason;
    space_ = std::make_unique<integration::NetworkNamespace>();
    integration::RunCommand("ip link set lo up");
    integration::NetworkNamespace::Set("net/ipv4/ip_local_port_range", "1025 5000");
    MakeFolder();
    for (const auto& server : {Words{"support_server.py", "80", "--reports", folder_ + "/reports"},
                               Words{"mail_greeter.py", "pop3"}, Words{"mail_greeter.py", "smtp"}})
      StartServer(server);
    here = std::make_unique<platform::linux_::LinuxMachine>(desktop, desktop);
    PrepareQuiet();
  }
  void TearDown() override {
    if (program) desktop.CloseBox(program->frmMenu);
    program.reset();
    here.reset();
    if (!folder_.empty()) std::filesystem::remove_all(folder_);
  }

  /// A machine that stands still, so that nothing but the program can grow.
  Machine QuietMachine() {
    const Machine given = quiet.Operations();
    const Machine real = here->Operations();
    return {given.captureControls, given.captureLibrary, given.handles,
            real.hostNames,        given.icmp,           given.icons,
            given.ipHelper,        given.keyboardLayout, given.performanceData,
            given.processes,       given.registry,       given.shellStart,
            real.sockets,          given.system,         given.tokens,
            given.urlCache,        given.versionInfo};
  }
  Machine ThisMachine() {
    const Machine real = here->Operations();
    return {
        real.captureControls, real.captureLibrary, real.handles,        real.hostNames,       real.icmp,
        real.icons,           real.ipHelper,       real.keyboardLayout, real.performanceData, real.processes,
        real.registry,        real.shellStart,     real.sockets,        impatient_,           real.tokens,
        real.urlCache,        real.versionInfo};
  }
  void Start(const Machine& machine) {
    program = std::make_unique<app::Program>(machine, desktop);
    program->Start();
    ASSERT_TRUE(desktop.Click(program->frmSplash.Label2));
  }

  /// In, all eight checks, and out: by the way back, or to another page.
  void VisitSurfPage(int number) {
    ASSERT_TRUE(desktop.Click(program->frmMenu.lblCaption[1]));
    forms::ListView& list = program->surfPage.surf_ListView1;
    ASSERT_TRUE(desktop.WaitFor([&] { return list.Count() >= 10; }, kWaitMilliseconds))
        << list.Count() << " rows";
    ASSERT_EQ(list.Row(10).CellText(2), u"הסתיים");
    for (int row = 1; row <= 8; ++row) ASSERT_EQ(list.Row(row).CellCount(), 3) << row;
    for (int row = 1; row <= 4; ++row) ASSERT_EQ(list.Row(row).CellIcon(3), 1) << row;
    forms::Control& out = program->surfPage.surf_lblBack;
    ASSERT_TRUE(desktop.Click(number % 2 == 0 ? program->frmMenu.lblCaption[2] : out));
    ASSERT_EQ(program->surf.surfChecks.Sockets(), nullptr);
    EmptyRecords();
  }

  void EmptyRecords() {
    desktop.Boxes.clear();
    desktop.Calls.clear();
    quiet.Calls.clear();
    quiet.ipHelper.InterfaceCalls.clear();
    quiet.performanceData.Names.clear();
    quiet.performanceData.Rooms.clear();
    quiet.registry.Calls.clear();
    quiet.urlCache.Calls.clear();
    quiet.urlCache.Deleted.clear();
  }

 private:
  using Words = std::vector<std::string>;

  /// The checks empty the caches of the user's browsers and write the registry: those of this folder.
  void MakeFolder() {
    std::string pattern = testing::TempDir() + "quendra-soak-XXXXXX";
    if (!mkdtemp(pattern.data())) throw std::runtime_error("no temporary folder");
    folder_ = pattern;
    setenv("XDG_CACHE_HOME", (folder_ + "/caches").c_str(), 1);
    setenv("XDG_DATA_HOME", (folder_ + "/data").c_str(), 1);
  }
  void StartServer(const Words& words) {
    Words command{"python3", QUENDRA_SOURCE_DIR "/tests/standins/" + words.front()};
    command.insert(command.end(), words.begin() + 1, words.end());
    command.insert(command.end(), {"--seconds", "1800"});
    servers_.push_back(std::make_unique<report::Peer>(command));
    ASSERT_NE(servers_.back()->FirstLine(), "");
  }
  void PrepareQuiet() {
    for (std::uint32_t id = 1; id <= 60; ++id)
      quiet.AddProcess({id, 0, "a process, number " + std::to_string(id) + ".exe", ""});
    quiet.AddCaptureAdapter({"lo", "Loopback", "127.0.0.1"});
    platform::InterfaceRow card;
    card.Set(platform::InterfaceRow::kSpeed, 10'000'000);
    quiet.ipHelper.Interfaces = {card};
    quiet.performanceData.SetProcessors({{u"0", 5}}, 1);
  }

  std::unique_ptr<integration::NetworkNamespace> space_;
  std::string folder_;
  std::vector<std::unique_ptr<report::Peer>> servers_;
  ImpatientSystem impatient_;

 protected:
  forms::headless::PolledDesktop desktop;
  std::unique_ptr<platform::linux_::LinuxMachine> here;
  platform::simulated::SimulatedMachine quiet;
  std::unique_ptr<app::Program> program;
  const int times = integration::TimesAskedFor("QUENDRA_SOAK_VISITS", kOrdinaryRun);
};

TEST_F(Soak, Visits_of_the_surf_page_with_all_checks_leave_memory_and_descriptors_as_they_were) {
  Start(QuietMachine());
  integration::ExpectSteady("visits", times, [this](int number) { VisitSurfPage(number); });
}

TEST_F(Soak, Checks_of_the_real_machine_leave_memory_and_descriptors_as_they_were) {
  Start(ThisMachine());
  integration::ExpectSteady("visits on this machine", times, [this](int number) { VisitSurfPage(number); });
}

TEST_F(Soak, Openings_of_each_dialog_leave_memory_and_descriptors_as_they_were) {
  Start(QuietMachine());
  ASSERT_TRUE(desktop.Click(program->frmMenu.lblCaption[0]));
  int closed = 0;
  desktop.OnModal = [&](forms::Form& form) {
    auto& ports = program->frmPortsChecks;
    const bool isPorts = &form == &ports;
    desktop.Advance(50);
    const auto all = [&] {
      return !ports.Label3.Caption().empty() && !ports.Label4.Caption().empty() &&
             !ports.Label6.Caption().empty();
    };
    EXPECT_TRUE(!isPorts || desktop.WaitFor(all, kWaitMilliseconds));
    closed += desktop.Click(isPorts ? ports.Command2 : program->frmMemInfo.cmdClose);
  };

  integration::ExpectSteady("openings of three dialogs", times, [&](int number) {
    ASSERT_TRUE(desktop.Click(program->monitorPage.main_cmdMemInfo));
    ASSERT_TRUE(desktop.Click(program->monitorPage.main_cmdChecks));
    ASSERT_TRUE(desktop.Click(program->frmMenu.Label1));
    ASSERT_TRUE(desktop.Click(program->frmAbout.Image1));
    ASSERT_EQ(closed, 2 * number);
    EmptyRecords();
  });
}

} // namespace
} // namespace quendra::diagnostics
