#pragma once

#include "forms/controls/Event.h"
#include "platform/capture/CaptureControls.h"

#include <memory>
#include <vector>

namespace quendra::capture {

/// The capture control `vpacket` and its event. A handler that has yielded asks here again for the control:
/// an adapter change puts another one in its place.
class PacketControl {
 public:
  explicit PacketControl(platform::CaptureControls& controls) : controls_(controls) {}
  PacketControl(const PacketControl&) = delete;

  /// Makes `vpacket`, in place of the one before, and listens to its event. Lets fault 429 through.
  void Create();
  /// Fault 91 without a control.
  platform::CaptureControl& Get() const;

  /// The event of the control that stands now; what a replaced one still raises is lost.
  forms::Event<> vpacket_PacketReceived;

  std::unique_ptr<platform::CaptureControl> vpacket;

 private:
  void Retire();
  void OnPacketReceived(int sender);

  platform::CaptureControls& controls_;
  /// Controls that were replaced while they may have been raising their event: they go when no event is under
  /// way.
  std::vector<std::unique_ptr<platform::CaptureControl>> retired_;
  int eventsUnderWay_ = 0;
  int controlsMade_ = 0; ///< the number of `vpacket`: a new control may lie where a dropped one lay
};

} // namespace quendra::capture
