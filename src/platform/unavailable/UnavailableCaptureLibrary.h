#pragma once

#include "platform/capture/CaptureLibrary.h"

namespace quendra::platform::unavailable {

/// A system without the capture library.
class UnavailableCaptureLibrary : public CaptureLibrary {
 public:
  std::int32_t VBPcapInit() override { return -1; }
  void VBPcapTerminate() override {}
  void vpGetAdapterInfo(std::int16_t, AdapterInfo&) override {}
  void vpSetCurrentAdapter(std::int16_t) override {}
  void vpBegin(std::int32_t) override {}
  std::int32_t vpCapture(FrameBytes& frame, CaptureHeader&) override {
    frame = FrameBytes::Blank();
    return -1;
  }
  void vpEnd() override {}
  void vpSetParam(std::int32_t, std::int32_t) override {}
  Availability availability() const override { return Availability::NoLibrary; }
};

} // namespace quendra::platform::unavailable
