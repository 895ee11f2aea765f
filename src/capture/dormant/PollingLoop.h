#pragma once

#include "capture/CaptureSession.h"
#include "capture/PacketAttribution.h"
#include "forms/Desktop.h"
#include "monitor/ProcessTable.h"

#include <functional>

namespace quendra::capture {

/// The polling form of the capture loop. Dormant: complete, but nothing makes one.
class PollingLoop {
 public:
  PollingLoop(platform::CaptureLibrary& library, forms::Desktop& desktop, const CaptureSession& session,
              PacketAttribution& attribution, monitor::ProcessTable& table);

  /// As long as the page is open and the session runs.
  void main_DoCapture();
  /// Called on a failed vpCapture. Unloads the form of the page unless another handler is put here.
  std::function<void()> UnloadMainWindow;

 private:
  platform::CaptureLibrary& library_;
  forms::Desktop& desktop_;
  const CaptureSession& session_;
  PacketAttribution& attribution_;
  monitor::ProcessTable& table_;
};

} // namespace quendra::capture
