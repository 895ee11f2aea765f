#include "capture/CaptureProgram.h"

namespace quendra::capture {
namespace {

struct DrainLoop : CaptureProgram {
  DrainLoop() {
    StartCapture();
    AddRow(1, u".1025.");
  }
  double Charged() { return Upload(form.main_ListView1.Row(1)); }
};

TEST_F(DrainLoop, An_event_yields_first_and_then_once_with_each_frame) {
  Receive({Outgoing(1025), Outgoing(1025)});
  EXPECT_EQ(desktop.YieldCount, 4);
  EXPECT_EQ(machine.capture.CaptureCalls, 3);
}

TEST_F(DrainLoop, On_a_hidden_page_an_event_looks_at_nothing) {
  form.frameMain.Visible = false;
  Receive({Outgoing(1025)});
  EXPECT_EQ(desktop.YieldCount, 1);
  EXPECT_EQ(machine.capture.ReadBufferCalls, 0);
  EXPECT_EQ(machine.capture.CaptureCalls, 0);
}

TEST_F(DrainLoop, A_page_that_hides_during_the_first_yield_ends_the_event) {
  desktop.OnYield = [this] { form.frameMain.Visible = false; };
  Receive({Outgoing(1025)});
  EXPECT_EQ(machine.capture.ReadBufferCalls, 0);
}

TEST_F(DrainLoop, An_event_peeks_before_it_drains) {
  machine.capture.RecordFrameCalls = true;
  machine.Calls.clear();
  Receive({Outgoing(1025)});
  EXPECT_EQ(machine.Calls, (Calls{"ReadBuffer", "vpCapture", "vpCapture"}));
}

TEST_F(DrainLoop, An_event_whose_newest_record_is_neither_tcp_nor_a_tunnel_drains_nothing) {
  LetSecondPass();
  Receive({Outgoing(1025), Udp()});
  EXPECT_EQ(machine.capture.WaitingFrames(), 2);
  EXPECT_EQ(Charged(), 0);
  EXPECT_EQ(Passes(), 0);
}

TEST_F(DrainLoop, An_event_without_any_record_drains_nothing) {
  EXPECT_TRUE(machine.SignalPackets());
  EXPECT_EQ(machine.capture.ReadBufferCalls, 1);
  EXPECT_EQ(machine.capture.CaptureCalls, 0);
}

TEST_F(DrainLoop, The_peek_finds_the_packet_behind_a_record_header_of_any_length) {
  for (const std::uint16_t length : {18, 20, 24, 32}) {
    machine.capture.RecordHeaderLength = length;
    Receive({Outgoing(1025)});
  }
  EXPECT_EQ(Charged(), 4);
}

TEST_F(DrainLoop, A_record_header_that_points_beyond_the_buffer_ends_the_event) {
  machine.capture.RecordHeaderLength = 14999;
  Receive({Outgoing(1025)});
  EXPECT_EQ(machine.capture.CaptureCalls, 0);
  EXPECT_EQ(attribution.MalformedFrames(), 1u);
}

TEST_F(DrainLoop, The_newest_record_of_a_short_frame_reads_as_zeros_behind_its_end) {
  Receive({Outgoing(1025)});
  const int before = machine.capture.CaptureCalls;
  Receive({Bytes(20)});
  EXPECT_EQ(machine.capture.CaptureCalls, before);
}

TEST_F(DrainLoop, A_tunnel_as_newest_record_drains) {
  TestFrame tunnelled;
  tunnelled.size = 100;
  Receive({Outgoing(1025), tunnelled.BuildTunnelled()});
  EXPECT_EQ(machine.capture.WaitingFrames(), 0);
}

TEST_F(DrainLoop, A_udp_frame_ends_the_drain_and_the_frames_behind_it_wait_for_the_next_event) {
  Receive({Outgoing(1025), Udp(), Outgoing(1025)});
  EXPECT_EQ(Charged(), 1);
  EXPECT_EQ(machine.capture.WaitingFrames(), 1);
  machine.SignalPackets();
  EXPECT_EQ(Charged(), 2);
}

TEST_F(DrainLoop, An_icmp_frame_ends_the_drain) {
  Receive({Outgoing(1025), Icmp(), Outgoing(1025)});
  EXPECT_EQ(Charged(), 1);
  EXPECT_EQ(machine.capture.WaitingFrames(), 1);
}

TEST_F(DrainLoop, Any_other_protocol_is_passed_over_and_the_drain_goes_on) {
  TestFrame other;
  other.protocol = 50;
  Receive({other.Build(), Outgoing(1025)});
  EXPECT_EQ(Charged(), 1);
}

TEST_F(DrainLoop, A_frame_of_another_type_ends_the_drain) {
  TestFrame other;
  other.type = 0x86DD;
  Receive({other.Build(), Outgoing(1025)});
  EXPECT_EQ(Charged(), 0);
  EXPECT_EQ(machine.capture.WaitingFrames(), 1);
}

TEST_F(DrainLoop, An_arp_frame_goes_on_to_the_ip_decoder_whose_protocol_decides) {
  TestFrame arp;
  arp.type = 0x0806;
  arp.protocol = 0;
  Receive({arp.Build(), Outgoing(1025)});
  EXPECT_EQ(Charged(), 1);
  arp.protocol = 17;
  Receive({arp.Build(), Outgoing(1025)});
  EXPECT_EQ(Charged(), 1);
  EXPECT_EQ(machine.capture.WaitingFrames(), 1);
}

TEST_F(DrainLoop, An_arp_frame_whose_meaningless_fields_say_tcp_is_charged) {
  TestFrame arp;
  arp.type = 0x0806;
  Receive({arp.Build(), Outgoing(999)});
  EXPECT_EQ(Charged(), 1);
}

TEST_F(DrainLoop, The_last_frame_of_a_drain_is_not_counted_twice) {
  Receive({Outgoing(1025)});
  machine.SignalPackets();
  EXPECT_EQ(Charged(), 1);
}

TEST_F(DrainLoop, A_failed_capture_ends_the_drain_like_an_empty_queue) {
  LetSecondPass();
  machine.Deliver(Outgoing(1025));
  machine.capture.FailCapture();
  machine.Deliver(Outgoing(1025));
  machine.SignalPackets();
  EXPECT_EQ(machine.capture.WaitingFrames(), 1);
  EXPECT_EQ(attribution.MalformedFrames(), 0u);
  EXPECT_EQ(Passes(), 1);
}

TEST_F(DrainLoop, A_failed_capture_does_not_count_the_frame_before_it_again) {
  machine.Deliver(Outgoing(1025));
  machine.capture.FailCapture(-7);
  machine.SignalPackets();
  EXPECT_EQ(Charged(), 1);
}

/// Fails after its one frame and leaves the array as it was.
struct LeavingLibrary : platform::simulated::SimulatedCapture {
  using SimulatedCapture::SimulatedCapture;
  std::int32_t vpCapture(platform::FrameBytes& frame, platform::CaptureHeader&) override {
    if (++Calls > 1) return -1;
    frame = FrameOf(bytes);
    return frame.UpperBound() + 1;
  }
  int Calls = 0;
  const Bytes bytes = Outgoing(1025);
};

TEST_F(DrainLoop, A_failed_capture_that_leaves_the_array_alone_does_not_count_its_frame_again) {
  platform::simulated::Core core;
  LeavingLibrary library(core);
  PacketAttribution other(library, desktop, control, addresses, table);
  machine.Deliver(Outgoing(1025));
  other.vpacket_PacketReceived();
  EXPECT_EQ(library.Calls, 2);
  EXPECT_EQ(Charged(), 1);
}

TEST_F(DrainLoop, A_first_frame_too_short_for_the_link_decoder_ends_the_drain) {
  Receive({Bytes(22, 0xFF), Outgoing(1025)});
  EXPECT_EQ(machine.capture.WaitingFrames(), 1);
  EXPECT_EQ(attribution.MalformedFrames(), 0u);
}

TEST_F(DrainLoop, A_frame_that_ends_too_soon_ends_the_event_and_is_counted_as_malformed) {
  TestFrame cut;
  Bytes bytes = cut.Build();
  bytes.resize(53);
  LetSecondPass();
  Receive({bytes, Outgoing(1025)});
  EXPECT_EQ(attribution.MalformedFrames(), 1u);
  EXPECT_EQ(Charged(), 0);
  EXPECT_EQ(machine.capture.WaitingFrames(), 1);
  EXPECT_EQ(Passes(), 0);
}

TEST_F(DrainLoop, The_event_after_a_malformed_frame_reads_the_frames_behind_it) {
  Bytes bytes = Outgoing(1025);
  bytes.resize(30);
  Receive({bytes, Outgoing(1025)});
  machine.SignalPackets();
  EXPECT_EQ(Charged(), 1);
}

TEST_F(DrainLoop, A_minimum_frame_that_claims_to_be_a_tunnel_is_malformed) {
  TestFrame tunnel;
  tunnel.protocol = 47;
  Receive({tunnel.Build(), Outgoing(1025)});
  EXPECT_EQ(attribution.MalformedFrames(), 1u);
}

TEST_F(DrainLoop, A_bounds_fault_of_anything_but_a_decoder_is_not_taken_for_a_bad_frame) {
  form.main_ListView1.Clear();
  form.main_ListView1.Add(u"p1", u"", 1);
  machine.Deliver(Outgoing(1025));
  EXPECT_THROW(machine.SignalPackets(), Fault);
  EXPECT_EQ(attribution.MalformedFrames(), 0u);
}

TEST_F(DrainLoop, Below_1000_ms_since_the_last_refresh_no_pass_runs) {
  machine.AdvanceTick(999);
  Receive({Outgoing(1025)});
  EXPECT_EQ(Passes(), 0);
}

TEST_F(DrainLoop, From_1000_ms_on_a_pass_runs_and_the_tick_behind_it_is_kept) {
  machine.AdvanceTick(1000);
  Receive({Outgoing(1025), Outgoing(1025), Outgoing(1025)});
  EXPECT_EQ(Passes(), 1);
  EXPECT_EQ(table.LastRefreshTick, static_cast<std::int32_t>(machine.system.GetTickCount()));
}

TEST_F(DrainLoop, The_kept_tick_is_read_after_the_pass) {
  version.OsVersionCode = 2002;
  machine.AddConnection({5, kOwnAddress, 1025, kServer, 80, 4});
  machine.AdvanceTick(1000);
  desktop.OnYield = [this] {
    if (Passes() > 0) machine.AdvanceTick(7);
  };
  const auto before = machine.system.GetTickCount();
  Receive({Outgoing(1025)});
  const std::uint32_t behindThePass =
      machine.system.GetTickCount() - 7; // one more yield, for the empty round
  EXPECT_EQ(Passes(), 1);
  EXPECT_GT(behindThePass, before);
  EXPECT_EQ(static_cast<std::uint32_t>(table.LastRefreshTick), behindThePass);
}

TEST_F(DrainLoop, A_day_number_as_last_tick_makes_the_first_event_refresh) {
  table.LastRefreshTick = machine.system.DayNumber();
  Receive({Outgoing(1025)});
  EXPECT_EQ(Passes(), 1);
}

TEST_F(DrainLoop, The_second_is_measured_across_the_wrap_of_the_tick) {
  table.LastRefreshTick = -500;
  machine.SetTick(499);
  Receive({Outgoing(1025)});
  EXPECT_EQ(Passes(), 0);
  machine.SetTick(500);
  Receive({Outgoing(1025)});
  EXPECT_EQ(Passes(), 1);
}

TEST_F(DrainLoop, A_day_number_as_last_tick_makes_the_first_event_refresh_at_any_uptime) {
  int passes = 0;
  for (const std::uint32_t tick : {1000u, 0x7FFFFFFFu, 0x80000000u, 0x80000000u + 46000, 0xFFFFFFFFu}) {
    table.LastRefreshTick = 46000;
    machine.SetTick(tick);
    Receive({Outgoing(1025)});
    EXPECT_EQ(Passes(), ++passes) << tick;
  }
}

TEST_F(DrainLoop, From_the_25th_day_of_uptime_on_a_pass_runs_each_second_too) {
  constexpr std::uint32_t k25Days = 25u * 24 * 60 * 60 * 1000;
  machine.SetTick(k25Days);
  table.LastRefreshTick = static_cast<std::int32_t>(k25Days);
  for (int second = 1; second <= 3; ++second) {
    machine.AdvanceTick(999);
    Receive({Outgoing(1025)});
    EXPECT_EQ(Passes(), second - 1);
    machine.AdvanceTick(1);
    Receive({Outgoing(1025)});
    EXPECT_EQ(Passes(), second);
  }
}

TEST_F(DrainLoop, The_round_that_ends_a_drain_refreshes_too) {
  LetSecondPass();
  TestFrame other;
  other.type = 0x86DD;
  Receive({other.Build(), Outgoing(1025)});
  EXPECT_EQ(Passes(), 1);
}

TEST_F(DrainLoop, A_page_that_hides_during_a_drain_gets_no_pass) {
  LetSecondPass();
  desktop.OnYield = [this, yields = 0]() mutable {
    if (++yields == 2) form.frameMain.Visible = false;
  };
  Receive({Outgoing(1025)});
  EXPECT_EQ(Passes(), 0);
}

TEST_F(DrainLoop, Without_tcp_or_tunnels_no_pass_runs_whatever_the_time) {
  machine.AdvanceTick(3600000);
  for (int i = 0; i < 3; ++i) Receive({Udp()});
  EXPECT_EQ(Passes(), 0);
}

} // namespace
} // namespace quendra::capture
