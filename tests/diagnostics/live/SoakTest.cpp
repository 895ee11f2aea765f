#include "app/Program.h"
#include "diagnostics/live/HurriedSystem.h"
#include "diagnostics/live/PortsDialog.h"
#include "forms/headless/posix/PolledDesktop.h"
#include "integration/LoopbackNetwork.h"
#include "integration/ScratchHome.h"
#include "integration/Steady.h"
#include "platform/ReplacedFamilies.h"
#include "platform/linux/LinuxMachine.h"
#include "platform/simulated/SimulatedMachine.h"
#include "report/live/Peer.h"

#include <gtest/gtest.h>

#include <optional>

namespace quendra::diagnostics {
namespace {

using platform::Machine;

constexpr int kOrdinaryRun = 200;
constexpr int kWaitMilliseconds = 20'000;

/// The whole program with real sockets and names, in a network of its own whose web and mail servers answer.
class Soak : public testing::Test {
 protected:
  void SetUp() override {
    if (!integration::NetworkNamespace::Possible())
      GTEST_SKIP() << integration::NetworkNamespace::kSkipReason;
    network_.emplace();
    for (const auto& server : {Words{"support_server.py", "80", "--reports", home_.Path() + "/reports"},
                               Words{"mail_greeter.py", "pop3"}, Words{"mail_greeter.py", "smtp"}})
      StartServer(server);
    here = std::make_unique<platform::linux_::LinuxMachine>(desktop, desktop);
    PrepareQuiet();
  }
  void TearDown() override {
    if (program) desktop.CloseBox(program->frmMenu);
    program.reset();
    here.reset();
  }

  /// A machine that stands still, so that nothing but the program can grow.
  Machine QuietMachine() {
    const Machine real = here->Operations();
    return platform::WithReplaced(quiet.Operations(),
                                  {.hostNames = &real.hostNames, .sockets = &real.sockets});
  }
  Machine ThisMachine() {
    hurried_.emplace(here->Operations().system);
    return platform::WithReplaced(here->Operations(), {.system = &*hurried_});
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

  std::optional<integration::LoopbackNetwork> network_;
  /// The checks empty the caches of the user's browsers and write the registry.
  integration::ScratchHome home_;
  std::vector<std::unique_ptr<report::Peer>> servers_;
  std::optional<HurriedSystem> hurried_;

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
    EXPECT_TRUE(!isPorts || desktop.WaitFor([&] { return HasAllResults(ports); }, kWaitMilliseconds));
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
