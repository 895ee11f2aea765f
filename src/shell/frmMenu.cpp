#include "shell/frmMenu.h"

#include "monitor/modProcPort.h"
#include "platform/system/ShellStart.h"
#include "platform/system/System.h"
#include "shell/OsVersionCode.h"
#include "shell/frmAbout.h"
#include "shell/frmSplash.h"

namespace quendra::shell {

namespace {

constexpr std::uint32_t kNonClientLeftButtonDown = 0xA1;
constexpr std::uint32_t kCaptionHit = 2;
constexpr int kCornerEllipse = 10;

} // namespace

frmMenu::frmMenu(const platform::Machine& machine, forms::Desktop& desktop, frmSplash& splash,
                 frmAbout& about, MenuModules modules)
    : Form(u"frmMenu"), system_(machine.system), shellStart_(machine.shellStart), desktop_(desktop),
      splash_(splash), about_(about), modules_(modules), handCursor_(desktop),
      highlight_({PicMenu, picMenu2, picMenu3, linMenu1, linMenu2}),
      pages_(PageTable(), lblCaption, highlight_), ipPanel_(desktop, modules.hostAddresses) {
  KeyPreview = true;
  WireMenu();
  WireMonitorPage();
  WireOtherPages();
  WireHandCursor();
}

void frmMenu::Form_Load() {
  ReadOsVersion();
  pages_.PageChosen = kFalse16;
  handCursor_.Load();
  picOut.BackColour = forms::Rgb(162, 233, 93);
  StartCaptureLibrary();
}

void frmMenu::ReadOsVersion() {
  modules_.fields.OsVersionCode = 0;
  platform::OsVersion version;
  if (system_.GetVersionExA(version)) {
    modules_.fields.OsVersionCode = OsVersionCodeOf(version);
    return;
  }
  desktop_.MessageBox(
      u"An error occured while trying to get the OS version and information.\r\nClick OK to continue.",
      forms::kExclamation, u"  Error Getting OS Information");
}

void frmMenu::StartCaptureLibrary() try {
  modules_.captureSession.InitLibrary();
  modules_.captureSession.CreateControl();
} catch (const Fault& fault) {
  // Any other fault leaves the window up without a capture control.
  if (fault.number == Fault::kCannotCreateObject) RegisterCaptureControl();
}

void frmMenu::RegisterCaptureControl() {
  shellStart_.Shell("regsvr32.exe -s \"packetvb.dll\"", platform::ShellStart::kNormalWindow);
  splash_.Tag = Text(u"not unload");
  Tag = Text(u"not close");
}

void frmMenu::Form_Unload() {
  if (frameMain.Visible) modules_.monitorPage.main_StopPage();
  if (Tag().empty()) desktop_.End();
}

void frmMenu::Form_KeyDown(int keyCode, int shift) {
  if (IpPanel::IsItsKey(keyCode, shift)) ipPanel_.Show();
}

void frmMenu::Label1_Click() {
  desktop_.Load(about_);
  const forms::Geometry size = about_.Position;
  const auto width = RoundToInt32(size.width / desktop_.TwipsPerPixelX());
  const auto height = RoundToInt32(size.height / desktop_.TwipsPerPixelY());
  const auto region = desktop_.CreateRoundRectRgn(0, 0, width, height, kCornerEllipse, kCornerEllipse);
  desktop_.SetWindowRgn(desktop_.HandleOf(about_), region, false);
  desktop_.Show(about_);
}

void frmMenu::picOut_MouseMove(int button) {
  highlight_.Leave(PageChosen());
  if (button != forms::kLeftButton) return;
  desktop_.ReleaseCapture();
  desktop_.SendMessage(desktop_.HandleOf(*this), kNonClientLeftButtonDown, kCaptionHit, 0);
}

void frmMenu::surf_Timer1_Timer() {
  modules_.modProcPort.FetchTcpOwnerTable();
  modules_.modProcPort.SweepConnections();
}

void frmMenu::surf_StartChecks() { inBackground_ = kFalse16; }

void frmMenu::surf_StopChecks() {
  frameSurfProb.Visible = false;
  resetButtons();
}

void frmMenu::PrepareFirstConnectionPage() { frameFirstConnection.Visible = true; }

void frmMenu::CloseFirstConnectionPage() { frameFirstConnection.Visible = false; }

} // namespace quendra::shell
