#pragma once

#include "platform/DescriptorWatch.h"
#include "platform/capture/CaptureControls.h"
#include "platform/capture/CaptureLibrary.h"
#include "platform/linux/capture/PcapLibrary.h"

#include <memory>

namespace quendra::platform::linux_ {

/// What became of the packets since the object was made, over all sessions.
struct CaptureCounters {
  std::uint64_t received = 0;        ///< packets taken from the kernel
  std::uint64_t droppedByKernel = 0; ///< packets that the kernel's ring had no room for
  std::uint64_t droppedByQueue = 0;  ///< frames that waited too long behind events that took none
};

/// The capture library and its control over libpcap. Both share one session on one adapter: the control rings
/// when frames have arrived, the library delivers them. The session follows vpSetCurrentAdapter.
class LinuxCapture : public CaptureLibrary, public CaptureControls {
 public:
  LinuxCapture(EventLoop& loop, DescriptorWatch& descriptors, PcapLibrary library = PcapLibrary());
  ~LinuxCapture() override;

  std::int32_t VBPcapInit() override;
  void VBPcapTerminate() override;
  void vpGetAdapterInfo(std::int16_t adapter, AdapterInfo& info) override;
  void vpSetCurrentAdapter(std::int16_t adapter) override;
  void vpBegin(std::int32_t value) override;
  std::int32_t vpCapture(FrameBytes& frame, CaptureHeader& header) override;
  void vpEnd() override;
  void vpSetParam(std::int32_t parameter, std::int32_t value) override;
  Availability availability() const override;

  std::unique_ptr<CaptureControl> Create() override;

  CaptureCounters Counters() const;

 private:
  std::shared_ptr<class LinuxCaptureCore> core_;
};

} // namespace quendra::platform::linux_
