#include "platform/capture/LiveCaptureFixture.h"

namespace quendra::platform {

namespace {

using Availability = CaptureLibrary::Availability;

class LiveCaptureTest : public LiveCaptureFixture {};

std::string NameOf(const testing::TestParamInfo<Pace>& tested) {
  return tested.param == Pace::Bell ? "Bell" : "Timer";
}

INSTANTIATE_TEST_SUITE_P(, LiveCaptureTest, testing::Values(Pace::Bell, Pace::Timer), NameOf);

} // namespace

TEST_P(LiveCaptureTest, Packets_that_arrive_together_raise_one_event) {
  Start("line");
  Arrive(5);
  Settle();
  EXPECT_EQ(events, 1);
  EXPECT_EQ(taken, 5);
}

TEST_P(LiveCaptureTest, Without_packets_there_is_no_event) {
  Start("line");
  Settle();
  EXPECT_EQ(events, 0);
}

TEST_P(LiveCaptureTest, One_event_drains_more_packets_than_a_batch_has) {
  Start("line");
  Arrive(1000);
  Settle();
  EXPECT_EQ(events, 1);
  EXPECT_EQ(taken, 1000);
  EXPECT_EQ(lines.largestFill, std::size_t{FrameSource::kBatch});
}

TEST_P(LiveCaptureTest, A_busy_line_rings_once_in_50_milliseconds) {
  Start("line");
  Arrive(1);
  desktop.PumpOnce();
  for (int i = 0; i < 1000 && events == 0; ++i) desktop.Advance(1);
  ASSERT_EQ(events, 1);
  for (int i = 0; i < 49; ++i) {
    Arrive(10);
    desktop.Advance(1);
  }
  EXPECT_EQ(events, 1);
  desktop.Advance(1);
  EXPECT_EQ(events, 2);
}

TEST_P(LiveCaptureTest, An_event_that_took_frames_and_left_some_is_raised_again_through_the_queue) {
  onEvent = [&] { taken += NextPort().has_value(); };
  Start("line");
  Arrive(5);
  Settle();
  EXPECT_EQ(events, 5);
  EXPECT_EQ(taken, 5);
}

TEST_P(LiveCaptureTest, After_an_event_that_took_none_the_newest_of_all_that_came_is_told) {
  onEvent = [] {};
  Start("line");
  Arrive(3);
  Settle();
  EXPECT_EQ(events, 1);
  Arrive(900);
  Settle();
  EXPECT_EQ(events, 2);
  std::array<std::uint8_t, 120> record{};
  control->ReadBuffer(record);
  EXPECT_EQ(Big16(record, 18 + 34), 1025 + 899);
}

TEST_P(LiveCaptureTest, A_handler_that_yields_is_not_entered_again) {
  int depth = 0;
  int deepest = 0;
  onEvent = [&] {
    deepest = std::max(deepest, ++depth);
    for (int i = 0; i < 5 && events < 3; ++i) {
      Arrive(200);
      desktop.Advance(60);
      NextPort();
    }
    if (events == 3) Drain();
    --depth;
  };
  Start("line");
  Arrive(1);
  Settle();
  EXPECT_GE(events, 3);
  EXPECT_EQ(deepest, 1);
}

TEST_P(LiveCaptureTest, While_a_box_stands_in_an_event_events_go_on_and_no_frame_is_lost) {
  desktop.OnBox = [&] {
    Arrive(10);
    Settle();
    EXPECT_EQ(events, 2);
  };
  onEvent = [&] {
    taken += NextPort().has_value();
    if (events == 1) desktop.MessageBox(u"text", 0, u"title");
    taken += Drain();
  };
  Start("line");
  Arrive(4);
  Settle();
  EXPECT_EQ(taken, 14);
}

TEST_P(LiveCaptureTest, The_packets_of_a_link_without_Ethernet_headers_come_as_Ethernet_frames) {
  lines.Find("line")->form = LinkForm::RawIp;
  Start("line");
  onEvent = [] {};
  lines.Arrive("line", {integration::Ipv4Packet(6, "1.2.3.4", 4711, "5.6.7.8", 80, 60)});
  Settle();
  EXPECT_EQ(NextPort(), 4711u);
}

TEST_P(LiveCaptureTest, When_events_take_nothing_a_small_queue_drops_its_oldest_frames_and_counts_them) {
  capture.emplace(desktop, lines.MakeAdapters(), 1);
  onEvent = [] {};
  Start("line");
  for (int i = 0; i < 100; ++i) {
    Arrive(200);
    Settle();
  }
  const std::uint64_t dropped = capture->Counters().droppedByQueue;
  EXPECT_GT(dropped, 0u);
  EXPECT_EQ(static_cast<std::uint64_t>(Drain()) + dropped, 20000u);
  EXPECT_EQ(capture->Counters().received, 20000u);
}

TEST_P(LiveCaptureTest, Counters_span_the_sessions) {
  Start("line");
  Arrive(3);
  lines.Find("line")->dropped = 40;
  Settle();
  capture->vpEnd();
  lines.Find("line")->dropped = 2;
  capture->vpBegin(1000);
  Arrive(4);
  Settle();
  EXPECT_EQ(capture->Counters().received, 7u);
  EXPECT_EQ(capture->Counters().droppedByKernel, 42u);
}

TEST_P(LiveCaptureTest, A_session_ends_its_source_and_the_library_its_session) {
  Start("line");
  EXPECT_EQ(lines.openSources, 1);
  capture->vpEnd();
  EXPECT_EQ(lines.openSources, 0);
  capture->vpBegin(1000);
  EXPECT_EQ(lines.openSources, 1);
  capture.reset();
  EXPECT_EQ(lines.openSources, 0);
}

TEST_P(LiveCaptureTest, A_control_may_outlive_the_library) {
  Start("line");
  capture.reset();
  Arrive(3);
  Settle();
  std::int32_t result = -1;
  control->StopEvents(result);
  control.reset();
  EXPECT_EQ(events, 0);
  EXPECT_EQ(result, 0);
}

TEST_P(LiveCaptureTest, Without_the_systems_library_capture_is_not_available) {
  lines.hasLibrary = false;
  Start("line");
  EXPECT_EQ(last, -1);
  EXPECT_EQ(capture->availability(), Availability::NoLibrary);
  EXPECT_EQ(lines.openSources, 0);
}

TEST_P(LiveCaptureTest, Without_rights_the_adapters_are_listed_and_a_session_delivers_nothing) {
  lines.mayCapture = false;
  Start("line");
  EXPECT_EQ(List(), std::vector<std::string>{"line"});
  EXPECT_EQ(capture->availability(), Availability::NoRights);
  FrameBytes frame;
  CaptureHeader header{};
  EXPECT_LT(capture->vpCapture(frame, header), 0);
  EXPECT_EQ(frame.UpperBound(), 59);
}

TEST_P(LiveCaptureTest, A_link_that_is_not_understood_delivers_nothing) {
  lines.knowsItsLinks = false;
  Start("line");
  Arrive(3);
  Settle();
  EXPECT_EQ(events, 0);
  EXPECT_EQ(capture->availability(), Availability::AdapterGone);
}

} // namespace quendra::platform
