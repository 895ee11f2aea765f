#include "capture/dormant/PollingLoop.h"

namespace quendra::capture {

PollingLoop::PollingLoop(platform::CaptureLibrary& library, forms::Desktop& desktop,
                         const CaptureSession& session, PacketAttribution& attribution,
                         monitor::ProcessTable& table)
    : library_(library), desktop_(desktop), session_(session), attribution_(attribution), table_(table) {
  UnloadMainWindow = [this] { desktop_.Unload(table_.List().OwnerForm()); };
}

void PollingLoop::main_DoCapture() {
  if (!table_.PageIsOpen()) return;
  library_.vpSetParam(0, 65536);
  library_.vpSetParam(6, 1024);
  library_.vpBegin(CaptureSession::kSessionValue);
  FrameDecoders decoders;
  platform::CaptureHeader header{};
  while (table_.PageIsOpen() && session_.CaptureRunning) {
    platform::FrameBytes frame;
    const std::int32_t result = library_.vpCapture(frame, header);
    if (result < 0)
      UnloadMainWindow();
    else if (result == 0)
      desktop_.DoEvents();
    else
      attribution_.AttributePolledFrame(frame, decoders);
    table_.RefreshWhenDue();
  }
  library_.vpEnd();
}

} // namespace quendra::capture
