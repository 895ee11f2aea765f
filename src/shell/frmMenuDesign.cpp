#include "shell/Looks.h"
#include "shell/MenuLayout.h"
#include "shell/Twips.h"
#include "shell/Wording.h"
#include "shell/frmMenu.h"

namespace quendra::shell {

namespace {

using namespace layout;

constexpr const char16_t* kPageNames[] = {u"ניטור תהליכים", u"בעיות גלישה", u"התחברות ראשונה"};
constexpr const char* kButtonArtwork[] = {"menu_monitor", "menu_surf", "menu_connect"};

void Place(forms::Line& line, int x1, int y1, int x2, int y2) {
  line.Ends = forms::LineEnds{Px(x1), Px(y1), Px(x2), Px(y2)};
  line.BorderWidth = 1;
  line.ForeColour = looks::kLeaf;
  line.Visible = false;
}

} // namespace

void frmMenu::Design() {
  Caption = Text(kTitle);
  Tag = Text();
  BackColour = looks::kLime;
  Move(0, 0, Px(kWindowWidth), Px(kWindowHeight));
  DesignMenu();
  DesignWelcome();
  DesignPages();
  DesignMonitorPage();
}

void frmMenu::DesignMenu() {
  picOut.Contents = forms::Picture::Artwork("background");
  picOut.Move(0, 0, Px(kWindowWidth), Px(kWindowHeight));
  for (std::size_t entry = 0; entry < PicMenu.size(); ++entry) DesignEntry(entry);
  DesignLines();
  for (std::size_t button = 0; button < picMenu3.size(); ++button) {
    const std::string artwork = kButtonArtwork[button];
    picMenu2[button].Contents = forms::Picture::Artwork(artwork + "_hot");
    picMenu3[button].Contents = forms::Picture::Artwork(artwork);
    picMenu2[button].Visible = false;
    picMenu3[button].Visible = false;
    PicMenu[button].Contents = picMenu3[button].Contents;
  }
  looks::Link(Label1, u"אודות", looks::kBody);
  Label1.Align = forms::Alignment::Trailing;
  Label1.Move(Px(kWindowWidth - kMargin - 80), Px(kMenuTop), Px(80), Px(22));
}

void frmMenu::DesignEntry(std::size_t entry) {
  const bool isButton = entry < picMenu3.size();
  const int column = static_cast<int>(entry % picMenu3.size());
  const int width = isButton ? kButtonWidth : kLinkWidth;
  const int height = isButton ? kButtonHeight : kLinkHeight;
  const int left = (isButton ? kMargin : kLinksLeft) + column * (width + kButtonGap);
  PicMenu[entry].BackColour = isButton ? looks::kLime : looks::kFoot;
  PicMenu[entry].Move(Px(left), Px(isButton ? kMenuTop : kLinksTop), Px(width), Px(height));
  Label& caption = lblCaption[entry];
  looks::Text(caption, kPageNames[isButton ? entry : 5 - entry], isButton ? looks::kEntry : looks::kSmall,
              looks::kForest);
  caption.Align = forms::Alignment::Centre;
  // The second row stands at the foot of the window, behind the pages.
  caption.TabIndex = isButton ? 0 : 1;
  caption.Move(0, 0, Px(width), Px(height));
}

/// The lines of an entry of the second row and of the one three before show together: a frame round the
/// entry.
void frmMenu::DesignLines() {
  const int left = 1;
  const int right = kLinkWidth - 1;
  const int top = 1;
  const int bottom = kLinkHeight - 1;
  for (std::size_t button = 0; button < picMenu3.size(); ++button) {
    const std::size_t link = button + picMenu3.size();
    Place(linMenu1[button], left, top, right, top);
    Place(linMenu2[button], right, top, right, bottom);
    Place(linMenu1[link], left, bottom, right, bottom);
    Place(linMenu2[link], left, top, left, bottom);
  }
}

void frmMenu::DesignWelcome() {
  looks::Text(lblWelcome, u"ברוכים הבאים", {24, true, false}, looks::kForest);
  lblWelcome.Align = forms::Alignment::Centre;
  lblWelcome.Move(Px(kMargin), Px(442), Px(kPageWidth), Px(44));
  looks::Text(lblWelcomeHint, u"בחרו נושא בתפריט שלמעלה ונתחיל לבדוק יחד", {13, false, false},
              looks::kForest);
  lblWelcomeHint.Align = forms::Alignment::Centre;
  lblWelcomeHint.Move(Px(kMargin), Px(488), Px(kPageWidth), Px(30));
}

void frmMenu::DesignPages() {
  for (Frame* frame : {&frameMain, &frameSurfProb, &frameFirstConnection}) {
    frame->Caption = Text();
    frame->Border = false;
    frame->BackColour = looks::kPaper;
    frame->Visible = false;
    frame->Move(Px(kMargin), Px(kPageTop), Px(kPageWidth), Px(kPageHeight));
  }
  DesignPageWithoutContent(surf_lblTitle, surf_lblBack, kPageNames[1]);
  DesignPageWithoutContent(frsCon_lblTitle, frsCon_lblBack, kPageNames[2]);
  for (Timer* timer : {&main_Timer1, &main_Timer2, &surf_Timer1}) timer->Enabled = false;
  main_Timer1.Interval = 1000;
  main_Timer2.Interval = 1000;
  surf_Timer1.Interval = 100;
}

void frmMenu::DesignPageWithoutContent(Label& title, Label& back, const char16_t* caption) {
  looks::Text(title, caption, looks::kHeading, looks::kForest);
  title.Move(Px(20), Px(14), Px(400), Px(32));
  looks::Link(back, u"חזרה", looks::kBody);
  back.Align = forms::Alignment::Trailing;
  back.Move(Px(kPageWidth - 120), Px(20), Px(100), Px(22));
}

} // namespace quendra::shell
