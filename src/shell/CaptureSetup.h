#pragma once

#include "capture/CaptureSession.h"
#include "platform/system/ShellStart.h"
#include "shell/frmMenu.h"
#include "shell/frmSplash.h"

namespace quendra::shell {

/// Brings the capture up with the main window: its library, then its control. Where the control isn't
/// registered, it starts the registration and lets the user press "המשך" once more.
class CaptureSetup {
 public:
  CaptureSetup(platform::ShellStart& shellStart, frmSplash& splash, frmMenu& menu,
               capture::CaptureSession& session, capture::PacketControl& control);

 private:
  void StartCaptureLibrary();
  void RegisterCaptureControl();

  platform::ShellStart& shellStart_;
  frmSplash& splash_;
  frmMenu& menu_;
  capture::CaptureSession& session_;
  capture::PacketControl& control_;
};

} // namespace quendra::shell
