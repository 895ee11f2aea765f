#include "capture/CaptureProgram.h"

#include "capture/CaptureState.h"

namespace quendra::capture {
namespace {

using Availability = platform::CaptureLibrary::Availability;

/// The adapters are each test's own.
struct CaptureSessionTest : CaptureProgram {
  CaptureSessionTest() { machine.capture.Adapters.clear(); }

  void AddAdapter(const std::string& name, const std::string& address = "") {
    machine.AddCaptureAdapter({name, "Card " + name, address});
  }
  std::vector<Text> Listed() const {
    std::vector<Text> items;
    for (int i = 0; i < adapters.main_cmbAdapters.ListCount(); ++i)
      items.push_back(adapters.main_cmbAdapters.List(i));
    return items;
  }
  const Text& StateLine() const { return adapters.main_lblCaptureState.Caption(); }
};

using Items = std::vector<Text>;

TEST_F(CaptureSessionTest, A_start_makes_these_calls_in_this_order) {
  AddAdapter("eth0");
  AddAdapter("eth1", kOwnAddress);
  StartCapture();
  EXPECT_EQ(machine.Calls,
            (Calls{"VBPcapInit", "create control", "vpGetAdapterInfo 0", "AdapterAddress eth0",
                   "vpGetAdapterInfo 1", "AdapterAddress eth1", "vpSetCurrentAdapter 1", "vpBegin 1000",
                   "vpGetAdapterInfo 1", "BindAdapter eth1", "SetValueA 32", "SetValueB 1000", "OpenChannel",
                   "SetChannelSize 15000", "SetValueC 15000", "StartEvents"}));
}

TEST_F(CaptureSessionTest, A_stop_makes_these_calls_in_this_order) {
  AddAdapter("eth0");
  StartCapture();
  machine.Calls.clear();
  session.StopCapture();
  EXPECT_EQ(machine.Calls, (Calls{"vpEnd", "Sleep 300", "StopEvents", "ReleaseChannel", "CloseChannel"}));
}

TEST_F(CaptureSessionTest, An_adapter_change_makes_these_calls_in_this_order) {
  AddAdapter("eth0");
  AddAdapter("eth1");
  StartCapture();
  machine.Calls.clear();
  adapters.main_cmbAdapters.SelectItem(1);
  EXPECT_EQ(machine.Calls,
            (Calls{"StopEvents", "CloseChannel", "drop control", "create control", "vpSetCurrentAdapter 1",
                   "vpGetAdapterInfo 1", "BindAdapter eth1", "SetValueA 32", "SetValueB 1000", "OpenChannel",
                   "SetChannelSize 15000", "SetValueC 15000", "StartEvents"}));
}

TEST_F(CaptureSessionTest, Capture_runs_between_start_and_stop_and_the_start_shows_the_page) {
  AddAdapter("eth0");
  form.frameMain.Visible = false;
  StartCapture();
  EXPECT_TRUE(session.CaptureRunning);
  EXPECT_TRUE(form.frameMain.Visible());
  session.StopCapture();
  EXPECT_FALSE(session.CaptureRunning);
}

TEST_F(CaptureSessionTest, The_adapters_name_goes_to_the_control_in_all_its_255_characters) {
  struct Control : platform::CaptureControl {
    std::string& bound;
    explicit Control(std::string& name) : bound(name) {}
    void BindAdapter(const std::string& name, std::int32_t&) override { bound = name; }
    void OpenChannel(std::int32_t&) override {}
    void SetChannelSize(std::int32_t, std::int32_t&) override {}
    void ReleaseChannel(std::int32_t&) override {}
    void CloseChannel(std::int32_t&) override {}
    void AdapterAddress(const std::string&, platform::Ipv4Address&, std::uint32_t&) override {}
    void StartEvents(std::int32_t&) override {}
    void StopEvents(std::int32_t&) override {}
    void ReadBuffer(std::span<std::uint8_t>) override {}
    void SetValueA(std::int32_t) override {}
    void SetValueB(std::int32_t) override {}
    void SetValueC(std::int32_t) override {}
  };
  std::string bound;
  AddAdapter("eth0");
  session.InitLibrary();
  control.vpacket = std::make_unique<Control>(bound);
  session.StartCapture();
  EXPECT_EQ(bound.size(), 255u);
  EXPECT_EQ(CutAtNul(bound), "eth0");
}

TEST_F(CaptureSessionTest, Local_addresses_and_gateway_are_read_fresh_at_each_opening) {
  machine.ipHelper.Adapters.push_back({"name", "description", {}, {"10.0.0.1"}});
  addresses.Read();
  EXPECT_EQ(addresses.LocalAddressLast, u"10.0.0.138");
  EXPECT_EQ(addresses.LocalAddressPrevious, u"192.168.7.1");
  EXPECT_EQ(addresses.GatewayAddress, u"10.0.0.1");
  machine.hostNames.Addresses = {"192.0.2.7"};
  machine.ipHelper.Adapters.clear();
  addresses.Read();
  EXPECT_EQ(addresses.LocalAddressLast, u"192.0.2.7");
  EXPECT_EQ(addresses.LocalAddressPrevious, u"");
  EXPECT_EQ(addresses.GatewayAddress, u"");
}

TEST_F(CaptureSessionTest,
       With_an_init_result_of_minus_1_each_opening_terminates_the_library_and_nothing_starts) {
  StartCapture();
  session.StartCapture();
  EXPECT_EQ(session.CaptureInitResult, -1);
  EXPECT_EQ(machine.Calls, (Calls{"VBPcapInit", "create control", "VBPcapTerminate", "VBPcapTerminate"}));
  EXPECT_EQ(adapters.main_cmbAdapters.ListCount(), 0);
  EXPECT_FALSE(session.CaptureRunning);
  LetSecondPass();
  machine.Deliver(Outgoing(1025));
  EXPECT_FALSE(machine.SignalPackets());
  EXPECT_EQ(Passes(), 0);
}

TEST_F(CaptureSessionTest, With_an_init_result_of_0_exactly_one_adapter_is_visited) {
  AddAdapter("eth0");
  AddAdapter("eth1");
  machine.capture.InitResult = 0;
  StartCapture();
  EXPECT_EQ(Listed(), (Items{u"Card eth0"}));
  EXPECT_EQ(std::count(machine.Calls.begin(), machine.Calls.end(), "vpGetAdapterInfo 1"), 0);
}

TEST_F(CaptureSessionTest, The_first_adapter_that_carries_the_last_address_is_followed) {
  AddAdapter("eth0");
  AddAdapter("eth1", kOwnAddress);
  AddAdapter("eth2", kOwnAddress);
  StartCapture();
  EXPECT_EQ(session.CurrentAdapter, 1);
  EXPECT_EQ(adapters.main_cmbAdapters.ListIndex(), 1);
}

TEST_F(CaptureSessionTest, An_adapter_that_carries_the_address_before_the_last_is_followed) {
  AddAdapter("eth0");
  AddAdapter("eth1", "192.168.7.1");
  StartCapture();
  EXPECT_EQ(session.CurrentAdapter, 1);
}

TEST_F(CaptureSessionTest, An_adapter_that_carries_the_gateways_address_is_followed) {
  machine.ipHelper.Adapters.push_back({"name", "description", {}, {"10.0.0.1"}});
  AddAdapter("eth0");
  AddAdapter("eth1", "10.0.0.1");
  StartCapture();
  EXPECT_EQ(session.CurrentAdapter, 1);
}

TEST_F(CaptureSessionTest, When_no_adapter_carries_a_known_address_adapter_0_is_followed) {
  AddAdapter("eth0", "192.0.2.1");
  AddAdapter("eth1", "192.0.2.2");
  StartCapture();
  EXPECT_EQ(session.CurrentAdapter, 0);
  EXPECT_EQ(adapters.main_cmbAdapters.ListIndex(), 0);
}

TEST_F(CaptureSessionTest,
       An_adapter_without_an_address_is_never_the_default_also_when_local_addresses_are_empty) {
  machine.hostNames.Addresses = {kOwnAddress};
  AddAdapter("eth0");
  AddAdapter("eth1");
  AddAdapter("eth2", kOwnAddress);
  StartCapture();
  EXPECT_EQ(addresses.LocalAddressPrevious, u"");
  EXPECT_EQ(session.CurrentAdapter, 2);
}

TEST_F(CaptureSessionTest, An_adapter_without_an_address_is_not_the_default_for_an_unset_gateway) {
  machine.ipHelper.Adapters.push_back({"name", "description", {}, {"0.0.0.0"}});
  AddAdapter("eth0");
  AddAdapter("eth1");
  AddAdapter("eth2", kOwnAddress);
  StartCapture();
  EXPECT_EQ(addresses.GatewayAddress, u"0.0.0.0");
  EXPECT_EQ(session.CurrentAdapter, 2);
}

TEST_F(CaptureSessionTest, The_schedulers_words_do_not_stand_in_the_list) {
  machine.AddCaptureAdapter({"a", "Card (Microsoft's Packet Scheduler)", ""});
  machine.AddCaptureAdapter({"b", "(Microsoft's Packet Scheduler)Other(Microsoft's Packet Scheduler) 2", ""});
  machine.AddCaptureAdapter({"c", "Third (microsoft's packet scheduler)", ""});
  StartCapture();
  EXPECT_EQ(Listed(), (Items{u"Card ", u"Other 2", u"Third (microsoft's packet scheduler)"}));
}

TEST_F(CaptureSessionTest, An_adapter_that_is_listed_again_through_the_scheduler_stands_once) {
  machine.AddCaptureAdapter({"a", "Card ", ""});
  machine.AddCaptureAdapter({"b", "Card (Microsoft's Packet Scheduler)", ""});
  StartCapture();
  EXPECT_EQ(Listed(), (Items{u"Card "}));
}

TEST_F(CaptureSessionTest, A_description_is_compared_to_the_last_blank) {
  machine.AddCaptureAdapter({"a", "Card", ""});
  machine.AddCaptureAdapter({"b", "Card (Microsoft's Packet Scheduler)", ""});
  StartCapture();
  EXPECT_EQ(Listed(), (Items{u"Card", u"Card "}));
}

TEST_F(CaptureSessionTest, A_description_ends_at_its_first_zero_byte) {
  machine.AddCaptureAdapter({"a", std::string("Card\0rest", 9), ""});
  StartCapture();
  EXPECT_EQ(Listed(), (Items{u"Card"}));
}

/// Adapters "A", its twin, and "B": the list holds A and B.
struct TwinAdapters : CaptureSessionTest {
  TwinAdapters() {
    machine.AddCaptureAdapter({"a", "A ", ""});
    machine.AddCaptureAdapter({"twin", "A (Microsoft's Packet Scheduler)", ""});
    machine.AddCaptureAdapter({"b", "B", ""});
  }
};

TEST_F(TwinAdapters, The_item_behind_a_twin_follows_the_wrong_adapter) {
  StartCapture();
  machine.Calls.clear();
  adapters.main_cmbAdapters.SelectItem(1);
  EXPECT_EQ(adapters.main_cmbAdapters.SelectedText(), u"B");
  EXPECT_EQ(session.CurrentAdapter, 1);
  EXPECT_EQ(std::count(machine.Calls.begin(), machine.Calls.end(), "BindAdapter twin"), 1);
}

TEST_F(TwinAdapters, A_default_adapter_whose_index_the_list_lacks_is_followed_with_nothing_selected) {
  machine.capture.Adapters[2].address = kOwnAddress;
  StartCapture();
  EXPECT_EQ(session.CurrentAdapter, 2);
  EXPECT_EQ(adapters.main_cmbAdapters.ListIndex(), -1);
  EXPECT_EQ(machine.capture.SelectedAdapter, 2);
  EXPECT_TRUE(session.CaptureRunning);
}

TEST_F(CaptureSessionTest, Choosing_the_selected_item_again_does_nothing) {
  AddAdapter("eth0");
  AddAdapter("eth1");
  StartCapture();
  machine.Calls.clear();
  adapters.main_cmbAdapters.SelectItem(0);
  EXPECT_EQ(machine.Calls, Calls{});
}

TEST_F(CaptureSessionTest, After_an_adapter_change_capture_runs_on_the_chosen_adapter) {
  AddAdapter("eth0");
  AddAdapter("eth1");
  StartCapture();
  adapters.main_cmbAdapters.SelectItem(1);
  EXPECT_EQ(session.CurrentAdapter, 1);
  EXPECT_TRUE(session.CaptureRunning);
  EXPECT_EQ(machine.capture.LiveControls(), 1);
  AddRow(1, u".1025.");
  Receive({Outgoing(1025)});
  EXPECT_EQ(Upload(form.main_ListView1.Row(1)), 1);
}

TEST_F(CaptureSessionTest, An_adapter_change_whose_control_cannot_be_made_leaves_none) {
  AddAdapter("eth0");
  AddAdapter("eth1");
  StartCapture();
  machine.capture.CreateFault = Fault::kCannotCreateObject;
  EXPECT_THROW(adapters.main_cmbAdapters.SelectItem(1), Fault);
  EXPECT_EQ(control.vpacket, nullptr);
  EXPECT_EQ(session.CurrentAdapter, 0);
}

TEST_F(CaptureSessionTest, Coming_back_repeats_the_choice_and_loses_the_users) {
  AddAdapter("eth0");
  AddAdapter("eth1");
  StartCapture();
  adapters.main_cmbAdapters.SelectItem(1);
  session.StopCapture();
  addresses.Read();
  session.StartCapture();
  EXPECT_EQ(session.CurrentAdapter, 0);
  EXPECT_EQ(adapters.main_cmbAdapters.ListIndex(), 0);
  EXPECT_EQ(adapters.main_cmbAdapters.ListCount(), 2);
}

TEST_F(CaptureSessionTest, A_control_that_is_not_registered_raises_429) {
  machine.capture.CreateFault = Fault::kCannotCreateObject;
  try {
    control.Create();
    FAIL() << "no fault";
  } catch (const Fault& fault) {
    EXPECT_EQ(fault.number, Fault::kCannotCreateObject);
  }
}

TEST_F(CaptureSessionTest, Without_a_control_start_and_stop_raise_fault_91) {
  AddAdapter("eth0");
  session.InitLibrary();
  EXPECT_THROW(session.StartCapture(), Fault);
  machine.Calls.clear();
  EXPECT_THROW(session.StopCapture(), Fault);
  EXPECT_EQ(machine.Calls, (Calls{"vpEnd", "Sleep 300"}));
}

TEST_F(CaptureSessionTest, The_state_line_says_which_right_or_part_is_missing) {
  EXPECT_EQ(CaptureStateText(Availability::Available), u"");
  EXPECT_EQ(CaptureStateText(Availability::NoRights), u"התעבורה אינה נמדדת: אין הרשאה ללכוד מנות ברשת");
  EXPECT_EQ(CaptureStateText(Availability::NoAdapters), u"התעבורה אינה נמדדת: לא נמצא מתאם רשת");
  EXPECT_EQ(CaptureStateText(Availability::NoLibrary), u"התעבורה אינה נמדדת: ספריית לכידת המנות חסרה");
  EXPECT_EQ(CaptureStateText(Availability::AdapterGone), u"התעבורה אינה נמדדת: ההתקן אינו מחובר");
}

TEST_F(CaptureSessionTest, The_state_line_tells_hour_and_minute_with_two_digits_each) {
  const auto lineOf = [](std::int32_t second) { return CaptureStateText(Availability::AdapterGone, second); };
  EXPECT_EQ(lineOf(0), u"התעבורה אינה נמדדת: ההתקן נותק בשעה 00:00");
  EXPECT_EQ(lineOf(9 * 3600 + 5 * 60 + 59), u"התעבורה אינה נמדדת: ההתקן נותק בשעה 09:05");
  EXPECT_EQ(lineOf(86399), u"התעבורה אינה נמדדת: ההתקן נותק בשעה 23:59");
}

TEST_F(CaptureSessionTest, Without_adapters_the_page_says_so) {
  StartCapture();
  EXPECT_EQ(StateLine(), CaptureStateText(Availability::NoAdapters));
}

TEST_F(CaptureSessionTest, A_library_that_failed_without_a_reason_counts_as_missing) {
  AddAdapter("eth0");
  machine.capture.InitResult = -1;
  StartCapture();
  EXPECT_EQ(StateLine(), CaptureStateText(Availability::NoLibrary));
}

TEST_F(CaptureSessionTest, Without_rights_adapters_are_listed_and_the_page_says_what_is_missing) {
  AddAdapter("eth0");
  machine.capture.Available = Availability::NoRights;
  StartCapture();
  EXPECT_EQ(StateLine(), CaptureStateText(Availability::NoRights));
  EXPECT_EQ(Listed(), (Items{u"Card eth0"}));
}

TEST_F(CaptureSessionTest, The_state_line_goes_when_capture_runs) {
  AddAdapter("eth0");
  AddAdapter("eth1");
  machine.capture.Available = Availability::NoRights;
  StartCapture();
  machine.capture.Available = Availability::Available;
  adapters.main_cmbAdapters.SelectItem(1);
  EXPECT_EQ(StateLine(), u"");
}

TEST_F(CaptureSessionTest, An_adapter_that_stands_behind_several_indexes_is_listed_once) {
  AddAdapter("eth0", kOwnAddress);
  AddAdapter("eth1");
  for (int spare = 0; spare < 3; ++spare) AddAdapter("eth1");
  StartCapture();
  EXPECT_EQ(Listed(), (Items{u"Card eth0", u"Card eth1"}));
  EXPECT_EQ(session.CurrentAdapter, 0);
}

TEST_F(CaptureSessionTest, A_session_that_has_gone_is_told_of_no_adapter) {
  AddAdapter("eth0");
  {
    PacketControl other(machine.capture);
    CaptureSession brief(machine.capture, machine.system, adapters, other, addresses);
    brief.InitLibrary();
  }
  machine.capture.vpSetCurrentAdapter(0);
  machine.capture.vpBegin(1000);
  machine.capture.RemoveAdapter("eth0");
  EXPECT_EQ(StateLine(), u"");
}

TEST_F(CaptureSessionTest, The_control_goes_with_the_session) {
  AddAdapter("eth0");
  {
    PacketControl other(machine.capture);
    CaptureSession brief(machine.capture, machine.system, adapters, other, addresses);
    other.Create();
    EXPECT_EQ(machine.capture.LiveControls(), 1);
  }
  EXPECT_EQ(machine.capture.LiveControls(), 0);
}

} // namespace
} // namespace quendra::capture
