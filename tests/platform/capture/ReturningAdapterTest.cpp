#include "platform/capture/LiveCaptureFixture.h"

namespace quendra::platform {

namespace {

using Availability = CaptureLibrary::Availability;
using Availabilities = std::vector<Availability>;

/// A session whose adapter comes and goes.
class ReturningAdapterTest : public LiveCaptureFixture {
 protected:
  void SetUp() override {
    capture->AdapterChanged = [this] { told.push_back(capture->availability()); };
    Start("line");
  }
  void ExpectFrames() {
    const int before = taken;
    Arrive(2);
    Settle();
    EXPECT_EQ(taken, before + 2);
  }

  Availabilities told;
};

INSTANTIATE_TEST_SUITE_P(, ReturningAdapterTest, testing::Values(Pace::Bell, Pace::Timer),
                         [](const auto& tested) { return tested.param == Pace::Bell ? "Bell" : "Timer"; });

} // namespace

TEST_P(ReturningAdapterTest, One_that_goes_is_told_of_and_its_source_ends) {
  lines.Remove("line");
  Settle();
  EXPECT_EQ(told, Availabilities{Availability::AdapterGone});
  EXPECT_EQ(lines.openSources, 0);
}

TEST_P(ReturningAdapterTest, One_that_returns_under_its_name_is_captured_from_again) {
  lines.Remove("line");
  Settle();
  lines.Add("line", "10.9.0.1");
  Settle();
  EXPECT_EQ(told, (Availabilities{Availability::AdapterGone, Availability::Available}));
  ExpectFrames();
}

TEST_P(ReturningAdapterTest, One_that_was_made_again_before_anybody_looked_is_captured_from_all_the_same) {
  lines.Remove("line");
  lines.Add("line", "10.9.0.1");
  Settle();
  EXPECT_EQ(told, Availabilities{Availability::Available});
  ExpectFrames();
}

TEST_P(ReturningAdapterTest, One_that_comes_back_without_an_address_is_told_of_again_when_it_has_one) {
  lines.Remove("line");
  Settle();
  lines.Add("line", "");
  Settle();
  told.clear();
  lines.Change("line", [](auto& line) { line.address = Ipv4Address::FromHost(0x0A090001); });
  lines.Change("line", [](auto& line) { line.address = Ipv4Address::FromHost(0x0A090002); });
  Settle();
  EXPECT_EQ(told, Availabilities{Availability::Available});
}

TEST_P(ReturningAdapterTest, What_had_come_before_it_was_switched_off_is_delivered) {
  onEvent = [&] {
    taken += NextPort().has_value();
    lines.Change("line", [](auto& line) { line.isUp = false; });
    desktop.Advance(10);
    taken += Drain();
  };
  Arrive(200);
  Settle();
  EXPECT_EQ(taken, 200);
  EXPECT_EQ(told, Availabilities{Availability::AdapterGone});
}

TEST_P(ReturningAdapterTest, What_other_adapters_do_is_not_told) {
  lines.Add("other", "10.8.0.1");
  lines.Remove("other");
  Settle();
  EXPECT_EQ(told, Availabilities{});
  ExpectFrames();
}

TEST_P(ReturningAdapterTest, A_source_that_fails_is_opened_again) {
  lines.Find("line")->fails = true;
  Arrive(1);
  Settle();
  EXPECT_EQ(told, Availabilities{Availability::Available});
  EXPECT_EQ(taken, 1);
  ExpectFrames();
}

TEST_P(ReturningAdapterTest, A_source_that_fails_outside_of_an_event_is_opened_again) {
  lines.Find("line")->fails = true;
  FrameBytes frame;
  CaptureHeader header{};
  EXPECT_EQ(capture->vpCapture(frame, header), -1);
  Settle();
  EXPECT_EQ(told, Availabilities{Availability::Available});
  ExpectFrames();
}

TEST_P(ReturningAdapterTest, A_source_that_fails_again_and_again_is_opened_once_a_second) {
  lines.Find("line")->failsAlways = true;
  Arrive(1);
  desktop.Advance(5000);
  const int before = lines.opened;
  desktop.Advance(10000);
  EXPECT_EQ(lines.opened - before, 10);
  lines.Find("line")->failsAlways = false;
  Settle();
  ExpectFrames();
}

TEST_P(ReturningAdapterTest, A_session_that_ended_while_it_was_gone_hears_nothing_of_its_return) {
  lines.Remove("line");
  Settle();
  capture->vpEnd();
  told.clear();
  lines.Add("line", "10.9.0.1");
  Settle();
  EXPECT_EQ(told, Availabilities{});
  EXPECT_EQ(lines.openSources, 0);
}

TEST_P(ReturningAdapterTest, A_handler_may_end_the_session_when_it_is_told) {
  capture->AdapterChanged = [this] { capture->vpEnd(); };
  lines.Remove("line");
  lines.Add("line", "10.9.0.1");
  Settle();
  EXPECT_EQ(lines.openSources, 0);
}

} // namespace quendra::platform
