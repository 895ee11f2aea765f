#include "platform/capture/LiveCaptureFixture.h"

namespace quendra::platform {

void LiveCaptureFixture::Start(const std::string& adapter) {
  last = capture->VBPcapInit();
  capture->vpSetCurrentAdapter(static_cast<std::int16_t>(IndexOf(adapter)));
  capture->vpBegin(1000);
  StartControl(adapter);
}

void LiveCaptureFixture::StartControl(const std::string& adapter) {
  control = capture->Create();
  control->PacketReceived = [this] {
    ++events;
    onEvent();
  };
  std::int32_t result = -1;
  control->BindAdapter(adapter, result);
  control->OpenChannel(result);
  control->StartEvents(result);
}

std::vector<std::string> LiveCaptureFixture::List() {
  std::vector<std::string> names;
  for (int index = 0; index <= last; ++index) {
    AdapterInfo info;
    capture->vpGetAdapterInfo(static_cast<std::int16_t>(index), info);
    const std::string name = info.AdapterName.data();
    if (std::find(names.begin(), names.end(), name) == names.end()) names.push_back(name);
  }
  return names;
}

int LiveCaptureFixture::IndexOf(const std::string& adapter) {
  const auto names = List();
  return static_cast<int>(std::find(names.begin(), names.end(), adapter) - names.begin());
}

void LiveCaptureFixture::Arrive(unsigned count) {
  std::vector<integration::Bytes> packets;
  for (unsigned i = 0; i < count; ++i) packets.push_back(integration::TcpFrame(1025 + i, 80));
  lines.Arrive("line", packets);
}

std::optional<unsigned> LiveCaptureFixture::NextPort() {
  FrameBytes frame;
  CaptureHeader header{};
  if (capture->vpCapture(frame, header) <= 0) return std::nullopt;
  return frame[34] * 256u + frame[35];
}

int LiveCaptureFixture::Drain() {
  int count = 0;
  while (NextPort()) ++count;
  return count;
}

} // namespace quendra::platform
