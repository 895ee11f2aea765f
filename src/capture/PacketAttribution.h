#pragma once

#include "capture/CaptureFields.h"
#include "forms/Desktop.h"
#include "monitor/MonitorPage.h"
#include "platform/Capture.h"
#include "platform/Machine.h"

#include <functional>

namespace quendra::monitor {
class ProcessTable;
}

namespace quendra::capture {

/// Charges captured packets to the rows of the process table and drives the table's regular refresh.
class PacketAttribution {
 public:
  PacketAttribution(const platform::Machine& machine, forms::Desktop& desktop, monitor::MonitorPage page,
                    monitor::MonitorFields& fields, CaptureFields& capture, monitor::ProcessTable& table);
  ~PacketAttribution();

  /// The event of the capture control `vpacket`.
  void vpacket_PacketReceived(platform::CaptureControl& vpacket);

 private:
  struct State;
  std::unique_ptr<State> state_;
};

} // namespace quendra::capture
