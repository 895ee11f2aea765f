#include "integration/Steady.h"
#include "platform/ReplacedFamilies.h"
#include "platform/simulated/SimulatedMachine.h"
#include "report/live/LiveFixture.h"

namespace quendra::report {
namespace {

constexpr int kOrdinaryRun = 1000;
/// The page is left and opened again this often.
constexpr int kVisit = 50;

/// Real sockets and names under a machine whose processes and packets stand still, so that nothing but the
/// exchange can grow.
class Soak : public LiveReportTest {
 protected:
  void OpenQuietPage() {
    for (std::uint32_t id = 1; id <= 60; ++id)
      quiet.AddProcess({id, 0, "a process, number " + std::to_string(id) + ".exe", ""});
    const platform::Machine real = machine->Operations();
    program = std::make_unique<app::Program>(
        platform::WithReplaced(quiet.Operations(), {.hostNames = &real.hostNames, .sockets = &real.sockets}),
        desktop);
    quiet.AddCaptureAdapter({"lo", "Loopback", "127.0.0.1"});
    OpenPage();
  }
  void TearDown() override {
    if (program) desktop.CloseBox(program->frmMenu);
    program.reset(); // before the quiet machine
    LiveReportTest::TearDown();
  }

  /// One report from the click to its success; the records of the desktop and the machine are emptied.
  bool Exchange() {
    desktop.Boxes.clear();
    desktop.Calls.clear();
    quiet.Calls.clear();
    desktop.Click(program->monitorPage.reporting.main_cmdRpt);
    return AwaitBoxes(2) && desktop.Boxes[1].text == kSuccess &&
           Await([&] { return StateOf(2) == foundation::sckClosed; });
  }
  void LeaveAndReturn() {
    desktop.Click(program->frmMenu.lblCaption[2]);
    desktop.Click(program->frmMenu.lblCaption[0]);
  }

  platform::simulated::SimulatedMachine quiet;
};

TEST_F(Soak, Thousands_of_exchanges_leave_memory_and_descriptors_as_they_were_after_the_first_hundred) {
  Peer server({"python3", QUENDRA_SOURCE_DIR "/tests/standins/support_server.py", "80", "--reports",
               folder + "/reports", "--seconds", "1800", "--keep", "10"});
  ASSERT_EQ(server.FirstLine(), "80");
  OpenQuietPage();
  const int exchanges = integration::TimesAskedFor("QUENDRA_SOAK_EXCHANGES", kOrdinaryRun);

  integration::ExpectSteady("exchanges", exchanges, [this](int exchange) {
    ASSERT_TRUE(Exchange()) << desktop.Boxes.size() << " boxes";
    if (exchange % kVisit == 0) LeaveAndReturn();
  });

  EXPECT_EQ(program->supportExchange.ReportNumber, DecimalText(1000 + exchanges));
}

} // namespace
} // namespace quendra::report
