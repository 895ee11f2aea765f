#include "shell/Looks.h"
#include "shell/Twips.h"
#include "shell/Wording.h"
#include "shell/frmMenu.h"

namespace quendra::shell {

namespace {

constexpr int kWindowWidth = 1150;
constexpr int kWindowHeight = 760;
constexpr int kMargin = 16;
constexpr int kButtonWidth = 264;
constexpr int kButtonHeight = 64;
constexpr int kButtonGap = 12;
constexpr int kLinkHeight = 26;
constexpr int kMenuTop = 14;
constexpr int kLinksTop = kMenuTop + kButtonHeight + 6;
constexpr int kPageTop = kLinksTop + kLinkHeight + 10;
constexpr int kPageWidth = kWindowWidth - 2 * kMargin;
constexpr int kPageHeight = kWindowHeight - kPageTop - kMargin;

constexpr const char16_t* kPageNames[] = {u"ניטור תהליכים", u"בעיות גלישה", u"התחברות ראשונה"};
constexpr const char* kButtonArtwork[] = {"menu_monitor", "menu_surf", "menu_connect"};

void Place(forms::Line& line, int x1, int x2, int y, int width) {
  line.Ends = forms::LineEnds{Px(x1), Px(y), Px(x2), Px(y)};
  line.BorderWidth = width;
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
  const int height = isButton ? kButtonHeight : kLinkHeight;
  PictureBox& picture = PicMenu[entry];
  Label& caption = lblCaption[entry];
  picture.BackColour = looks::kLime;
  picture.Move(Px(kMargin + column * (kButtonWidth + kButtonGap)), Px(isButton ? kMenuTop : kLinksTop),
               Px(kButtonWidth), Px(height));
  const char16_t* name = kPageNames[isButton ? entry : 5 - entry];
  looks::Text(caption, name, isButton ? looks::kEntry : looks::kSmall, looks::kForest);
  caption.Align = forms::Alignment::Centre;
  caption.Move(0, 0, Px(kButtonWidth), Px(height));
  Place(linMenu1[entry], isButton ? 24 : 60, kButtonWidth - (isButton ? 24 : 60), height - 2, 2);
  Place(linMenu2[entry], isButton ? 60 : 100, kButtonWidth - (isButton ? 60 : 100), height - 4, 1);
}

void frmMenu::DesignWelcome() {
  looks::Text(lblWelcome, u"ברוכים הבאים", {24, true, false}, looks::kForest);
  lblWelcome.Align = forms::Alignment::Centre;
  lblWelcome.Move(Px(kMargin), Px(500), Px(kPageWidth), Px(44));
  looks::Text(lblWelcomeHint, u"בחרו נושא בתפריט שלמעלה ונתחיל לבדוק יחד", {13, false, false},
              looks::kForest);
  lblWelcomeHint.Align = forms::Alignment::Centre;
  lblWelcomeHint.Move(Px(kMargin), Px(548), Px(kPageWidth), Px(30));
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
