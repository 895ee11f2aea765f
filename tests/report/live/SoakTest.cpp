#include "platform/simulated/SimulatedMachine.h"
#include "report/live/LiveFixture.h"

#include <cstdio>
#include <cstdlib>

#ifdef __SANITIZE_ADDRESS__
#define QUENDRA_SANITIZED 1
#elif defined(__has_feature)
#if __has_feature(address_sanitizer)
#define QUENDRA_SANITIZED 1
#endif
#endif

namespace quendra::report {
namespace {

#ifdef QUENDRA_SANITIZED
// The sanitizer keeps what was freed for a while, so memory grows here; leaks it finds by itself.
constexpr long kMarginKilobytes = 1 << 20;
#else
constexpr long kMarginKilobytes = 1024;
#endif
constexpr int kOrdinaryRun = 1000;
constexpr int kWarmUp = 100;
/// The page is left and opened again this often.
constexpr int kVisit = 50;

/// scripts/soak asks for more than an ordinary run.
int ExchangesToMake() {
  const char* asked = std::getenv("QUENDRA_SOAK_EXCHANGES");
  return std::max(kWarmUp, asked ? std::atoi(asked) : kOrdinaryRun);
}

long ResidentKilobytes() {
  std::ifstream file("/proc/self/statm");
  long size = 0;
  long resident = 0;
  file >> size >> resident;
  return resident * (sysconf(_SC_PAGESIZE) / 1024);
}

std::ptrdiff_t OpenDescriptors() {
  return std::distance(std::filesystem::directory_iterator("/proc/self/fd"), {});
}

/// Real sockets and names under a machine whose processes and packets stand still, so that nothing but the
/// exchange can grow.
class Soak : public LiveReportTest {
 protected:
  void OpenQuietPage() {
    for (std::uint32_t id = 1; id <= 60; ++id)
      quiet.AddProcess({id, 0, "a process, number " + std::to_string(id) + ".exe", ""});
    const platform::Machine given = quiet.Operations();
    const platform::Machine real = machine->Operations();
    program = std::make_unique<app::Program>(
        platform::Machine{given.captureControls, given.captureLibrary, given.handles, real.hostNames,
                          given.icmp, given.icons, given.ipHelper, given.keyboardLayout,
                          given.performanceData, given.processes, given.registry, given.shellStart,
                          real.sockets, given.system, given.tokens, given.urlCache, given.versionInfo},
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
  const int exchanges = ExchangesToMake();
  long memory = 0;
  std::ptrdiff_t descriptors = 0;

  for (int exchange = 1; exchange <= exchanges; ++exchange) {
    ASSERT_TRUE(Exchange()) << "exchange " << exchange << ", " << desktop.Boxes.size() << " boxes";
    if (exchange % kVisit == 0) LeaveAndReturn();
    if (exchange != kWarmUp) continue;
    memory = ResidentKilobytes();
    descriptors = OpenDescriptors();
  }

  EXPECT_EQ(program->supportExchange.ReportNumber, DecimalText(1000 + exchanges));
  EXPECT_EQ(OpenDescriptors(), descriptors);
  EXPECT_LE(ResidentKilobytes(), memory + kMarginKilobytes);
  std::printf("%d exchanges: %ld KB after the first %d, %ld KB at the end; %td and %td descriptors\n",
              exchanges, memory, kWarmUp, ResidentKilobytes(), descriptors, OpenDescriptors());
}

} // namespace
} // namespace quendra::report
