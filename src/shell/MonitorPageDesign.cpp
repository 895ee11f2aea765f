#include "foundation/Looks.h"
#include "shell/MenuLayout.h"
#include "shell/MonitorPage.h"

namespace quendra::shell {

namespace looks = foundation::looks;
using foundation::Px;

namespace {

using layout::kPageWidth;

constexpr int kInset = 6;
constexpr int kTableTop = 46;
constexpr int kTableHeight = 413;
constexpr int kActionsTop = kTableTop + kTableHeight + 7;
constexpr int kAdaptersTop = kActionsTop + 38;

struct Meter {
  forms::Label& caption;
  forms::Label& figure;
  forms::Label& unit;
};

void Place(const Meter& meter, const char16_t* caption, int left) {
  looks::PlainText(meter.caption, caption, looks::kBody, looks::kQuiet);
  meter.caption.Align = forms::Alignment::Trailing;
  meter.caption.Move(Px(left), Px(14), Px(70), Px(22));
  looks::PlainText(meter.figure, u"0.0", looks::kFigure, looks::kForest);
  meter.figure.Align = forms::Alignment::Centre;
  meter.figure.Move(Px(left + 72), Px(8), Px(116), Px(30));
  looks::PlainText(meter.unit, u"ק\"ב לשנייה", looks::kSmall, looks::kQuiet);
  meter.unit.Move(Px(left + 190), Px(15), Px(76), Px(20));
}

} // namespace

void MonitorPage::Design() {
  looks::PlainText(table.main_Label4, u"תהליכים פעילים:", looks::kHeading, looks::kForest);
  table.main_Label4.Move(Px(16), Px(8), Px(320), Px(32));
  DesignMeters();
  DesignTable();
  DesignActions();
  DesignAdapters();
  for (forms::Timer* timer : {&main_Timer1, &main_Timer2}) {
    timer->Enabled = false;
    timer->Interval = 1000;
  }
}

void MonitorPage::DesignMeters() {
  Place({table.main_Label2, table.main_lblUpload, table.main_lblUploadUnit}, u"העלאה:", kPageWidth - 556);
  Place({table.main_Label3, table.main_lblDownload, table.main_lblDownloadUnit}, u"הורדה:", kPageWidth - 280);
}

void MonitorPage::DesignTable() {
  table.main_ListView1.Clear();
  table.main_ListView1.ClearColumns();
  table.main_ListView1.SmallIcons = &table.main_ImList;
  table.main_ListView1.HeaderIcons = &table.main_headersIL;
  table.main_ListView1.TextFont = looks::kSmall;
  table.main_ListView1.Description = u"תהליכים פעילים";
  table.main_ListView1.Move(Px(kInset), Px(kTableTop), Px(kPageWidth - 2 * kInset), Px(kTableHeight));
  table.main_ImList.Clear();
  table.main_ImList.Add(forms::Picture::Artwork("default_process"));
  table.main_headersIL.Clear();
  table.main_headersIL.Add(forms::Picture::Artwork("header_upload"));
  table.main_headersIL.Add(forms::Picture::Artwork("header_download"));
  table.main_Pic.Visible = false;
  table.main_Pic.ScaleMode = forms::ScaleMode::Pixels;
  table.main_Pic.BackColour = forms::kWhite;
  table.main_Pic.Move(0, 0, Px(32), Px(32));
}

void MonitorPage::DesignActions() {
  struct Action {
    Label& label;
    const char16_t* caption;
    int left;
    int width;
  };
  const Action actions[] = {
      {main_lblEndProcess, u"סיים תהליך", 6, 112},
      {main_lblJumpToPath, u"אתר קובץ", 126, 112},
      {main_cmdChecks, u"בדיקת פורטים", 262, 130},
      {main_cmdMemInfo, u"מידע על הזיכרון", 400, 146},
      {main_cmdAddRemove, u"הוספה/הסרה של תוכניות", 554, 188},
      {reporting.main_cmdRpt, u"שלח דוח", kPageWidth - 146, 140},
  };
  for (const Action& action : actions) {
    looks::Button(action.label, action.caption);
    action.label.Move(Px(action.left), Px(kActionsTop), Px(action.width), Px(32));
  }
  looks::LeadingButton(reporting.main_cmdRpt, u"שלח דוח");
}

void MonitorPage::DesignAdapters() {
  adapters.main_Frame1.Caption = Text(u" עקוב אחרי התקן ");
  adapters.main_Frame1.Border = true;
  adapters.main_Frame1.BackColour = looks::kPaper;
  adapters.main_Frame1.TextFont = looks::kSmall;
  adapters.main_Frame1.Move(Px(kInset), Px(kAdaptersTop), Px(kPageWidth - 2 * kInset), Px(60));
  adapters.main_cmbAdapters.Clear();
  adapters.main_cmbAdapters.TextFont = looks::kSmall;
  adapters.main_cmbAdapters.Move(Px(12), Px(21), Px(440), Px(28));
  looks::PlainText(adapters.main_lblCaptureState, u"", looks::kSmall, looks::kAlert);
  adapters.main_lblCaptureState.Move(Px(466), Px(25), Px(480), Px(22));
}

} // namespace quendra::shell
