#include "capture/CaptureProgram.h"

namespace quendra::capture {
namespace {

/// "eth0" carries the host's address and is followed; "wlan0" is there beside it.
struct LostAdapter : CaptureProgram {
  LostAdapter() {
    machine.AddCaptureAdapter({"wlan0", "Card B", ""});
    StartCapture();
    AddRow(1, u".1025.");
  }
  /// The adapter goes at this time of the day.
  void LoseAt(std::int32_t hour, std::int32_t minute) {
    machine.system.Second = (hour * 60 + minute) * 60;
    machine.capture.RemoveAdapter("eth0");
  }
  void LeavePageAndReturn() {
    session.StopCapture();
    addresses.Read();
    session.StartCapture();
  }
  double Charged() { return Upload(form.main_ListView1.Row(1)); }
  const Text& StateLine() const { return adapters.main_lblCaptureState.Caption(); }
};

constexpr char16_t kGoneAt1432[] = u"התעבורה אינה נמדדת: ההתקן נותק בשעה 14:32";
constexpr char16_t kNotConnected[] = u"התעבורה אינה נמדדת: ההתקן אינו מחובר";

TEST_F(LostAdapter, The_page_says_that_the_device_is_gone_and_since_when) {
  EXPECT_EQ(StateLine(), u"");
  LoseAt(14, 32);
  EXPECT_EQ(StateLine(), kGoneAt1432);
}

TEST_F(LostAdapter, The_time_stays_that_of_the_loss) {
  LoseAt(14, 32);
  machine.system.Second = 20 * 3600;
  Receive({Outgoing(1025)});
  EXPECT_EQ(StateLine(), kGoneAt1432);
}

TEST_F(LostAdapter, The_line_goes_when_the_device_is_there_again_and_its_traffic_is_charged) {
  LoseAt(14, 32);
  machine.capture.ReturnAdapter("eth0");
  EXPECT_EQ(StateLine(), u"");
  Receive({Outgoing(1025)});
  EXPECT_EQ(Charged(), 1);
}

TEST_F(LostAdapter, Totals_stay) {
  Receive({Outgoing(1025), Outgoing(1025)});
  LoseAt(14, 32);
  EXPECT_EQ(Charged(), 2);
  machine.capture.ReturnAdapter("eth0");
  Receive({Outgoing(1025)});
  EXPECT_EQ(Charged(), 3);
}

TEST_F(LostAdapter, Neither_loss_nor_return_makes_a_call_of_the_capture_library) {
  machine.Calls.clear();
  LoseAt(14, 32);
  machine.capture.ReturnAdapter("eth0");
  EXPECT_EQ(machine.Calls, Calls{});
}

TEST_F(LostAdapter, A_second_loss_has_its_own_time) {
  LoseAt(9, 5);
  machine.capture.ReturnAdapter("eth0");
  LoseAt(14, 32);
  EXPECT_EQ(StateLine(), kGoneAt1432);
}

TEST_F(LostAdapter, Another_device_that_goes_is_of_no_interest) {
  machine.capture.RemoveAdapter("wlan0");
  EXPECT_EQ(StateLine(), u"");
}

TEST_F(LostAdapter, The_line_goes_when_another_device_is_chosen) {
  LoseAt(14, 32);
  adapters.main_cmbAdapters.SelectItem(1);
  EXPECT_EQ(StateLine(), u"");
  machine.capture.ReturnAdapter("eth0");
  EXPECT_EQ(StateLine(), u"");
  EXPECT_EQ(machine.capture.SelectedAdapter, 1);
}

TEST_F(LostAdapter, A_device_that_is_chosen_while_it_is_gone_is_not_connected_since_nobody_knows_when) {
  adapters.main_cmbAdapters.SelectItem(1);
  machine.capture.RemoveAdapter("eth0");
  adapters.main_cmbAdapters.SelectItem(0);
  EXPECT_EQ(StateLine(), kNotConnected);
  machine.capture.ReturnAdapter("eth0");
  EXPECT_EQ(StateLine(), u"");
}

TEST_F(LostAdapter, The_page_can_be_left_and_opened_while_the_device_is_gone) {
  LoseAt(14, 32);
  LeavePageAndReturn();
  EXPECT_EQ(StateLine(), kNotConnected);
  machine.capture.ReturnAdapter("eth0");
  EXPECT_EQ(StateLine(), u"");
}

TEST_F(LostAdapter, What_happens_while_the_page_is_left_shows_when_it_opens) {
  LoseAt(14, 32);
  session.StopCapture();
  machine.capture.ReturnAdapter("eth0");
  session.StartCapture();
  EXPECT_EQ(StateLine(), u"");
}

TEST_F(LostAdapter, A_device_that_comes_back_with_another_address_has_its_packets_known_by_that) {
  LoseAt(14, 32);
  machine.hostNames.Addresses = {"192.168.7.1", "10.0.0.99"};
  machine.capture.ReturnAdapter("eth0");
  EXPECT_EQ(addresses.LocalAddressLast, u"10.0.0.99");
  TestFrame frame;
  frame.source = "10.0.0.99";
  frame.sourcePort = 1025;
  Receive({frame.Build()});
  EXPECT_EQ(Charged(), 1);
}

TEST_F(LostAdapter, The_addresses_stay_those_of_the_opening_while_the_device_is_gone) {
  machine.hostNames.Addresses = {"127.0.0.1"};
  LoseAt(14, 32);
  EXPECT_EQ(addresses.LocalAddressLast, u"10.0.0.138");
}

TEST_F(LostAdapter, A_loss_inside_an_event_ends_the_drain_and_counts_what_had_come) {
  desktop.OnYield = [this] { LoseAt(14, 32); };
  Receive({Outgoing(1025), Outgoing(1025)});
  EXPECT_EQ(Charged(), 2);
  EXPECT_EQ(StateLine(), kGoneAt1432);
}

} // namespace
} // namespace quendra::capture
