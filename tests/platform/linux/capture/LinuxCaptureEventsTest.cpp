#include "platform/linux/capture/LinuxCaptureFixture.h"

#include <unistd.h>

#include <cstring>

namespace quendra::platform::linux_ {

using integration::Bytes;
using integration::RawLink;
using integration::RunCommand;
using integration::TcpFrame;

namespace {

class LinuxCaptureEventsTest : public LinuxCaptureFixture {
 protected:
  void SetUp() override {
    LinuxCaptureFixture::SetUp();
    if (!IsSkipped()) Start("qv0");
  }
  /// A burst that the loop finds as one arrival: where the kernel's clock ended a block in the midst of it,
  /// the next block has been handed over, too.
  void SendTcp(unsigned count) {
    std::vector<Bytes> frames;
    for (unsigned i = 0; i < count; ++i) frames.push_back(TcpFrame(1025 + i, 80));
    RawLink("qv1").SendTogether(std::move(frames));
    constexpr useconds_t kTwoBlocks = 40'000;
    ::usleep(kTwoBlocks);
  }
  void WaitForEvents(int count) {
    WaitUntil([&] { return events >= count; }, "events");
  }
};

struct Record {
  std::uint32_t captured = 0;
  std::uint32_t wire = 0;
  std::uint16_t headerLength = 0;
  Bytes bytes = Bytes(15001);

  explicit Record(CaptureControl& control) {
    control.ReadBuffer(bytes);
    captured = Little32(bytes, 8);
    wire = Little32(bytes, 12);
    headerLength = Little16(bytes, 16);
  }
};

} // namespace

TEST_F(LinuxCaptureEventsTest, Without_frames_there_is_no_event) {
  Settle();
  EXPECT_EQ(events, 0);
}

TEST_F(LinuxCaptureEventsTest, Frames_that_arrive_together_raise_one_event) {
  onEvent = [&] { Drain(); };
  SendTcp(5);
  WaitForEvents(1);
  Settle();
  EXPECT_EQ(events, 1);
}

TEST_F(LinuxCaptureEventsTest, Each_arrival_raises_an_event) {
  onEvent = [&] { Drain(); };
  for (int arrival = 1; arrival <= 4; ++arrival) {
    SendTcp(1);
    WaitForEvents(arrival);
  }
  Settle();
  EXPECT_EQ(events, 4);
}

TEST_F(LinuxCaptureEventsTest, An_event_that_took_frames_and_left_some_is_raised_again_through_the_queue) {
  int taken = 0;
  onEvent = [&] { taken += NextFrame().has_value(); };
  SendTcp(5);
  WaitForEvents(5);
  Settle();
  EXPECT_EQ(events, 5);
  EXPECT_EQ(taken, 5);
}

TEST_F(LinuxCaptureEventsTest, The_second_event_comes_behind_what_was_posted_before) {
  std::string order;
  onEvent = [&] {
    order += "event ";
    desktop.Post([&] { order += "posted "; });
    NextFrame();
  };
  SendTcp(2);
  WaitForEvents(2);
  Settle();
  EXPECT_EQ(order, "event posted event posted ");
}

TEST_F(LinuxCaptureEventsTest, An_event_that_took_none_waits_for_new_frames) {
  SendTcp(3);
  WaitForEvents(1);
  Settle();
  EXPECT_EQ(events, 1);
}

TEST_F(LinuxCaptureEventsTest, Frames_that_were_left_are_read_with_those_that_come_later) {
  SendTcp(3);
  WaitForEvents(1);
  int taken = 0;
  onEvent = [&] { taken = Drain(); };
  SendTcp(2);
  WaitForEvents(2);
  EXPECT_EQ(taken, 5);
}

TEST_F(LinuxCaptureEventsTest, The_buffer_holds_the_newest_record_with_a_header_of_18_bytes) {
  RawLink("qv1").SendTogether({TcpFrame(1025, 80, 1500), TcpFrame(1026, 53, 200)});
  WaitForEvents(1);
  const Record record(*control);
  EXPECT_EQ(record.captured, 96u);
  EXPECT_EQ(record.wire, 214u);
  EXPECT_EQ(record.headerLength, 18);
  EXPECT_EQ(record.bytes[18 + 14 + 9], 6);
  const Bytes frame(record.bytes.begin() + 18, record.bytes.begin() + 18 + 96);
  EXPECT_EQ(SourcePort(frame), 1026u);
}

TEST_F(LinuxCaptureEventsTest, Behind_frames_that_were_left_the_buffer_holds_the_newest_of_all_that_came) {
  SendTcp(3);
  WaitForEvents(1);
  SendTcp(900);
  RawLink("qv1").Send(TcpFrame(4711, 80));
  WaitUntil([&] { return capture->Counters().received == 904; }, "all frames");
  EXPECT_EQ(events, 2);
  const Record record(*control);
  EXPECT_EQ(Big16(record.bytes, 18 + 34), 4711);
}

TEST_F(LinuxCaptureEventsTest, The_newest_record_stays_when_its_frame_has_been_taken) {
  SendTcp(2);
  WaitForEvents(1);
  Drain();
  const Bytes frame = [&] {
    const Record record(*control);
    return Bytes(record.bytes.begin() + 18, record.bytes.end());
  }();
  EXPECT_EQ(SourcePort(frame), 1026u);
}

TEST_F(LinuxCaptureEventsTest, Before_the_first_frame_the_buffer_holds_an_empty_record) {
  const Record record(*control);
  EXPECT_EQ(record.captured, 0u);
  EXPECT_EQ(record.headerLength, 18);
}

TEST_F(LinuxCaptureEventsTest, A_buffer_shorter_than_the_record_is_filled_to_its_end) {
  SendTcp(1);
  WaitForEvents(1);
  for (std::size_t length = 0; length < 40; ++length) {
    Bytes buffer(length + 1, 0xEE);
    control->ReadBuffer(std::span(buffer).first(length));
    EXPECT_EQ(buffer[length], 0xEE);
  }
}

TEST_F(LinuxCaptureEventsTest, A_handler_that_yields_is_not_entered_again) {
  int depth = 0;
  int deepest = 0;
  onEvent = [&] {
    deepest = std::max(deepest, ++depth);
    for (int i = 0; i < 20 && events < 3; ++i) {
      SendTcp(200);
      desktop.DoEvents();
      desktop.Advance(60);
      NextFrame();
    }
    if (events == 3) Drain();
    --depth;
  };
  SendTcp(1);
  WaitForEvents(3);
  EXPECT_EQ(deepest, 1);
}

TEST_F(LinuxCaptureEventsTest, Frames_that_arrive_during_an_event_are_delivered_to_it) {
  int taken = 0;
  onEvent = [&] {
    taken += Drain();
    if (taken >= 3) return;
    SendTcp(2);
    desktop.WaitFor([&] { return (taken += Drain()) >= 3; }, 5000);
  };
  SendTcp(1);
  WaitForEvents(1);
  EXPECT_EQ(taken, 3);
  Settle();
  EXPECT_EQ(events, 1);
}

TEST_F(LinuxCaptureEventsTest, A_control_may_go_while_its_own_event_runs) {
  onEvent = [&] {
    control.reset();
    desktop.DoEvents();
    NextFrame();
  };
  SendTcp(3);
  WaitForEvents(1);
  Settle();
  EXPECT_EQ(events, 1);
}

TEST_F(LinuxCaptureEventsTest, The_adapter_may_change_while_an_event_runs) {
  AddLink("qw0", "qw1", "10.8.0.1/24");
  const int other = IndexOf("qw0");
  int framesOfTheOther = 0;
  onEvent = [&] {
    if (events > 1) {
      framesOfTheOther += Drain();
      return;
    }
    NextFrame();
    StopControl();
    control.reset();
    capture->vpSetCurrentAdapter(static_cast<std::int16_t>(other));
    StartControl("qw0");
    desktop.DoEvents();
  };
  SendTcp(3);
  WaitForEvents(1);
  RawLink("qw1").Send(TcpFrame(4000, 80));
  WaitForEvents(2);
  EXPECT_EQ(framesOfTheOther, 1);
}

TEST_F(LinuxCaptureEventsTest, The_session_may_end_while_an_event_runs) {
  std::int32_t result = 1;
  onEvent = [&] {
    NextFrame();
    capture->vpEnd();
    StopControl();
    FrameBytes frame;
    CaptureHeader header{};
    result = capture->vpCapture(frame, header);
  };
  SendTcp(3);
  WaitForEvents(1);
  Settle();
  EXPECT_LT(result, 0);
  EXPECT_EQ(events, 1);
}

TEST_F(LinuxCaptureEventsTest, The_library_may_go_while_an_event_runs) {
  onEvent = [&] {
    NextFrame();
    control.reset();
    capture.reset();
  };
  SendTcp(3);
  WaitForEvents(1);
  Settle();
  EXPECT_EQ(events, 1);
}

TEST_F(LinuxCaptureEventsTest, Stopped_events_stay_away_until_they_are_started) {
  std::int32_t result = 0;
  control->StopEvents(result);
  SendTcp(2);
  Settle();
  EXPECT_EQ(events, 0);
  control->StartEvents(result);
  int taken = 0;
  onEvent = [&] { taken += Drain(); };
  WaitForEvents(1);
  EXPECT_EQ(taken, 2);
}

TEST_F(LinuxCaptureEventsTest, A_control_bound_to_another_adapter_does_not_ring) {
  AddLink("qw0", "qw1", "10.8.0.1/24");
  IndexOf("qw0");
  StartControl("qw0");
  SendTcp(2);
  Settle();
  EXPECT_EQ(events, 0);
}

TEST_F(LinuxCaptureEventsTest, A_fault_of_a_handler_goes_to_the_dispatcher_whatever_its_number) {
  onEvent = [] { throw Fault(Fault::kSubscript); };
  SendTcp(1);
  WaitUntil([&] { return desktop.Ended; }, "the end");
  EXPECT_EQ(desktop.EndStatus, 1);
}

TEST_F(LinuxCaptureEventsTest, When_events_take_nothing_the_oldest_frames_go_first_and_are_counted) {
  RawLink far("qv1");
  constexpr std::uint64_t kFrames = FrameQueue::kUsualCapacity + 50000;
  for (std::uint64_t sent = 0; sent < kFrames; ++sent) {
    far.Send(TcpFrame(1025, 53));
    if (sent % 2000 == 0) desktop.Advance(100);
  }
  far.Send(TcpFrame(4000, 80));
  WaitUntil([&] { return capture->Counters().received >= kFrames + 1; }, "all frames");
  unsigned lastPort = 0;
  std::uint64_t delivered = 0;
  while (const auto frame = NextFrame()) {
    lastPort = SourcePort(*frame);
    ++delivered;
  }
  EXPECT_EQ(lastPort, 4000u);
  EXPECT_GT(capture->Counters().droppedByQueue, 0u);
  EXPECT_EQ(delivered + capture->Counters().droppedByQueue, kFrames + 1);
  EXPECT_EQ(capture->Counters().droppedByKernel, 0u);
}

} // namespace quendra::platform::linux_
