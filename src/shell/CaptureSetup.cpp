#include "shell/CaptureSetup.h"

#include "runtime/Fault.h"

namespace quendra::shell {

CaptureSetup::CaptureSetup(platform::ShellStart& shellStart, frmSplash& splash, frmMenu& menu,
                           capture::CaptureSession& session, capture::PacketControl& control)
    : shellStart_(shellStart), splash_(splash), menu_(menu), session_(session), control_(control) {
  menu_.StartCaptureLibrary = [this] { StartCaptureLibrary(); };
}

void CaptureSetup::StartCaptureLibrary() try {
  session_.InitLibrary();
  control_.Create();
} catch (const Fault& fault) {
  // Any other fault leaves the window up without a capture control.
  if (fault.number == Fault::kCannotCreateObject) RegisterCaptureControl();
}

void CaptureSetup::RegisterCaptureControl() {
  shellStart_.Shell("regsvr32.exe -s \"packetvb.dll\"", platform::ShellStart::kNormalWindow);
  splash_.Tag = Text(u"not unload");
  menu_.Tag = Text(u"not close");
}

} // namespace quendra::shell
