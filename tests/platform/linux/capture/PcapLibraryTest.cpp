#include "platform/linux/capture/PcapLibrary.h"

#include "forms/headless/posix/PolledDesktop.h"
#include "platform/linux/capture/LinuxCapture.h"

#include <gtest/gtest.h>

namespace quendra::platform::linux_ {
namespace {

constexpr const char* kNoSuchLibrary[] = {"libno-such-capture.so.1", "libno-such-capture.so.2"};
/// A library, but another one.
constexpr const char* kOtherLibrary[] = {"libc.so.6"};

/// The capture library and a control of it, on a machine that has only the libraries of these names.
struct CaptureOver {
  explicit CaptureOver(std::span<const char* const> names) : capture(desktop, desktop, PcapLibrary(names)) {}

  forms::headless::PolledDesktop desktop;
  LinuxCapture capture;
};

TEST(PcapLibrary, Is_found_under_the_name_that_this_system_gives_it) { EXPECT_TRUE(PcapLibrary().IsThere()); }

TEST(PcapLibrary, Is_found_behind_a_name_that_the_system_lacks) {
  const char* const names[] = {kNoSuchLibrary[0], PcapLibrary::kNames[0], PcapLibrary::kNames[1]};
  EXPECT_TRUE(PcapLibrary(names).IsThere());
}

TEST(PcapLibrary, Is_not_there_under_a_wrong_name) { EXPECT_FALSE(PcapLibrary(kNoSuchLibrary).IsThere()); }

TEST(PcapLibrary, Is_not_a_library_without_its_functions) {
  EXPECT_FALSE(PcapLibrary(kOtherLibrary).IsThere());
}

TEST(PcapLibrary, Without_it_capture_is_not_available_and_says_why) {
  CaptureOver machine(kNoSuchLibrary);
  EXPECT_EQ(machine.capture.VBPcapInit(), -1);
  EXPECT_EQ(machine.capture.availability(), CaptureLibrary::Availability::NoLibrary);
}

TEST(PcapLibrary, Without_it_every_call_is_answered) {
  CaptureOver machine(kNoSuchLibrary);
  machine.capture.VBPcapInit();
  machine.capture.VBPcapTerminate();
  AdapterInfo info;
  machine.capture.vpGetAdapterInfo(0, info);
  EXPECT_EQ(info.AdapterName[0], '\0');

  machine.capture.vpSetCurrentAdapter(0);
  machine.capture.vpBegin(1000);
  const auto control = machine.capture.Create();
  std::int32_t result = 0;
  control->BindAdapter("lo", result);
  EXPECT_EQ(result, -1);
  control->OpenChannel(result);
  control->StartEvents(result);
  machine.desktop.PumpOnce();
  FrameBytes frame;
  CaptureHeader header{};
  EXPECT_LT(machine.capture.vpCapture(frame, header), 0);
  machine.capture.vpEnd();
  EXPECT_EQ(machine.capture.availability(), CaptureLibrary::Availability::NoLibrary);
}

} // namespace
} // namespace quendra::platform::linux_
