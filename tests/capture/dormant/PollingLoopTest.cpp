#include "capture/dormant/PollingLoop.h"

#include "capture/CaptureProgram.h"

namespace quendra::capture {
namespace {

/// The loop ends when the frames have run out: the first yield of an empty round stops the session.
struct PollingCapture : CaptureProgram {
  PollingCapture() {
    StartCapture();
    machine.Calls.clear();
    AddRow(1, u".1025.");
    desktop.OnYield = [this] { session.CaptureRunning = false; };
  }
  void Poll(std::initializer_list<Bytes> frames) {
    for (const Bytes& frame : frames) machine.Deliver(frame);
    polling.main_DoCapture();
  }
  double Charged() { return Upload(form.main_ListView1.Row(1)); }

  PollingLoop polling{machine.capture, desktop, session, attribution, table};
};

TEST_F(PollingCapture, Ends_at_once_on_a_hidden_page) {
  form.frameMain.Visible = false;
  Poll({Outgoing(1025)});
  EXPECT_EQ(machine.Calls, Calls{});
}

TEST_F(PollingCapture, Sets_two_parameters_and_opens_and_closes_a_session) {
  Poll({});
  EXPECT_EQ(machine.Calls, (Calls{"vpSetParam 0 65536", "vpSetParam 6 1024", "vpBegin 1000", "vpEnd"}));
}

TEST_F(PollingCapture, Without_a_running_capture_no_frame_is_asked_for) {
  session.CaptureRunning = false;
  Poll({Outgoing(1025)});
  EXPECT_EQ(machine.capture.CaptureCalls, 0);
  EXPECT_EQ(machine.Calls.back(), "vpEnd");
}

TEST_F(PollingCapture, Charges_tcp_frames_without_a_peek_and_yields_when_none_waits) {
  Poll({Outgoing(1025), Outgoing(1025)});
  EXPECT_EQ(Charged(), 2);
  EXPECT_EQ(machine.capture.ReadBufferCalls, 0);
  EXPECT_EQ(desktop.YieldCount, 1);
}

TEST_F(PollingCapture, Udp_and_icmp_do_not_end_the_loop) {
  Poll({Udp(), Icmp(), Outgoing(1025)});
  EXPECT_EQ(Charged(), 1);
}

TEST_F(PollingCapture, Drops_arp_frames_also_when_their_bytes_say_tcp) {
  TestFrame arp;
  arp.type = 0x0806;
  Poll({arp.Build()});
  EXPECT_EQ(Charged(), 0);
}

TEST_F(PollingCapture, Frames_count_as_tunnelled_always) {
  TestFrame tunnelled;
  tunnelled.size = 95;
  Bytes plain = Outgoing(999);
  plain.resize(95);
  PutBig16(plain, 74, 1025);
  Poll({tunnelled.BuildTunnelled(), plain});
  EXPECT_EQ(Charged(), 2);
}

TEST_F(PollingCapture, Looks_at_protocol_6_only) {
  TestFrame other;
  other.protocol = 50;
  Poll({other.Build()});
  EXPECT_EQ(Charged(), 0);
}

TEST_F(PollingCapture, A_malformed_frame_is_dropped_and_counted_and_the_loop_goes_on) {
  Bytes cut = Outgoing(1025);
  cut.resize(40);
  Poll({cut, Outgoing(1025)});
  EXPECT_EQ(attribution.MalformedFrames(), 1u);
  EXPECT_EQ(Charged(), 1);
}

TEST_F(PollingCapture, Each_round_applies_the_refresh_rule) {
  LetSecondPass();
  Poll({Outgoing(1025), Outgoing(1025)});
  EXPECT_EQ(Passes(), 1);
}

TEST_F(PollingCapture, A_failed_capture_unloads_the_main_window) {
  int unloaded = 0;
  polling.UnloadMainWindow = [&] {
    ++unloaded;
    session.CaptureRunning = false;
  };
  machine.capture.FailCapture();
  Poll({});
  EXPECT_EQ(unloaded, 1);
  EXPECT_EQ(desktop.YieldCount, 0);
}

TEST_F(PollingCapture, The_main_window_is_the_form_of_the_page) {
  struct MainWindow : monitor::MonitorControls {
    std::function<void()> Unloading;
    void Form_Unload() override { Unloading(); }
  } window;
  window.Unloading = [this] { session.CaptureRunning = false; };
  monitor::ProcessTable tableOfWindow(machine.processes, machine.system, window.table, adder, ports);
  PollingLoop other(machine.capture, desktop, session, attribution, tableOfWindow);
  desktop.Show(window);
  machine.capture.FailCapture();
  EXPECT_THROW(other.main_DoCapture(), forms::ProgramEnded);
  EXPECT_FALSE(window.IsLoaded());
}

TEST_F(PollingCapture, A_page_that_hides_in_a_yield_ends_the_loop) {
  desktop.OnYield = [this] { form.frameMain.Visible = false; };
  Poll({Outgoing(1025)});
  EXPECT_EQ(Charged(), 1);
  EXPECT_EQ(machine.Calls.back(), "vpEnd");
}

} // namespace
} // namespace quendra::capture
