#include "provisioning/page/StepMenu.h"

#include "foundation/Looks.h"

namespace quendra::provisioning {

namespace looks = foundation::looks;
using foundation::Px;

namespace {

constexpr int kWidth = 420;
constexpr int kHeight = 260;
constexpr int kTop = 116;
constexpr int kGap = 40;
/// Round the hot spot, so that the mouse comes over the picture first.
constexpr int kAroundHotSpot = 24;

struct StepPicture {
  const char* artwork;
  const char16_t* description;
};
constexpr std::array<StepPicture, StepMenu::kSteps> kPictures{{
    {"step_mail", u"שלב 2: הגדרת תוכנת הדואר"},
    {"step_connection", u"שלב 1: יצירת חיבור לאינטרנט"},
}};

/// The frame, in pixels of the picture: an outer rectangle whose corners are cut, one within, and a short
/// rule at the foot.
constexpr int kOut = 7;
constexpr int kCut = 16;
constexpr int kIn = 16;
constexpr int kRight = kWidth - 1;
constexpr int kBottom = kHeight - 1;
constexpr std::array<forms::LineEnds, StepMenu::kLines> kFrameLines{{
    {kOut + kCut, kOut, kRight - kOut - kCut, kOut},
    {kRight - kOut - kCut, kOut, kRight - kOut, kOut + kCut},
    {kRight - kOut, kOut + kCut, kRight - kOut, kBottom - kOut - kCut},
    {kRight - kOut - kCut, kBottom - kOut, kRight - kOut, kBottom - kOut - kCut},
    {kOut + kCut, kBottom - kOut, kRight - kOut - kCut, kBottom - kOut},
    {kOut, kBottom - kOut - kCut, kOut + kCut, kBottom - kOut},
    {kOut, kOut + kCut, kOut, kBottom - kOut - kCut},
    {kOut, kOut + kCut, kOut + kCut, kOut},
    {kIn, kIn, kRight - kIn, kIn},
    {kRight - kIn, kIn, kRight - kIn, kBottom - kIn},
    {kIn, kBottom - kIn, kRight - kIn, kBottom - kIn},
    {kIn, kIn, kIn, kBottom - kIn},
    {kWidth / 2 - 60, kBottom - kIn - 10, kWidth / 2 + 60, kBottom - kIn - 10},
}};

template <std::size_t... number>
auto MakeLines(std::array<forms::PictureBox, StepMenu::kSteps>& pictures, std::index_sequence<number...>) {
  return std::array<StepMenu::Lines, StepMenu::kLines>{{forms::ControlArrayOn<forms::Line>(
      pictures, u"frsCon_Line" + DecimalText(static_cast<std::int64_t>(number + 1)))...}};
}

} // namespace

StepMenu::StepMenu(forms::Frame& page)
    : frsCon_PicMenu(forms::ControlArray<forms::PictureBox, kSteps>(page, u"frsCon_PicMenu")),
      frsCon_Lines(MakeLines(frsCon_PicMenu, std::make_index_sequence<kLines>())),
      frsCon_lblConnectProb(page, u"frsCon_lblConnectProb") {
  // The step to be taken first is the first that Tab finds.
  frsCon_PicMenu[0].BringToFront();
  frsCon_lblConnectProb.BringToFront();
  for (std::size_t step = 0; step < kSteps; ++step)
    frsCon_PicMenu[step].MouseMove = [this, step](int, int, int, int) { frsCon_PicMenu_MouseMove(step); };
}

void StepMenu::Design(int pageWidth) {
  const int left = (pageWidth - Px(2 * kWidth + kGap)) / 2;
  for (std::size_t step = 0; step < kSteps; ++step) {
    frsCon_PicMenu[step].Contents = forms::Picture::Artwork(kPictures[step].artwork);
    frsCon_PicMenu[step].BackColour = looks::kPaper;
    // The connection comes first.
    frsCon_PicMenu[step].Move(step == 1 ? left : left + Px(kWidth + kGap), Px(kTop), Px(kWidth), Px(kHeight));
    forms::Label& hotSpot = frsCon_lblCaption[step];
    looks::PlainText(hotSpot, u"", looks::kEntry);
    hotSpot.Description = kPictures[step].description;
    hotSpot.Move(Px(kAroundHotSpot), Px(kAroundHotSpot), Px(kWidth - 2 * kAroundHotSpot),
                 Px(kHeight - 2 * kAroundHotSpot));
  }
  for (std::size_t number = 0; number < kLines; ++number)
    for (forms::Line& line : frsCon_Lines[number]) {
      const forms::LineEnds& ends = kFrameLines[number];
      line.Ends = forms::LineEnds{Px(ends.x1), Px(ends.y1), Px(ends.x2), Px(ends.y2)};
      line.BorderWidth = 1;
      line.ForeColour = looks::kLeaf;
    }
  ClearMenuLines();
  looks::Link(frsCon_lblConnectProb, u"בעית חיבור", looks::kBody);
  frsCon_lblConnectProb.Enabled = static_cast<bool>(frsCon_lblConnectProb.Click);
  frsCon_lblConnectProb.Move(left, Px(kTop + kHeight + 40), Px(140), Px(24));
}

void StepMenu::frsCon_PicMenu_MouseMove(std::size_t step) {
  for (Lines& lines : frsCon_Lines)
    for (std::size_t each = 0; each < kSteps; ++each) lines[each].Visible = each == step;
}

void StepMenu::ClearMenuLines() {
  for (Lines& lines : frsCon_Lines)
    for (forms::Line& line : lines) line.Visible = false;
}

} // namespace quendra::provisioning
