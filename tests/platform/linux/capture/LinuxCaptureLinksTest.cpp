#include "platform/linux/capture/LinuxCaptureFixture.h"

#include <filesystem>
#include <net/if.h>

namespace quendra::platform::linux_ {

using integration::Bytes;
using integration::RawLink;
using integration::RunCommand;
using integration::TcpFrame;

namespace {

using Availability = CaptureLibrary::Availability;

/// A session on "qv0", whose interface comes and goes.
class LinuxCaptureLinksTest : public LinuxCaptureFixture {
 protected:
  void SetUp() override {
    LinuxCaptureFixture::SetUp();
    if (IsSkipped()) return;
    capture->AdapterChanged = [this] { told.push_back(capture->availability()); };
    Start("qv0");
  }

  void Remove() { RunCommand("ip link del qv0"); }
  void Return() { AddLink("qv0", "qv1", "10.9.0.1/24"); }
  bool IsGone() { return capture->availability() == Availability::AdapterGone; }
  void AwaitGone() {
    WaitUntil([&] { return IsGone(); }, "the loss");
  }
  void AwaitReturn() {
    WaitUntil([&] { return capture->availability() == Availability::Available; }, "the return");
  }
  /// The far end learns a little later that the link is there, and sends nothing until then.
  void ExpectFrames() {
    RawLink far("qv1");
    const int before = events;
    WaitUntil(
        [&] {
          far.Send(TcpFrame(7, 80));
          return events > before;
        },
        "a frame");
    EXPECT_GE(Drain(), 1);
  }
  static std::ptrdiff_t OpenDescriptors() {
    return std::distance(std::filesystem::directory_iterator("/proc/self/fd"), {});
  }

  using Told = std::vector<Availability>;
  Told told;
};

} // namespace

TEST_F(LinuxCaptureLinksTest, An_interface_that_is_deleted_is_told_of_without_any_traffic) {
  Remove();
  AwaitGone();
  EXPECT_EQ(told, (Told{Availability::AdapterGone}));
}

TEST_F(LinuxCaptureLinksTest, One_that_is_made_again_under_its_name_is_captured_from_again) {
  Remove();
  AwaitGone();
  Return();
  AwaitReturn();
  ExpectFrames();
}

TEST_F(LinuxCaptureLinksTest, One_that_is_renamed_is_gone_and_its_frames_are_no_longer_delivered) {
  RunCommand("ip link set qv0 down && ip link set qv0 name qx0 && ip link set qx0 up");
  AwaitGone();
  RawLink far("qv1");
  for (int i = 0; i < 20; ++i) {
    far.Send(TcpFrame(7, 80));
    desktop.WaitFor([] { return false; }, 10);
  }
  EXPECT_EQ(Drain(), 0);
  EXPECT_EQ(events, 0);
}

TEST_F(LinuxCaptureLinksTest, One_that_gets_its_name_back_is_captured_from_again) {
  RunCommand("ip link set qv0 down && ip link set qv0 name qx0 && ip link set qx0 up");
  AwaitGone();
  RunCommand("ip link set qx0 down && ip link set qx0 name qv0 && ip link set qv0 up");
  AwaitReturn();
  ExpectFrames();
}

TEST_F(LinuxCaptureLinksTest, Another_one_that_takes_the_name_over_is_captured_from) {
  AddLink("qw0", "qw1", "10.8.0.1/24");
  RunCommand("ip link set qv0 down && ip link set qv0 name qx0");
  RunCommand("ip link set qw0 down && ip link set qw0 name qv0 && ip link set qv0 up");
  AwaitReturn();
  RawLink far("qw1");
  WaitUntil(
      [&] {
        far.Send(TcpFrame(9, 80));
        return events > 0;
      },
      "a frame of the other link");
}

TEST_F(LinuxCaptureLinksTest, One_that_is_down_is_gone_until_it_is_up) {
  RunCommand("ip link set qv0 down");
  AwaitGone();
  RunCommand("ip link set qv0 up");
  AwaitReturn();
  ExpectFrames();
  EXPECT_EQ(told, (Told{Availability::AdapterGone, Availability::Available}));
}

TEST_F(LinuxCaptureLinksTest, One_that_was_made_again_before_anybody_looked_is_captured_from_all_the_same) {
  Remove();
  Return();
  WaitUntil([&] { return !told.empty(); }, "the change");
  EXPECT_EQ(told, (Told{Availability::Available}));
  ExpectFrames();
}

TEST_F(LinuxCaptureLinksTest, One_that_was_down_and_up_before_anybody_looked_is_captured_from_all_the_same) {
  RunCommand("ip link set qv0 down && ip link set qv0 up");
  Settle();
  ExpectFrames();
  EXPECT_FALSE(IsGone());
}

TEST_F(LinuxCaptureLinksTest, One_that_was_made_again_under_its_number_too_is_captured_from_all_the_same) {
  const std::string number = std::to_string(if_nametoindex("qv0"));
  Remove();
  RunCommand("ip link add qv0 index " + number +
             " type veth peer name qv1 && ip addr add 10.9.0.1/24 dev qv0 && "
             "ip link set qv0 up && ip link set qv1 up");
  Settle();
  ExpectFrames();
  EXPECT_FALSE(IsGone());
}

TEST_F(LinuxCaptureLinksTest, One_that_goes_a_second_time_is_told_of_again) {
  for (int time = 0; time < 2; ++time) {
    Remove();
    AwaitGone();
    Return();
    AwaitReturn();
  }
  Remove();
  AwaitGone();
  EXPECT_EQ(std::count(told.begin(), told.end(), Availability::AdapterGone), 3);
}

TEST_F(LinuxCaptureLinksTest, What_other_interfaces_do_is_not_told) {
  AddLink("qw0", "qw1", "10.8.0.1/24");
  RunCommand("ip link set qw0 down && ip link del qw1 && ip addr add 10.9.0.5/24 dev qv0");
  Settle();
  EXPECT_EQ(told, Told{});
  ExpectFrames();
}

TEST_F(LinuxCaptureLinksTest, One_that_comes_back_without_an_address_is_told_of_again_when_it_has_one) {
  Remove();
  AwaitGone();
  RunCommand("ip link add qv0 type veth peer name qv1 && ip link set qv0 up");
  AwaitReturn();
  told.clear();
  RunCommand("ip addr add 10.9.0.77/24 dev qv0");
  WaitUntil([&] { return !told.empty(); }, "the address");
  RunCommand("ip addr add 10.9.0.78/24 dev qv0");
  Settle();
  EXPECT_EQ(told, (Told{Availability::Available}));
}

TEST_F(LinuxCaptureLinksTest, Frames_that_came_before_it_went_are_delivered) {
  onEvent = [&] { Drain(); };
  RawLink far("qv1");
  for (int i = 0; i < 100; ++i) far.Send(TcpFrame(1025, 80));
  // Until the kernel has handed over its last block.
  usleep(50'000);
  Remove();
  AwaitGone();
  EXPECT_EQ(capture->Counters().received, 100u);
  EXPECT_EQ(Drain(), 0);
}

TEST_F(LinuxCaptureLinksTest, One_that_goes_in_the_middle_of_a_drain_costs_no_frame_that_had_come) {
  std::vector<Bytes> frames(1000, TcpFrame(1025, 80));
  int taken = 0;
  onEvent = [&] {
    taken += NextFrame().has_value();
    Remove();
    desktop.WaitFor([&] { return IsGone(); }, 2000);
    taken += Drain();
  };
  RawLink("qv1").SendTogether(std::move(frames));
  usleep(50'000);
  WaitUntil([&] { return events > 0; }, "the event");
  EXPECT_TRUE(IsGone());
  EXPECT_EQ(taken, 1000);
  onEvent = nullptr;
  Return();
  AwaitReturn();
  ExpectFrames();
}

TEST_F(LinuxCaptureLinksTest, A_session_that_ended_while_it_was_gone_hears_nothing_and_may_begin_again) {
  Remove();
  AwaitGone();
  capture->vpEnd();
  StopControl();
  told.clear();
  Return();
  Settle();
  EXPECT_EQ(told, Told{});
  EXPECT_FALSE(IsGone());
  Start("qv0");
  ExpectFrames();
}

TEST_F(LinuxCaptureLinksTest, A_handler_may_end_the_session_when_it_is_told) {
  capture->AdapterChanged = [this] { capture->vpEnd(); };
  Remove();
  Settle();
  EXPECT_FALSE(IsGone());
  FrameBytes frame;
  CaptureHeader header{};
  EXPECT_LT(capture->vpCapture(frame, header), 0);
}

TEST_F(LinuxCaptureLinksTest, Another_adapter_can_be_chosen_while_it_is_gone_and_it_again) {
  AddLink("qw0", "qw1", "10.8.0.1/24");
  capture->vpEnd();
  Start("qv0");
  const int gone = IndexAmongListed("qv0");
  const int other = IndexAmongListed("qw0");
  Remove();
  AwaitGone();

  capture->vpSetCurrentAdapter(static_cast<std::int16_t>(other));
  StartControl("qw0");
  EXPECT_FALSE(IsGone());
  RawLink("qw1").Send(TcpFrame(2, 80));
  WaitUntil([&] { return events > 0; }, "the other adapter's frame");

  capture->vpSetCurrentAdapter(static_cast<std::int16_t>(gone));
  StartControl("qv0");
  EXPECT_TRUE(IsGone());
  Return();
  AwaitReturn();
  ExpectFrames();
}

TEST_F(LinuxCaptureLinksTest, Coming_and_going_leaves_no_descriptor_open) {
  const auto before = OpenDescriptors();
  for (int time = 0; time < 20; ++time) {
    Remove();
    AwaitGone();
    if (time % 2 == 1) {
      capture->vpEnd();
      capture->vpBegin(1000);
    }
    Return();
    AwaitReturn();
  }
  EXPECT_EQ(OpenDescriptors(), before);
  capture->vpEnd();
  EXPECT_LT(OpenDescriptors(), before);
}

} // namespace quendra::platform::linux_
