#include "platform/simulated/SimulatedMachineFixture.h"

namespace quendra::platform::simulated {

namespace {

struct SimulatedCaptureTest : SimulatedMachineTest {
  static constexpr const char* kAdapter = "\\Device\\NPF_{1}";
  SimulatedCaptureTest() { machine.AddCaptureAdapter({kAdapter, "Ethernet", "10.0.0.7"}); }
  std::int32_t result = 0;
  FrameBytes frame;
  CaptureHeader header{};
};

} // namespace

TEST_F(SimulatedCaptureTest, Frames_come_in_the_order_of_their_delivery_and_then_a_blank_one) {
  machine.Deliver(Bytes(60, 1));
  machine.Deliver(Bytes(70, 2), 1500);

  EXPECT_EQ(operations.captureLibrary.vpCapture(frame, header), 60);
  EXPECT_EQ(frame[0], 1);
  EXPECT_EQ(operations.captureLibrary.vpCapture(frame, header), 70);
  EXPECT_EQ(frame.UpperBound(), 69);
  EXPECT_EQ(header[3], 1500U);
  EXPECT_EQ(operations.captureLibrary.vpCapture(frame, header), 0);
  EXPECT_EQ(frame.UpperBound(), 59);
  EXPECT_EQ(frame[59], 0);
}

TEST_F(SimulatedCaptureTest, A_failure_comes_at_its_place_in_the_queue) {
  machine.Deliver(Bytes(60, 1));
  machine.capture.FailCapture(-7);
  machine.Deliver(Bytes(60, 2));

  EXPECT_EQ(operations.captureLibrary.vpCapture(frame, header), 60);
  EXPECT_EQ(operations.captureLibrary.vpCapture(frame, header), -7);
  EXPECT_EQ(frame[0], 0);
  EXPECT_EQ(operations.captureLibrary.vpCapture(frame, header), 60);
}

TEST_F(SimulatedCaptureTest, The_newest_record_has_a_header_in_host_order_before_its_frame) {
  machine.SetTick(12345);
  machine.Deliver(Bytes(60, 1));
  machine.Deliver(Bytes(70, 2), 1500);
  const auto control = operations.captureControls.Create();
  Bytes buffer(100, 0xEE);

  control->ReadBuffer(buffer);

  EXPECT_EQ(Little32(buffer, 0), 12U);
  EXPECT_EQ(Little32(buffer, 4), 345000U);
  EXPECT_EQ(Little32(buffer, 8), 70U);
  EXPECT_EQ(Little32(buffer, 12), 1500U);
  EXPECT_EQ(buffer[16], 20);
  EXPECT_EQ(buffer[20], 2);
  EXPECT_EQ(buffer[89], 2);
  EXPECT_EQ(buffer[90], 0xEE);
}

TEST_F(SimulatedCaptureTest, Events_come_only_between_their_start_and_stop) {
  const auto control = operations.captureControls.Create();
  int events = 0;
  control->PacketReceived = [&] { ++events; };

  EXPECT_FALSE(machine.SignalPackets());
  control->StartEvents(result);
  EXPECT_TRUE(machine.SignalPackets());
  control->StopEvents(result);
  EXPECT_FALSE(machine.SignalPackets());

  EXPECT_EQ(events, 1);
}

TEST_F(SimulatedCaptureTest, Events_go_on_while_each_takes_frames_and_leaves_some) {
  const auto control = operations.captureControls.Create();
  int events = 0;
  control->PacketReceived = [&] {
    ++events;
    if (events < 3) operations.captureLibrary.vpCapture(frame, header);
  };
  control->StartEvents(result);
  for (int i = 0; i < 5; ++i) machine.Deliver(Bytes(60, 1));

  machine.capture.SignalWhileFramesAreTaken();

  EXPECT_EQ(events, 3);
  EXPECT_EQ(machine.capture.WaitingFrames(), 3);
}

TEST_F(SimulatedCaptureTest, Calls_of_library_control_and_clock_stand_in_one_order) {
  auto control = operations.captureControls.Create();
  operations.captureLibrary.VBPcapInit();
  operations.captureLibrary.vpSetCurrentAdapter(0);
  operations.captureLibrary.vpBegin(1000);
  control->BindAdapter(std::string("\\Device\\NPF_{1}\0\0\0", 18), result);
  control->SetValueA(32);
  operations.system.Sleep(300);
  control.reset();
  operations.captureLibrary.vpEnd();

  EXPECT_EQ(machine.Calls,
            (Lines{"create control", "VBPcapInit", "vpSetCurrentAdapter 0", "vpBegin 1000",
                   "BindAdapter \\Device\\NPF_{1}", "SetValueA 32", "Sleep 300", "drop control", "vpEnd"}));
}

TEST_F(SimulatedCaptureTest, A_new_control_takes_the_place_of_the_one_before) {
  auto first = operations.captureControls.Create();
  auto second = operations.captureControls.Create();
  Lines rung;
  first->PacketReceived = [&] { rung.push_back("first"); };
  second->PacketReceived = [&] { rung.push_back("second"); };
  first->StartEvents(result);
  second->StartEvents(result);

  machine.SignalPackets();
  second.reset();
  machine.SignalPackets();

  EXPECT_EQ(rung, (Lines{"second", "first"}));
  EXPECT_EQ(machine.capture.LiveControls(), 1);
}

TEST_F(SimulatedCaptureTest, Making_a_control_faults_when_told_to) {
  machine.capture.CreateFault = Fault::kCannotCreateObject;

  EXPECT_THROW((void)operations.captureControls.Create(), Fault);

  EXPECT_EQ(machine.capture.LiveControls(), 0);
}

TEST_F(SimulatedCaptureTest, An_adapter_that_is_removed_in_its_session_is_told_of_and_delivers_nothing) {
  std::vector<CaptureLibrary::Availability> told;
  machine.capture.AdapterChanged = [&] { told.push_back(machine.capture.availability()); };
  operations.captureLibrary.vpSetCurrentAdapter(0);
  operations.captureLibrary.vpBegin(1000);
  machine.capture.RemoveAdapter(kAdapter);
  machine.capture.RemoveAdapter(kAdapter);
  machine.Deliver(Bytes(60));
  EXPECT_LT(operations.captureLibrary.vpCapture(frame, header), 0);
  machine.capture.ReturnAdapter(kAdapter);
  machine.Deliver(Bytes(60));
  EXPECT_EQ(operations.captureLibrary.vpCapture(frame, header), 60);
  EXPECT_EQ(told, (std::vector{CaptureLibrary::Availability::AdapterGone,
                               CaptureLibrary::Availability::Available}));
}

TEST_F(SimulatedCaptureTest, An_adapter_that_is_removed_outside_its_session_is_not_told_of) {
  int told = 0;
  machine.capture.AdapterChanged = [&] { ++told; };
  machine.capture.RemoveAdapter(kAdapter);
  EXPECT_EQ(machine.capture.availability(), CaptureLibrary::Availability::Available);
  operations.captureLibrary.vpSetCurrentAdapter(0);
  operations.captureLibrary.vpBegin(1000);
  EXPECT_EQ(machine.capture.availability(), CaptureLibrary::Availability::AdapterGone);
  machine.capture.RemoveAdapter("eth1");
  EXPECT_EQ(told, 0);
}

TEST_F(SimulatedCaptureTest, The_library_gives_the_last_adapters_index_or_what_it_is_told) {
  EXPECT_EQ(operations.captureLibrary.VBPcapInit(), 0);
  machine.capture.InitResult = -1;
  EXPECT_EQ(operations.captureLibrary.VBPcapInit(), -1);
}

TEST(SimulatedMachineLife, A_control_may_outlive_its_machine) {
  std::unique_ptr<CaptureControl> control;
  {
    SimulatedMachine machine;
    control = machine.Operations().captureControls.Create();
  }
  std::int32_t result = 0;
  auto address = Ipv4Address::FromHost(1);
  std::uint32_t second = 1;
  Bytes buffer(30);

  control->StartEvents(result);
  control->ReadBuffer(buffer);
  control->AdapterAddress("x", address, second);

  EXPECT_EQ(address, Ipv4Address());
}

} // namespace quendra::platform::simulated
