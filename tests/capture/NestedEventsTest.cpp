#include "capture/CaptureProgram.h"

namespace quendra::capture {
namespace {

/// What a test lets run inside the n-th yield from now on.
struct NestedEvents : CaptureProgram {
  NestedEvents() {
    machine.AddCaptureAdapter({"eth1", "Card B", "192.0.2.1"});
    StartCapture();
    AddRow(1, u".1025.");
  }
  void AtYield(int yield, std::function<void()> work) {
    desktop.OnYield = [yield, work = std::move(work), yields = 0]() mutable {
      if (++yields == yield) work();
    };
  }
  double Charged() { return Upload(form.main_ListView1.Row(1)); }
};

TEST_F(NestedEvents, A_second_event_inside_the_first_drains_the_frames_and_none_is_counted_twice) {
  AtYield(3, [this] { machine.SignalPackets(); });
  Receive({Outgoing(1025), Outgoing(1025), Outgoing(1025)});
  EXPECT_EQ(Charged(), 3);
  EXPECT_EQ(machine.capture.ReadBufferCalls, 2);
}

TEST_F(NestedEvents, A_second_event_inside_the_first_yield_leaves_the_first_one_an_empty_drain) {
  AtYield(1, [this] { machine.SignalPackets(); });
  Receive({Outgoing(1025), Outgoing(1025)});
  EXPECT_EQ(Charged(), 2);
  EXPECT_EQ(machine.capture.CaptureCalls, 4);
}

TEST_F(NestedEvents, A_yield_of_a_pass_lets_an_event_in_which_finds_the_second_over_and_runs_a_nested_pass) {
  version.OsVersionCode = 2002;
  machine.AddProcess({1, 0, "client", ""});
  machine.AddConnection({5, kOwnAddress, 2000, kServer, 80, 1});
  LetSecondPass();
  bool nested = false;
  desktop.OnYield = [&] {
    if (Passes() != 1 || nested) return;
    nested = true;
    machine.Deliver(Outgoing(1025));
    machine.SignalPackets();
  };
  Receive({Outgoing(1025)});
  EXPECT_TRUE(nested);
  EXPECT_EQ(Passes(), 2);
  EXPECT_EQ(Charged(), 2);
  EXPECT_EQ(form.main_ListView1.Row(1).CellText(monitor::kPortsCell), u".1025.2000.");
}

TEST_F(NestedEvents, A_port_that_a_pass_has_just_merged_is_charged_by_the_event_inside_the_pass) {
  version.OsVersionCode = 2002;
  machine.AddProcess({1, 0, "client", ""});
  machine.AddConnection({5, kOwnAddress, 2000, kServer, 80, 1});
  LetSecondPass();
  bool nested = false;
  desktop.OnYield = [&] {
    if (nested || form.main_ListView1.Row(1).CellText(monitor::kPortsCell) == u".1025.") return;
    nested = true;
    machine.Deliver(Outgoing(2000, 512));
    machine.SignalPackets();
  };
  Receive({Outgoing(1025)});
  EXPECT_EQ(Charged(), 1.5);
}

TEST_F(NestedEvents, A_table_that_is_cleared_in_a_yield_leaves_the_packet_without_an_owner) {
  AtYield(3, [this] { form.main_ListView1.Clear(); });
  Receive({Outgoing(1025), Outgoing(1025)});
  EXPECT_EQ(form.main_ListView1.Count(), 0);
  EXPECT_EQ(machine.capture.WaitingFrames(), 0);
}

TEST_F(NestedEvents, A_row_that_is_replaced_in_a_yield_is_charged_in_its_place) {
  AtYield(3, [this] {
    form.main_ListView1.Clear();
    AddRow(2, u".1025.");
  });
  Receive({Outgoing(1025), Outgoing(1025)});
  EXPECT_EQ(form.main_ListView1.Row(1).Key(), u"p2");
  EXPECT_EQ(Charged(), 1);
}

TEST_F(NestedEvents, A_page_that_stops_in_a_yield_stops_the_session_and_gets_no_pass) {
  LetSecondPass();
  AtYield(2, [this] {
    session.StopCapture();
    form.frameMain.Visible = false;
  });
  Receive({Outgoing(1025)});
  EXPECT_EQ(Passes(), 0);
  EXPECT_FALSE(machine.SignalPackets());
}

TEST_F(NestedEvents, An_adapter_change_in_the_first_yield_lets_the_event_peek_through_the_new_control) {
  AtYield(1, [this] { adapters.main_cmbAdapters.SelectItem(1); });
  Receive({Outgoing(1025)});
  EXPECT_EQ(machine.capture.ControlsMade, 2);
  EXPECT_EQ(machine.capture.ReadBufferCalls, 1);
  EXPECT_EQ(Charged(), 1);
}

TEST_F(NestedEvents, An_adapter_change_in_the_drain_goes_on_with_the_librarys_own_session) {
  AtYield(3, [this] { adapters.main_cmbAdapters.SelectItem(1); });
  Receive({Outgoing(1025), Outgoing(1025)});
  EXPECT_EQ(Charged(), 2);
  EXPECT_TRUE(session.CaptureRunning);
}

TEST_F(NestedEvents, A_control_that_is_replaced_during_its_event_lives_until_no_event_is_under_way) {
  AtYield(3, [this] { adapters.main_cmbAdapters.SelectItem(1); });
  Receive({Outgoing(1025)});
  EXPECT_EQ(machine.capture.LiveControls(), 2);
  Receive({Outgoing(1025)});
  EXPECT_EQ(machine.capture.LiveControls(), 1);
}

TEST_F(NestedEvents, The_event_of_a_control_that_was_replaced_no_longer_arrives) {
  const auto oldEvent = control.vpacket->PacketReceived;
  adapters.main_cmbAdapters.SelectItem(1);
  machine.Deliver(Outgoing(1025));
  oldEvent();
  EXPECT_EQ(desktop.YieldCount, 0);
  EXPECT_EQ(Charged(), 0);
}

TEST_F(NestedEvents, Without_a_control_behind_the_first_yield_the_event_faults_with_91) {
  AtYield(1, [this] { control.vpacket.reset(); });
  machine.Deliver(Outgoing(1025));
  try {
    attribution.vpacket_PacketReceived();
    FAIL() << "no fault";
  } catch (const Fault& fault) {
    EXPECT_EQ(fault.number, Fault::kObjectNotSet);
  }
}

TEST_F(NestedEvents, The_end_of_the_program_inside_an_event_unwinds_it) {
  AtYield(3, [this] { desktop.End(0); });
  machine.Deliver(Outgoing(1025));
  EXPECT_THROW(machine.SignalPackets(), forms::ProgramEnded);
}

TEST_F(NestedEvents, After_an_event_that_ended_by_a_fault_a_replaced_control_goes_at_once) {
  form.main_ListView1.Row(1).CellTag(monitor::kUploadCell) = u"much";
  machine.Deliver(Outgoing(1025));
  EXPECT_THROW(machine.SignalPackets(), Fault);
  adapters.main_cmbAdapters.SelectItem(1);
  EXPECT_EQ(machine.capture.LiveControls(), 1);
}

} // namespace
} // namespace quendra::capture
