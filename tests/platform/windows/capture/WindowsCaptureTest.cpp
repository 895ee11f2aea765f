#include "platform/windows/capture/WindowsCapture.h"

#include "forms/headless/HeadlessDesktop.h"
#include "integration/Packets.h"
#include "platform/windows/capture/StandInWpcapFixture.h"
#include "platform/windows/capture/WindowsCaptureAdapters.h"

#include <gtest/gtest.h>

namespace quendra::platform::windows {

namespace {

constexpr const char* kLoopbackDevice = "\\Device\\NPF_Loopback";
constexpr const char* kForeignDevice = "\\Device\\NPF_{00000000-0000-0000-0000-000000000000}";

class WindowsCaptureTest : public testing::Test {
 protected:
  void Add(const char* name, const char* description = "") {
    wpcap.script.devices.push_back({.name = name, .description = description});
  }
  standins::WpcapScript::Device& Device(std::size_t index) { return wpcap.script.devices.at(index); }

  StandInWpcap wpcap;
  forms::headless::HeadlessDesktop desktop;
  const IpHelperLibrary ipHelper;
  WindowsCaptureAdapters adapters{desktop, StandInWpcap::Library(), ipHelper};
};

TEST_F(WindowsCaptureTest, Only_devices_that_are_links_of_this_machine_are_listed) {
  Add(kForeignDevice, "Another");
  Add(kLoopbackDevice);
  const auto list = adapters.List();
  ASSERT_EQ(list.size(), 1u);
  EXPECT_EQ(list[0].name, kLoopbackDevice);
  EXPECT_EQ(list[0].description, "Loopback");
  EXPECT_TRUE(list[0].isLoopback);
  EXPECT_NE(list[0].number, 0u);
  EXPECT_EQ(adapters.NumberIfUp(kLoopbackDevice), list[0].number);
  EXPECT_EQ(adapters.AddressOf(kLoopbackDevice), Ipv4Address::FromHost(0x7F000001));
}

TEST_F(WindowsCaptureTest, When_none_is_up_the_first_device_stands_there_alone_and_is_down) {
  Add(kForeignDevice, "Another");
  const auto list = adapters.List();
  ASSERT_EQ(list.size(), 1u);
  EXPECT_EQ(list[0].description, "Another");
  EXPECT_EQ(adapters.NumberIfUp(kForeignDevice), 0u);
  EXPECT_TRUE(adapters.AddressOf(kForeignDevice).IsAny());
  EXPECT_FALSE(adapters.MayCapture());
}

TEST_F(WindowsCaptureTest, A_library_that_can_list_nothing_has_no_adapters) {
  wpcap.script.canList = false;
  Add(kLoopbackDevice);
  EXPECT_TRUE(adapters.List().empty());
}

TEST_F(WindowsCaptureTest, Capturing_is_allowed_where_an_adapter_can_be_opened_which_is_closed_again) {
  Add(kLoopbackDevice);
  Device(0).canBeOpened = false;
  EXPECT_FALSE(adapters.MayCapture());
  Device(0).canBeOpened = true;
  EXPECT_TRUE(adapters.MayCapture());
  EXPECT_EQ(Device(0).open, 0);
}

TEST_F(WindowsCaptureTest, Frames_ring_the_control_at_the_loops_pace_and_are_taken_one_by_one) {
  Add(kLoopbackDevice);
  WindowsCapture capture(desktop, ipHelper, StandInWpcap::Library());
  ASSERT_GE(capture.VBPcapInit(), 0);
  EXPECT_EQ(capture.availability(), CaptureLibrary::Availability::Available);
  capture.vpSetCurrentAdapter(0);
  capture.vpBegin(0);
  const auto control = capture.Create();
  std::int32_t result = 0;
  control->BindAdapter(kLoopbackDevice, result);
  control->OpenChannel(result);
  control->StartEvents(result);
  int events = 0;
  int frames = 0;
  control->PacketReceived = [&] {
    ++events;
    FrameBytes frame;
    CaptureHeader header{};
    while (capture.vpCapture(frame, header) > 0) ++frames;
  };
  desktop.Advance(1000);
  EXPECT_EQ(events, 0);

  for (int i = 0; i < 200; ++i) Device(0).waiting.push_back(integration::TcpFrame(1025, 80));
  desktop.Advance(100);

  EXPECT_EQ(events, 1);
  EXPECT_EQ(frames, 200);
  EXPECT_EQ(capture.Counters().received, 200u);
}

TEST_F(WindowsCaptureTest, Without_the_library_nothing_is_available) {
  WindowsCapture capture(desktop, ipHelper, WpcapLibrary(std::vector<Text>{}));
  EXPECT_EQ(capture.VBPcapInit(), -1);
  EXPECT_EQ(capture.availability(), CaptureLibrary::Availability::NoLibrary);
}

} // namespace

} // namespace quendra::platform::windows
