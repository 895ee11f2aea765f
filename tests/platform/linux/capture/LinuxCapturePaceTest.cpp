#include "platform/linux/capture/LinuxCaptureFixture.h"

#include <sys/socket.h>

namespace quendra::platform::linux_ {

using integration::RawLink;
using integration::TcpFrame;

namespace {

/// A desktop's loop that tells how many descriptors of captures and how many timers are in use.
class CountingLoop : public EventLoop, public DescriptorWatch {
 public:
  CountingLoop(EventLoop& loop, DescriptorWatch& descriptors) : loop_(loop), descriptors_(descriptors) {}

  void Post(std::function<void()> work) override { loop_.Post(std::move(work)); }
  std::unique_ptr<Subscription> WatchDescriptor(int descriptor, std::function<void()> ready) override {
    auto subscription = descriptors_.WatchDescriptor(descriptor, std::move(ready));
    if (!IsCapture(descriptor)) return subscription;
    return std::make_unique<Counted>(std::move(subscription), watches);
  }
  std::unique_ptr<Subscription> StartTimer(int milliseconds, std::function<void()> tick) override {
    return std::make_unique<Counted>(loop_.StartTimer(milliseconds, std::move(tick)), timers);
  }
  void PumpOnce() override { loop_.PumpOnce(); }
  int ModalDepth() const override { return loop_.ModalDepth(); }

  int watches = 0;
  int timers = 0;

 private:
  class Counted : public Subscription {
   public:
    Counted(std::unique_ptr<Subscription> inner, int& count) : inner_(std::move(inner)), count_(count) {
      ++count_;
    }
    ~Counted() override { --count_; }

   private:
    std::unique_ptr<Subscription> inner_;
    int& count_;
  };

  static bool IsCapture(int descriptor) {
    int domain = 0;
    socklen_t size = sizeof domain;
    return getsockopt(descriptor, SOL_SOCKET, SO_DOMAIN, &domain, &size) == 0 && domain == AF_PACKET;
  }

  EventLoop& loop_;
  DescriptorWatch& descriptors_;
};

class LinuxCapturePaceTest : public LinuxCaptureFixture {
 protected:
  void SetUp() override {
    LinuxCaptureFixture::SetUp();
    if (IsSkipped()) return;
    capture.emplace(loop, loop);
    far.emplace("qv1");
    onEvent = [&] { Drain(); };
    Start("qv0");
  }
  void TearDown() override {
    far.reset();
    LinuxCaptureFixture::TearDown();
  }
  void ExpectInUse(int watches, int timers) {
    EXPECT_EQ(loop.watches, watches);
    EXPECT_EQ(loop.timers, timers);
  }
  void SendOneAndWait() {
    const int before = events;
    far->Send(TcpFrame(1025, 80));
    WaitUntil([&] { return events > before; }, "the frame");
  }

  CountingLoop loop{desktop, desktop};
  std::optional<RawLink> far;
};

} // namespace

TEST_F(LinuxCapturePaceTest, On_a_silent_line_the_descriptor_is_watched_and_no_timer_runs) {
  Settle();
  ExpectInUse(1, 0);
}

TEST_F(LinuxCapturePaceTest, A_line_that_has_become_busy_is_looked_at_by_a_timer) {
  SendOneAndWait();
  ExpectInUse(0, 1);
}

TEST_F(LinuxCapturePaceTest, A_busy_line_rings_once_in_50_milliseconds_however_many_frames_come) {
  const auto sendMany = [&] {
    for (unsigned i = 0; i < 5000; ++i) far->Send(TcpFrame(1026, 80));
  };
  SendOneAndWait();
  sendMany();
  // The timer was started at some moment of the wait. After its first tick its time is known.
  for (int i = 0; i < 50 && events < 2; ++i) desktop.Advance(1);
  const int before = events;
  sendMany();
  desktop.Advance(49);
  EXPECT_EQ(events, before);
  desktop.Advance(1);
  EXPECT_EQ(events, before + 1);
}

TEST_F(LinuxCapturePaceTest, A_line_without_frames_for_50_milliseconds_is_silent_again) {
  SendOneAndWait();
  desktop.Advance(50);
  ExpectInUse(1, 0);
}

TEST_F(LinuxCapturePaceTest, During_an_event_no_descriptor_is_watched_that_a_loop_inside_it_could_spin_on) {
  onEvent = [&] { ExpectInUse(0, 1); };
  SendOneAndWait();
}

TEST_F(LinuxCapturePaceTest, A_stopped_control_needs_neither_descriptor_nor_timer) {
  SendOneAndWait();
  StopControl();
  ExpectInUse(0, 0);
}

TEST_F(LinuxCapturePaceTest, An_ended_session_needs_neither_descriptor_nor_timer) {
  SendOneAndWait();
  capture->vpEnd();
  ExpectInUse(0, 0);
}

TEST_F(LinuxCapturePaceTest, An_interface_that_goes_while_it_is_busy_needs_neither_descriptor_nor_timer) {
  SendOneAndWait();
  far.reset();
  integration::RunCommand("ip link del qv0");
  Settle();
  ExpectInUse(0, 0);
}

} // namespace quendra::platform::linux_
