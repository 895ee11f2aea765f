#include "diagnostics/SurfPage.h"

#include "foundation/Looks.h"

namespace quendra::diagnostics {

namespace looks = foundation::looks;
using foundation::Px;

namespace {

constexpr int kRuleLeft = Px(20);
constexpr int kRuleWidth = 8650;
constexpr int kRuleHeight = 15;
constexpr int kAsideLeft = Px(622); // a little behind the rules
constexpr int kListTop = Px(192);
constexpr int kPanelInset = Px(6);
constexpr int kPanelTop = Px(50);

// What the columns are to each other; together they are wider than the list, which fits them in.
constexpr int kDetailsWidth = 8978;
constexpr int kCheckWidth = 5369;
constexpr int kDiagnosisWidth = 829;

} // namespace

SurfPage::SurfPage(forms::PageWindow& window, const forms::PageRow& row) : Page(window, row) {
  frmSurf_cmdAdvanced.Click = [this] { advanced.frmSurf_frameAdvanced.Visible = true; };
}

void SurfPage::Design() {
  const int width = frame.Position().width;
  looks::PageHead(surf_lblTitle, surf_lblBack, row.caption, width);
  looks::PlainText(surf_lblHint,
                   u"הבדיקות רצות מעצמן, זו אחר זו.\nמחיקת הקבצים והמדידות נמשכות כמה שניות.\n"
                   u"לבדיקה חוזרת צאו מהדף והיכנסו שוב.",
                   looks::kSmall, looks::kQuiet);
  surf_lblHint.WordWrap = true;
  surf_lblHint.Move(kAsideLeft, Px(58), width - kAsideLeft - Px(20), Px(60));
  DesignRules();
  DesignList();
  DesignButtons();
  advanced.Design(
      {kPanelInset, kPanelTop, width - 2 * kPanelInset, frame.Position().height - kPanelTop - kPanelInset});
  surf_Timer1.Enabled = false;
  surf_Timer1.Interval = 100;
}

void SurfPage::DesignRules() {
  for (std::size_t rule = 0; rule < surf_picLine.size(); ++rule) {
    surf_picLine[rule].BackColour = looks::kLime;
    surf_picLine[rule].Move(kRuleLeft, RuleTop(rule), kRuleWidth, kRuleHeight);
    surf_picLine[rule].Visible = false;
  }
}

void SurfPage::DesignList() {
  surf_ImageList1.Clear();
  for (const char* image : {"ico_check", "ico_x"})
    surf_ImageList1.Add(forms::Picture::Artwork(image), {}, FromUtf8(image));
  surf_ListView1.Clear();
  surf_ListView1.ClearColumns();
  surf_ListView1.SmallIcons = &surf_ImageList1;
  surf_ListView1.TextFont = looks::kSmall;
  surf_ListView1.Description = u"תוצאות הבדיקות";
  surf_ListView1.AddColumn({});
  surf_ListView1.AddColumn({u"פרטים", kDetailsWidth});
  surf_ListView1.AddColumn({u"בדיקה", kCheckWidth});
  surf_ListView1.AddColumn({u"אבחון", kDiagnosisWidth, forms::Alignment::Centre});
  const forms::Geometry page = frame.Position;
  surf_ListView1.Move(Px(6), kListTop, page.width - 2 * Px(6), page.height - kListTop - Px(8));
}

void SurfPage::DesignButtons() {
  looks::Button(frmSurf_cmdAdvanced, u"מתקדם");
  frmSurf_cmdAdvanced.Move(kAsideLeft, Px(146), Px(140), Px(32));
  looks::Button(surf_cmdDownload, u"הורדת תוכנות עזר");
  surf_cmdDownload.Move(kAsideLeft + Px(150), Px(146), Px(180), Px(32));
  surf_cmdDownload.Visible = false;
  looks::PlainText(surf_Label3, u"המתן...", looks::kBody, looks::kQuiet);
  surf_Label3.Move(kAsideLeft, Px(120), Px(140), Px(22));
  surf_Label3.Visible = false;
}

} // namespace quendra::diagnostics
