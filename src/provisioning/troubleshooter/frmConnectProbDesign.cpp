#include "foundation/Looks.h"
#include "provisioning/troubleshooter/frmConnectProb.h"

namespace quendra::provisioning {

namespace looks = foundation::looks;
using foundation::Px;

namespace {

constexpr int kWidth = 560;
constexpr int kInset = 18;
constexpr int kLabelWidth = 112;
constexpr int kFieldLeft = kInset + kLabelWidth + 6;
constexpr int kFieldWidth = kWidth - kFieldLeft - kInset;
constexpr int kStatusTop = 98;
constexpr int kStatusHeight = 210;
constexpr int kDiagnosisTop = kStatusTop + kStatusHeight + 14;
constexpr int kDiagnosisHeight = 46; // two lines
constexpr int kButtonsTop = kDiagnosisTop + kDiagnosisHeight + 14;
constexpr int kButtonHeight = 34;

void PlaceLabel(forms::Label& label, const char16_t* caption, int top) {
  looks::PlainText(label, caption, looks::kBody);
  label.Move(Px(kInset), Px(top), Px(kLabelWidth), Px(24));
}

} // namespace

void frmConnectProb::Design() {
  Caption = u"בעית חיבור";
  Border = forms::BorderStyle::FixedDialog;
  MinimizeBox = false;
  BackColour = looks::kPaper;
  Move(0, 0, Px(kWidth), Px(kButtonsTop + kButtonHeight + kInset));
  DesignEntries();
  DesignOutcome();
  looks::LeadingButton(cmdCheck, u"בדוק...");
  cmdCheck.Move(Px(kInset), Px(kButtonsTop), Px(140), Px(kButtonHeight));
  looks::Button(Command1, u"סגור");
  Command1.Move(Px(kWidth - kInset - 120), Px(kButtonsTop), Px(120), Px(kButtonHeight));
}

void frmConnectProb::DesignEntries() {
  PlaceLabel(Label1, u"בחר את החיבור:", 21);
  cmbDialups.Clear();
  cmbDialups.TextFont = looks::kBody;
  cmbDialups.Move(Px(kFieldLeft), Px(18), Px(kFieldWidth), Px(28));
  PlaceLabel(Label3, u"דמה שגיאה:", 61);
  txtEmunrateError.Value = Text();
  txtEmunrateError.TextFont = looks::kBody;
  txtEmunrateError.Move(Px(kFieldLeft), Px(58), Px(110), Px(28));
}

void frmConnectProb::DesignOutcome() {
  PlaceLabel(Label2, u"סטטוס:", kStatusTop + 3);
  txtStatus.MultiLine = true;
  txtStatus.ReadOnly = true;
  txtStatus.VerticalScrollBar = true;
  txtStatus.TextFont = looks::kBody;
  txtStatus.Value = Text();
  txtStatus.Move(Px(kFieldLeft), Px(kStatusTop), Px(kFieldWidth), Px(kStatusHeight));
  PlaceLabel(Label4, u"אבחון:", kDiagnosisTop - 3); // level with the first of two lines
  looks::PlainText(lblDiagnoze, u"", looks::kStrong);
  lblDiagnoze.WordWrap = true;
  lblDiagnoze.Move(Px(kFieldLeft), Px(kDiagnosisTop), Px(kFieldWidth), Px(kDiagnosisHeight));
}

} // namespace quendra::provisioning
