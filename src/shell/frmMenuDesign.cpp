#include "foundation/Looks.h"
#include "foundation/Wording.h"
#include "shell/MenuLayout.h"
#include "shell/frmMenu.h"

namespace quendra::shell {

namespace looks = foundation::looks;
using foundation::kTitle;
using foundation::Px;

namespace {

using namespace layout;

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
}

void frmMenu::DesignMenu() {
  picOut.Contents = forms::Picture::Artwork("background");
  picOut.Move(0, 0, Px(kWindowWidth), Px(kWindowHeight));
  for (std::size_t entry = 0; entry < PicMenu.size(); ++entry) DesignEntry(entry);
  DesignLines();
  for (std::size_t button = 0; button < kPageCount; ++button) {
    const std::string artwork = kPageTable[button].artwork;
    picMenu2[button].Contents = forms::Picture::Artwork(artwork + "_hot");
    picMenu3[button].Contents = forms::Picture::Artwork(artwork);
    picMenu2[button].Visible = false;
    picMenu3[button].Visible = false;
    PicMenu[button].Contents = picMenu3[button].Contents;
  }
  looks::Link(Label1, u"אודות", looks::kBody);
  Label1.Align = forms::Alignment::Trailing;
  Label1.Move(Px(kWindowWidth - kMargin - kAboutWidth), Px(kMenuTop), Px(kAboutWidth), Px(22));
}

void frmMenu::DesignEntry(std::size_t entry) {
  const bool isButton = entry < kPageCount;
  const int column = static_cast<int>(entry % kPageCount);
  const int width = isButton ? kButtonWidth : kLinkWidth;
  const int height = isButton ? kButtonHeight : kLinkHeight;
  const int left = (isButton ? kMargin : kLinksLeft) + column * (width + kButtonGap);
  PicMenu[entry].BackColour = isButton ? looks::kLime : looks::kFoot;
  PicMenu[entry].Move(Px(left), Px(isButton ? kMenuTop : kLinksTop), Px(width), Px(height));
  Label& caption = lblCaption[entry];
  looks::PlainText(caption, kPageTable[PageOfEntry(entry)].caption, isButton ? looks::kEntry : looks::kSmall,
                   looks::kForest);
  caption.Align = forms::Alignment::Centre;
  // The second row stands at the foot of the window, and Tab comes to it after the pages.
  caption.TabIndex = isButton ? 0 : 1;
  caption.Move(0, 0, Px(width), Px(height));
}

/// The lines of an entry of the second row and of the button over it show together: a frame round the
/// entry.
void frmMenu::DesignLines() {
  const int left = 1;
  const int right = kLinkWidth - 1;
  const int top = 1;
  const int bottom = kLinkHeight - 1;
  for (std::size_t button = 0; button < kPageCount; ++button) {
    const std::size_t link = button + kPageCount;
    Place(linMenu1[button], left, top, right, top);
    Place(linMenu2[button], right, top, right, bottom);
    Place(linMenu1[link], left, bottom, right, bottom);
    Place(linMenu2[link], left, top, left, bottom);
  }
}

void frmMenu::DesignWelcome() {
  looks::PlainText(lblWelcome, u"ברוכים הבאים", {24, true, false}, looks::kForest);
  lblWelcome.Align = forms::Alignment::Centre;
  lblWelcome.Move(Px(kMargin), Px(442), Px(kPageWidth), Px(44));
  looks::PlainText(lblWelcomeHint, u"בחרו נושא בתפריט שלמעלה ונתחיל לבדוק יחד", {13, false, false},
                   looks::kForest);
  lblWelcomeHint.Align = forms::Alignment::Centre;
  lblWelcomeHint.Move(Px(kMargin), Px(488), Px(kPageWidth), Px(30));
}

void frmMenu::DesignPages() {
  for (forms::Page* page : pages_.All()) {
    page->frame.Caption = Text();
    page->frame.Border = false;
    page->frame.BackColour = looks::kPaper;
    page->frame.Visible = false;
    page->frame.Move(Px(kMargin), Px(kPageTop), Px(kPageWidth), Px(kPageHeight));
    page->Design();
  }
}

} // namespace quendra::shell
