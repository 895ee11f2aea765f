#include "diagnostics/SurfChecks.h"

#include "diagnostics/SurfFixture.h"

namespace quendra::diagnostics {
namespace {

/// A socket of a step that has ended, open since then, and the step that waits when something comes of it.
struct Pair {
  int old;
  int waiting;
};

void PrintTo(const Pair& pair, std::ostream* out) { *out << pair.old << " during " << pair.waiting; }

class OldSocket : public SurfTest, public testing::WithParamInterface<Pair> {
 protected:
  /// The servers before a step answer, so that it waits.
  void WaitInStep(int step) {
    AnswerBefore(step);
    OpenPage();
    ASSERT_EQ(checks.Step(), step);
  }
  void WaitInStep() { WaitInStep(GetParam().waiting); }
  platform::simulated::SimulatedPeer& Old() { return Connection(ServerOf(GetParam().old)); }
  void ExpectThatTheStepStillWaits() {
    const int step = GetParam().waiting;
    EXPECT_EQ(checks.Step(), step);
    EXPECT_EQ(RowCount(), step);
    EXPECT_EQ(Icon(step), 0);
    EXPECT_EQ(Row(GetParam().old).CellCount(), 3);
    EXPECT_EQ(Icon(GetParam().old), kTick);
    EXPECT_EQ(checks.FailCount(), 0);
  }
};

TEST_P(OldSocket, That_fails_late_fails_the_step_that_waits_and_starts_the_next) {
  const int step = GetParam().waiting;
  WaitInStep();

  Old().Reset();
  Run();

  EXPECT_EQ(Detail(step), kReset);
  EXPECT_EQ(Row(step).CellColour(1), 255u);
  EXPECT_EQ(Icon(step), kCross);
  EXPECT_FALSE(Bold(step));
  EXPECT_EQ(Icon(GetParam().old), kTick);
  EXPECT_EQ(Detail(GetParam().old), u"");
  EXPECT_EQ(checks.FailCount(), 1);
  EXPECT_GT(checks.Step(), step);
}

TEST_P(OldSocket, That_closes_late_does_nothing) {
  WaitInStep();

  Old().Close();
  Run();

  ExpectThatTheStepStillWaits();
}

TEST_P(OldSocket, That_goes_on_talking_does_nothing) {
  WaitInStep();

  Old().Send("more");
  Run();

  ExpectThatTheStepStillWaits();
}

INSTANTIATE_TEST_SUITE_P(OfEachStepDuringEveryLaterOne, OldSocket,
                         testing::Values(Pair{1, 2}, Pair{1, 3}, Pair{1, 4}, Pair{2, 3}, Pair{2, 4},
                                         Pair{3, 4}),
                         [](const auto& run) {
                           return std::to_string(run.param.old) + "_during_" +
                                  std::to_string(run.param.waiting);
                         });

TEST_F(OldSocket, That_fails_late_makes_the_data_of_the_step_that_it_ended_come_too_late) {
  WaitInStep(3);
  Connection(WebByName()).Reset();
  Run();

  Connection(IncomingMail()).Send("+OK\r\n");
  Run();

  EXPECT_EQ(checks.Step(), 4);
  EXPECT_EQ(Row(3).CellCount(), 3);
  EXPECT_EQ(Icon(3), kCross);
  EXPECT_EQ(Icon(4), 0);
}

TEST_F(OldSocket, That_fails_late_makes_the_error_of_the_step_that_it_ended_hit_the_next_one) {
  WaitInStep(2);
  Connection(WebByName()).Reset();
  Run();

  Connection(WebByAddress()).Reset();
  Run();

  EXPECT_EQ(checks.Step(), 4);
  EXPECT_EQ(Icons(3), (std::vector<int>{kTick, kCross, kCross}));
  EXPECT_EQ(Detail(3), kReset);
}

/// The step whose socket fails when all is over, or the local step in which it fails.
class OldSocketAtTheEnd : public SurfTest, public testing::WithParamInterface<int> {
 protected:
  void ExpectThatTheEndHasFailed() {
    ASSERT_EQ(RowCount(), 12);
    EXPECT_EQ(Detail(10), kReset);
    EXPECT_EQ(Row(10).CellColour(1), 255u);
    EXPECT_EQ(Icon(10), kCross);
    EXPECT_TRUE(Bold(10));
    EXPECT_EQ(Row(11).CellCount(), 0);
    EXPECT_EQ(CaptionOf(12), kEnd);
    EXPECT_EQ(Icon(12), 0);
    EXPECT_TRUE(Bold(12));
    EXPECT_EQ(checks.Step(), 10);
    EXPECT_EQ(checks.FailCount(), 1);
  }
};

TEST_P(OldSocketAtTheEnd, Fails_the_row_of_the_end_and_adds_another_end) {
  AllServersAnswer();
  OpenPage();

  Connection(ServerOf(GetParam())).Reset();
  Run();

  ExpectThatTheEndHasFailed();
}

INSTANTIATE_TEST_SUITE_P(OfEachNetworkStep, OldSocketAtTheEnd, testing::Values(1, 2, 3, 4));

using OldSocketInLocalStep = OldSocketAtTheEnd;

TEST_P(OldSocketInLocalStep, Is_heard_of_after_the_end_alone) {
  AllServersAnswer();
  bool wasReset = false;
  desktop.OnRepaint = [&](const forms::Control&) {
    if (wasReset || RowCount() != GetParam()) return;
    Connection(WebByName()).Reset();
    wasReset = true;
  };

  OpenPage();

  EXPECT_EQ(Icon(GetParam()), kTick);
  ExpectThatTheEndHasFailed();
}

INSTANTIATE_TEST_SUITE_P(OfEach, OldSocketInLocalStep, testing::Values(5, 6, 7, 8));

TEST_F(OldSocketAtTheEnd, Comes_once_for_each_socket_that_is_open) {
  AllServersAnswer();
  OpenPage();

  for (int step = 1; step <= 4; ++step) Connection(ServerOf(step)).Reset();
  Run();

  EXPECT_EQ(RowCount(), 18);
  for (const int row : {10, 12, 14, 16}) {
    EXPECT_EQ(Detail(row), kReset) << row;
    EXPECT_EQ(Icon(row), kCross) << row;
    EXPECT_TRUE(Bold(row)) << row;
  }
  EXPECT_EQ(Icon(18), 0);
  EXPECT_EQ(checks.Step(), 13);
  EXPECT_FALSE(desktop.Ended);
}

TEST_F(OldSocketAtTheEnd, Is_not_heard_of_once_the_page_is_left) {
  AllServersAnswer();
  OpenPage();
  desktop.Click(page.surf_lblBack);

  Connection(WebByName()).Reset();
  Run();

  EXPECT_EQ(RowCount(), 10);
  EXPECT_EQ(checks.FailCount(), 0);
}

} // namespace
} // namespace quendra::diagnostics
