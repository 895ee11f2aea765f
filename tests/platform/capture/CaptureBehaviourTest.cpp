#include "platform/BehaviourFixture.h"

namespace quendra::platform {

TEST_P(BehaviourTest, The_capture_library_has_named_adapters_or_says_that_there_are_none) {
  const auto last = machine.captureLibrary.VBPcapInit();
  ASSERT_GE(last, -1);
  const bool available = machine.captureLibrary.availability() == CaptureLibrary::Availability::Available;
  EXPECT_TRUE(last >= 0 || !available);

  for (std::int32_t i = 0; i <= last; ++i) {
    AdapterInfo info;
    machine.captureLibrary.vpGetAdapterInfo(static_cast<std::int16_t>(i), info);
    EXPECT_NE(info.AdapterName[0], '\0') << i;
    EXPECT_NE(info.AdapterDescription[0], '\0') << i;
    EXPECT_EQ(info.AdapterName.back(), '\0') << i;
    EXPECT_EQ(info.AdapterDescription.back(), '\0') << i;
  }
}

TEST_P(BehaviourTest, An_adapter_that_the_library_lacks_leaves_the_record_as_it_was) {
  const auto last = machine.captureLibrary.VBPcapInit();
  AdapterInfo info;
  info.AdapterName[0] = 'x';
  info.AdapterDescription[0] = 'y';

  for (const int index : {-1, last + 1, 32767})
    machine.captureLibrary.vpGetAdapterInfo(static_cast<std::int16_t>(index), info);

  EXPECT_EQ(info.AdapterName[0], 'x');
  EXPECT_EQ(info.AdapterDescription[0], 'y');
}

TEST_P(BehaviourTest, Without_a_session_a_blank_frame_of_60_bytes_is_left) {
  FrameBytes frame;
  CaptureHeader header{};

  EXPECT_LE(machine.captureLibrary.vpCapture(frame, header), 0);

  ASSERT_EQ(frame.UpperBound(), 59);
  EXPECT_TRUE(std::all_of(frame.Data(), frame.Data() + 60, [](std::uint8_t byte) { return byte == 0; }));
}

TEST_P(BehaviourTest, A_control_without_an_adapter_answers_every_call) {
  const auto control = machine.captureControls.Create();
  int events = 0;
  control->PacketReceived = [&] { ++events; };
  std::int32_t result = -1;
  auto address = Ipv4Address::FromHost(1);
  std::uint32_t second = 1;
  std::array<std::uint8_t, 64> buffer{};

  control->AdapterAddress("no such adapter", address, second);
  control->BindAdapter("no such adapter", result);
  control->SetValueA(32);
  control->SetValueB(1000);
  control->OpenChannel(result);
  control->SetChannelSize(15000, result);
  control->SetValueC(15000);
  control->StartEvents(result);
  control->ReadBuffer(buffer);
  control->ReadBuffer({});
  control->StopEvents(result);
  control->ReleaseChannel(result);
  control->CloseChannel(result);

  EXPECT_EQ(address, Ipv4Address());
  EXPECT_EQ(events, 0);
  // A record header that states no bytes of a frame, and none after it.
  EXPECT_TRUE(
      std::all_of(buffer.begin() + 8, buffer.begin() + 16, [](std::uint8_t byte) { return byte == 0; }));
  ASSERT_LE(buffer[16], 32);
  EXPECT_TRUE(
      std::all_of(buffer.begin() + buffer[16], buffer.end(), [](std::uint8_t byte) { return byte == 0; }));
}

TEST_P(BehaviourTest, Ending_a_session_that_never_began_does_no_harm) {
  machine.captureLibrary.vpEnd();
  machine.captureLibrary.vpSetCurrentAdapter(-1);
  machine.captureLibrary.vpSetCurrentAdapter(32767);
  machine.captureLibrary.vpBegin(1000);
  machine.captureLibrary.vpSetParam(0, 65536);
  machine.captureLibrary.vpEnd();
  machine.captureLibrary.vpEnd();
  FrameBytes frame;
  CaptureHeader header{};

  EXPECT_LE(machine.captureLibrary.vpCapture(frame, header), 0);
}

} // namespace quendra::platform
