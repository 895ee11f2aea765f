#include "platform/linux/capture/LinuxCaptureFixture.h"

namespace quendra::platform::linux_ {

using integration::Bytes;
using integration::NetworkNamespace;
using integration::RunCommand;

void LinuxCaptureFixture::SetUp() {
  if (!NetworkNamespace::Possible()) GTEST_SKIP() << NetworkNamespace::kSkipReason;
  network = std::make_unique<NetworkNamespace>();
  AddLink("qv0", "qv1", "10.9.0.1/24");
  capture.emplace(desktop, desktop);
}

void LinuxCaptureFixture::TearDown() {
  control.reset();
  capture.reset();
  network.reset();
}

void LinuxCaptureFixture::AddLink(const std::string& near, const std::string& far,
                                  const std::string& address) {
  RunCommand("ip link add " + near + " type veth peer name " + far + " && ip addr add " + address + " dev " +
             near + " && ip link set " + near + " arp off up && ip link set " + far + " arp off up");
}

AdapterInfo LinuxCaptureFixture::InfoOf(int adapter) {
  AdapterInfo info;
  capture->vpGetAdapterInfo(static_cast<std::int16_t>(adapter), info);
  return info;
}

int LinuxCaptureFixture::IndexOf(const std::string& name) {
  lastIndex = capture->VBPcapInit();
  return IndexAmongListed(name);
}

int LinuxCaptureFixture::IndexAmongListed(const std::string& name) {
  for (int index = 0; index <= lastIndex; ++index)
    if (name == InfoOf(index).AdapterName.data()) return index;
  return -1;
}

void LinuxCaptureFixture::Start(const std::string& adapter) {
  const int index = IndexOf(adapter);
  ASSERT_GE(index, 0) << adapter;
  capture->vpSetCurrentAdapter(static_cast<std::int16_t>(index));
  capture->vpBegin(1000);
  StartControl(adapter);
}

void LinuxCaptureFixture::StartControl(const std::string& adapter) {
  control = capture->Create();
  // What the handler holds must live as long as it runs, even when the control goes meanwhile.
  control->PacketReceived = [this, held = std::make_shared<int>(1)] {
    ++events;
    if (onEvent) onEvent();
    EXPECT_EQ(*held, 1);
  };
  std::int32_t result = 0;
  control->BindAdapter(adapter, result);
  control->SetValueA(32);
  control->SetValueB(1000);
  control->OpenChannel(result);
  control->SetChannelSize(15000, result);
  control->SetValueC(15000);
  control->StartEvents(result);
  EXPECT_EQ(result, 0);
}

void LinuxCaptureFixture::StopControl() {
  std::int32_t result = 0;
  control->StopEvents(result);
  control->CloseChannel(result);
}

std::optional<Bytes> LinuxCaptureFixture::NextFrame() {
  FrameBytes frame;
  CaptureHeader header{};
  if (capture->vpCapture(frame, header) <= 0) return std::nullopt;
  return Bytes(frame.Data(), frame.Data() + frame.UpperBound() + 1);
}

int LinuxCaptureFixture::Drain() {
  int count = 0;
  while (NextFrame()) ++count;
  return count;
}

void LinuxCaptureFixture::WaitUntil(const std::function<bool()>& condition, const char* what) {
  EXPECT_TRUE(desktop.WaitFor(condition, 5000)) << what;
}

} // namespace quendra::platform::linux_
