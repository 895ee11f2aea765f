#include "platform/linux/capture/LinuxCaptureFixture.h"

namespace quendra::platform::linux_ {

using integration::Bytes;
using integration::RawLink;
using integration::TcpFrame;

namespace {

/// What holds an event up.
enum class Modal { Box, Form };

struct ModalForm : forms::Form {
  ModalForm() : Form(u"frmModal") {}
  void Design() override {}
};

/// The first event takes one frame and opens a box or a modal form, which stands while `meanwhile` runs; then
/// it drains, as each event inside it does.
class LinuxCaptureNestingTest : public LinuxCaptureFixture, public testing::WithParamInterface<Modal> {
 protected:
  void SetUp() override {
    LinuxCaptureFixture::SetUp();
    if (IsSkipped()) return;
    desktop.OnBox = [&] { meanwhile(); };
    desktop.OnModal = [&](forms::Form&) { meanwhile(); };
    onEvent = [&] {
      deepest = std::max(deepest, ++depth);
      if (events == 1) {
        TakeOne();
        Open();
      }
      taken += Drain();
      --depth;
    };
    Start("qv0");
  }

  virtual void TakeOne() { taken += NextFrame().has_value(); }
  void Open() {
    if (GetParam() == Modal::Box)
      desktop.MessageBox(u"text", 0, u"title");
    else
      desktop.Show(form, forms::Modality::Modal);
  }
  void Send(unsigned count) {
    std::vector<Bytes> frames;
    for (unsigned i = 0; i < count; ++i) frames.push_back(TcpFrame(1025 + i, 80));
    RawLink("qv1").SendTogether(std::move(frames));
  }
  void WaitForEvents(int count) {
    WaitUntil([&] { return events >= count; }, "events");
  }

  ModalForm form;
  std::function<void()> meanwhile = [] {};
  int taken = 0;
  int depth = 0;
  int deepest = 0;
};

INSTANTIATE_TEST_SUITE_P(, LinuxCaptureNestingTest, testing::Values(Modal::Box, Modal::Form),
                         [](const auto& tested) { return tested.param == Modal::Box ? "Box" : "Form"; });

} // namespace

TEST_P(LinuxCaptureNestingTest, While_it_stands_events_go_on_and_no_frame_is_lost) {
  meanwhile = [&] {
    for (int arrival = 1; arrival <= 4; ++arrival) {
      Send(10);
      WaitForEvents(1 + arrival);
    }
    EXPECT_EQ(taken, 41);
  };
  Send(1);
  WaitForEvents(5);
  Settle();
  EXPECT_EQ(taken, 41);
  EXPECT_EQ(deepest, 2);
}

TEST_P(LinuxCaptureNestingTest, Frames_that_the_event_has_left_are_taken_while_it_stands) {
  meanwhile = [&] {
    WaitForEvents(2);
    EXPECT_EQ(taken, 5);
  };
  Send(5);
  WaitForEvents(2);
}

TEST_P(LinuxCaptureNestingTest, Without_frames_there_are_no_events_while_it_stands) {
  meanwhile = [&] { Settle(); };
  Send(1);
  WaitForEvents(1);
  Settle();
  EXPECT_EQ(events, 1);
}

TEST_P(LinuxCaptureNestingTest, Once_it_has_gone_the_event_is_not_entered_again) {
  bool entered = false;
  onEvent = [&] {
    EXPECT_FALSE(entered);
    entered = true;
    if (events == 1) Open();
    for (int i = 0; i < 5; ++i) {
      Send(20);
      desktop.DoEvents();
      desktop.Advance(60);
    }
    taken += Drain();
    entered = false;
  };
  Send(1);
  WaitUntil([&] { return taken > 100; }, "the frames");
}

TEST_P(LinuxCaptureNestingTest, An_event_inside_another_that_merely_yields_is_not_entered_again) {
  onEvent = [&] {
    deepest = std::max(deepest, ++depth);
    if (events == 1) Open();
    if (events == 2) {
      Send(20);
      for (int i = 0; i < 5; ++i) desktop.Advance(60);
    }
    taken += Drain();
    --depth;
  };
  meanwhile = [&] {
    Send(1);
    WaitForEvents(2);
  };
  Send(1);
  WaitUntil([&] { return taken >= 22; }, "the frames");
  EXPECT_EQ(deepest, 2);
}

TEST_P(LinuxCaptureNestingTest, An_event_that_begins_while_one_stands_is_not_entered_again) {
  meanwhile = [&] {
    Send(1);
    WaitForEvents(1);
  };
  onEvent = [&] {
    deepest = std::max(deepest, ++depth);
    Send(5);
    for (int i = 0; i < 5 && events == 1; ++i) desktop.Advance(60);
    taken += Drain();
    --depth;
  };
  Open();
  EXPECT_EQ(deepest, 1);
}

TEST_P(LinuxCaptureNestingTest, A_second_one_opened_in_an_event_inside_lets_events_go_on_too) {
  int opened = 0;
  meanwhile = [&] {
    ++opened;
    Send(3);
    WaitForEvents(1 + opened);
  };
  onEvent = [&] {
    deepest = std::max(deepest, ++depth);
    if (events <= 3) Open();
    taken += Drain();
    --depth;
  };
  Send(3);
  WaitUntil([&] { return taken >= 12; }, "all frames");
  EXPECT_EQ(deepest, 4);
  EXPECT_EQ(taken, 12);
}

namespace {

/// The first event looks at its frame again when the box or form has gone.
class HeldFrameTest : public LinuxCaptureNestingTest {
 protected:
  void TakeOne() override {
    CaptureHeader header{};
    ASSERT_GT(capture->vpCapture(frame, header), 0);
    ++taken;
    before = Bytes(frame.Data(), frame.Data() + frame.UpperBound() + 1);
  }
  void ExpectUntouched() {
    EXPECT_EQ(Bytes(frame.Data(), frame.Data() + frame.UpperBound() + 1), before);
    frame = {};
  }
  /// Checks after `work`, inside the event that took the frame.
  void While(std::function<void()> work) {
    meanwhile = [this, work = std::move(work)] {
      work();
      ExpectUntouched();
    };
    RawLink("qv1").Send(TcpFrame(4711, 80, 100));
    WaitUntil([&] { return depth == 0 && events > 0; }, "the end of the event");
    EXPECT_EQ(frame.UpperBound(), 1);
  }

  FrameBytes frame;
  Bytes before;
};

INSTANTIATE_TEST_SUITE_P(, HeldFrameTest, testing::Values(Modal::Box));

} // namespace

TEST_P(HeldFrameTest, A_frame_outlives_the_events_inside_that_take_others) {
  While([&] {
    for (int arrival = 1; arrival <= 3; ++arrival) {
      Send(500);
      // The system may hand them over in more than one part.
      WaitUntil([&] { return taken >= 1 + 500 * arrival; }, "the frames");
    }
  });
  EXPECT_EQ(taken, 1501);
}

TEST_P(HeldFrameTest, A_frame_outlives_the_session) {
  While([&] {
    capture->vpEnd();
    capture->vpBegin(1000);
    Send(500);
    WaitUntil([&] { return taken >= 501; }, "the frames");
  });
  EXPECT_EQ(taken, 501);
}

TEST_P(HeldFrameTest, A_frame_outlives_a_change_of_the_adapter_inside_an_event) {
  AddLink("qw0", "qw1", "10.8.0.1/24");
  const int other = IndexOf("qw0");
  While([&] {
    StopControl();
    control.reset();
    capture->vpSetCurrentAdapter(static_cast<std::int16_t>(other));
    StartControl("qw0");
    RawLink("qw1").Send(TcpFrame(4000, 80, 90));
    WaitForEvents(2);
  });
  EXPECT_EQ(taken, 2);
}

TEST_P(HeldFrameTest, A_frame_outlives_the_library) {
  While([&] {
    control.reset();
    capture.reset();
    capture.emplace(desktop, desktop);
  });
}

} // namespace quendra::platform::linux_
