#pragma once

#include "platform/capture/CaptureAdapters.h"
#include "platform/capture/CaptureControls.h"
#include "platform/capture/CaptureCounters.h"
#include "platform/capture/CaptureLibrary.h"

namespace quendra::platform {

/// The capture library and its control over the adapters of a machine. Both share one session on one adapter:
/// the control rings when frames have arrived, the library delivers them. The session follows
/// vpSetCurrentAdapter.
class LiveCapture : public CaptureLibrary, public CaptureControls {
 public:
  LiveCapture(EventLoop& loop, std::unique_ptr<CaptureAdapters> adapters,
              std::uint32_t queueCapacity = FrameQueue::kUsualCapacity);
  ~LiveCapture() override;

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

  /// Since the object was made.
  CaptureCounters Counters() const;

 private:
  std::shared_ptr<class CaptureCore> core_;
};

} // namespace quendra::platform
