#include "diagnostics/dialogs/frmMemInfo.h"

#include "foundation/Looks.h"

#include <span>

namespace quendra::diagnostics {

namespace looks = foundation::looks;
using foundation::Px;

namespace {

constexpr int kWidth = 380;
constexpr int kInset = 12;
constexpr int kGroupWidth = kWidth - 2 * kInset;
constexpr int kFirstLine = 28;
constexpr int kLineHeight = 34;
constexpr int kLinesEnd = 10;

struct Line {
  forms::Label& label;
  const char16_t* caption;
  forms::TextBox& field;
};

/// Puts a group with its lines at `top`; gives where the next one begins.
int PlaceGroup(forms::Frame& frame, const char16_t* caption, int top, std::span<const Line> lines) {
  frame.Caption = Text(caption);
  frame.Border = true;
  frame.BackColour = looks::kPaper;
  frame.TextFont = looks::kStrong;
  int at = kFirstLine;
  for (const Line& line : lines) {
    looks::PlainText(line.label, line.caption, looks::kBody);
    line.label.Move(Px(16), Px(at + 4), Px(164), Px(22));
    line.field.Value = Text();
    line.field.ReadOnly = true;
    line.field.TextFont = looks::kBody;
    line.field.ForeColour = forms::kBlack;
    line.field.Move(Px(186), Px(at), Px(152), Px(27));
    at += kLineHeight;
  }
  const int height = at + kLinesEnd;
  frame.Move(Px(kInset), Px(top), Px(kGroupWidth), Px(height));
  return top + height + kInset;
}

} // namespace

void frmMemInfo::Design() {
  Caption = u"נתוני זיכרון";
  Border = forms::BorderStyle::FixedDialog;
  MinimizeBox = false;
  BackColour = looks::kPaper;
  int top = PlaceGroup(Frame1, u" זיכרון פיזי ", kInset,
                       std::array{Line{Label1, u"סה\"כ זיכרון פיזי:", txtPhysicalMemory},
                                  Line{Label3, u"זיכרון פיזי זמין:", txtAPhysicalMemory}});
  top = PlaceGroup(Frame2, u" זיכרון וירטואלי ", top,
                   std::array{Line{Label2, u"סה\"כ זיכרון וירטואלי:", txtVirtualMemory},
                              Line{Label4, u"זיכרון וירטואלי זמין: ", txtAVirtualMemory}});
  top = PlaceGroup(Frame3, u" ניצול דפי זיכרון ", top,
                   std::array{Line{Label6, u"גודל דף זיכרון:", txtPageFile},
                              Line{Label5, u"גודל דף זמין:", txtAPageFile},
                              Line{Label7, u"זכרון מנוצל:", txtMemoryUsage}});
  looks::LeadingButton(cmdClose, u"סגור");
  cmdClose.Move(Px((kWidth - 120) / 2), Px(top), Px(120), Px(34));
  Timer1.Interval = 10;
  Timer1.Enabled = true;
  Move(0, 0, Px(kWidth), Px(top + 34 + kInset));
}

} // namespace quendra::diagnostics
