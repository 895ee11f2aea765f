#include "shell/frmMenu.h"

#include "runtime/Integers.h"

namespace quendra::shell {

namespace {

constexpr std::uint32_t kNonClientLeftButtonDown = 0xA1;
constexpr std::uint32_t kCaptionHit = 2;
constexpr int kCornerEllipse = 10;

} // namespace

frmMenu::frmMenu(forms::Desktop& desktop, forms::Form& about, monitor::SystemVersion& version,
                 const capture::HostAddresses& addresses)
    : PageWindow(u"frmMenu"), desktop_(desktop), about_(about), version_(version), handCursor_(desktop),
      highlight_({PicMenu, picMenu2, picMenu3, linMenu1, linMenu2}), pages_(lblCaption, highlight_),
      ipPanel_(desktop, addresses) {
  KeyPreview = true;
  WireMenu();
}

MenuHighlight::Lines frmMenu::LinesOnSecondRow(TextView name) {
  const auto holder = [this](std::size_t entry) -> forms::Container& {
    return PicMenu[entry < kPageCount ? entry + kPageCount : entry];
  };
  return forms::MakeControls<forms::Line>(name, holder, std::make_index_sequence<kEntryCount>());
}

void frmMenu::WireMenu() {
  for (std::size_t entry = 0; entry < kEntryCount; ++entry) {
    lblCaption[entry].Click = [this, entry] { pages_.Choose(entry); };
    lblCaption[entry].MouseMove = [this, entry](int, int, int, int) {
      handCursor_.Show();
      highlight_.Hover(entry, PageChosen());
    };
    PicMenu[entry].MouseMove = [this, entry](int, int, int, int) { highlight_.Hover(entry, PageChosen()); };
  }
  Label1.Click = [this] { Label1_Click(); };
  // The welcome lies on the background and shall not stand in the way of a drag.
  for (forms::Control* background :
       {static_cast<forms::Control*>(&picOut), static_cast<forms::Control*>(&lblWelcome),
        static_cast<forms::Control*>(&lblWelcomeHint)})
    background->MouseMove = [this](int button, int, int, int) { picOut_MouseMove(button); };
}

void frmMenu::Form_Load() {
  version_.Read();
  pages_.PageChosen = kFalse16;
  handCursor_.Load();
  handCursor_.ShowOverButtons(*this);
  picOut.BackColour = forms::Rgb(162, 233, 93);
  StartCaptureLibrary();
}

void frmMenu::Form_Unload() {
  pages_.StopWithWindow();
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

} // namespace quendra::shell
