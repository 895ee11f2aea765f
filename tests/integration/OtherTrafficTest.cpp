#include "forms/headless/posix/PolledDesktop.h"
#include "integration/MonitoredDownload.h"

#include <chrono>
#include <limits>

namespace quendra::integration {

namespace {

constexpr int kSeconds = 5;
// A download of 98 KB/s, in bursts as a server that limits its rate sends them: between them datagrams alone
// arrive.
constexpr int kExchangesASecond = 10;
constexpr int kReply = 9640;

/// What the row of the downloading process shows after a pass of the table.
struct Pass {
  double secondsSinceTheLast = 0; ///< from its end to the start of this one
  double rate = 0;                ///< KB/s, as shown
  std::uint64_t total = 0;        ///< bytes that were charged when it was made
  std::int64_t wallClock = 0;     ///< microseconds since 1970
};

/// The program beside a steady download and, at a rate given, datagrams that are echoed.
class OtherTraffic : public MonitoredDownload, public testing::WithParamInterface<int> {
 protected:
  void SetUp() override {
    MonitoredDownload::SetUp();
    if (IsSkipped()) return;
    OpenPage(desktop);
    desktop.OnYield = [this] { Look(); };
  }
  void TearDown() override {
    desktop.OnYield = {};
    MonitoredDownload::TearDown();
  }
  bool WaitFor(const std::function<bool()>& condition, int milliseconds) override {
    return desktop.WaitFor(condition, milliseconds);
  }

  /// At each yield of an event: has there been a pass since the last one?
  void Look() {
    const auto now = std::chrono::steady_clock::now();
    const std::uint64_t total = Charged(monitor::kPreviousDownloadCell);
    if (total != passes.back().total) {
      const std::chrono::duration<double> since = yieldBefore - passEnd;
      passes.push_back({since.count(), RateShown(), total, WallClock()});
    }
    if (program->processTable.LastRefreshTick != tick) passEnd = now;
    tick = program->processTable.LastRefreshTick;
    yieldBefore = now;
  }

  double RateShown() {
    const Text shown = Row().CellText(monitor::kDownloadCell);
    return shown.empty() ? 0 : std::stod(ToUtf8(shown));
  }

  static std::int64_t WallClock() {
    using namespace std::chrono;
    return duration_cast<microseconds>(system_clock::now().time_since_epoch()).count();
  }

  void RunTraffic() {
    const int exchanges = kSeconds * kExchangesASecond;
    Download().Tell({Order::Kind::Exchange, exchanges, 100, kReply, 1'000'000 / kExchangesASecond});
    if (GetParam() > 0)
      Datagrams().Tell({Order::Kind::Datagrams, kSeconds * GetParam(), 160, 0, 1'000'000 / GetParam()});
    Await(Download());
    if (GetParam() > 0) Await(Datagrams());
    // The second capture may be a block of frames behind.
    Settle();
  }

  forms::headless::PolledDesktop desktop;
  std::vector<Pass> passes{1};
  std::int32_t tick = 0;
  std::chrono::steady_clock::time_point passEnd;
  std::chrono::steady_clock::time_point yieldBefore;
};

INSTANTIATE_TEST_SUITE_P(, OtherTraffic, testing::Values(0, 30, 120, 2000), [](const auto& tested) {
  return std::to_string(tested.param) + "_datagrams_a_second";
});

/// When the first frame that isn't in the total came, in the far future when none came; nothing when the
/// total is none of whole frames.
std::optional<std::int64_t> ArrivalBehind(const std::vector<FrameLedger::Arrival>& arrivals,
                                          std::uint64_t total) {
  std::uint64_t sum = 0;
  for (const auto& arrival : arrivals) {
    if (sum == total) return arrival.microseconds;
    sum += arrival.bytes;
  }
  if (sum == total) return std::numeric_limits<std::int64_t>::max();
  return std::nullopt;
}

} // namespace

TEST_P(OtherTraffic, Beside_it_the_table_keeps_its_second_and_every_rate_is_that_of_a_second_capture) {
  RunTraffic();

  const auto arrivals = ledger->Watched();
  ASSERT_GE(passes.size(), static_cast<std::size_t>(kSeconds));
  // The first two are those of the page's start and of the first frame, whose time began with the day number.
  for (std::size_t i = 2; i < passes.size(); ++i) {
    const Pass& pass = passes[i];
    const auto behind = ArrivalBehind(arrivals, pass.total);
    const double reference =
        static_cast<double>(pass.total - passes[i - 1].total) / 1024 / pass.secondsSinceTheLast;
    std::printf("pass %zu: %.3f s, %.2f KB/s shown, %.2f by the second capture\n", i - 1,
                pass.secondsSinceTheLast, pass.rate, reference);
    EXPECT_GE(pass.secondsSinceTheLast, 0.99);
    EXPECT_LE(pass.secondsSinceTheLast, 1.2);
    EXPECT_NEAR(pass.rate, reference, reference / 100);
    ASSERT_TRUE(behind) << pass.total << " bytes are no number of whole frames";
    EXPECT_LE(pass.wallClock - *behind, 200'000) << "frames that had come long before weren't charged yet";
  }
}

} // namespace quendra::integration
