#include "shell/Looks.h"
#include "shell/MenuLayout.h"
#include "shell/Twips.h"
#include "shell/frmMenu.h"

namespace quendra::shell {

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
  looks::Text(meter.caption, caption, looks::kBody, looks::kQuiet);
  meter.caption.Align = forms::Alignment::Trailing;
  meter.caption.Move(Px(left), Px(14), Px(70), Px(22));
  looks::Text(meter.figure, u"0.0", looks::kFigure, looks::kForest);
  meter.figure.Align = forms::Alignment::Centre;
  meter.figure.Move(Px(left + 72), Px(8), Px(116), Px(30));
  looks::Text(meter.unit, u"ק\"ב לשנייה", looks::kSmall, looks::kQuiet);
  meter.unit.Move(Px(left + 190), Px(15), Px(76), Px(20));
}

} // namespace

void frmMenu::DesignMonitorPage() {
  looks::Text(main_Label4, u"תהליכים פעילים:", looks::kHeading, looks::kForest);
  main_Label4.Move(Px(16), Px(8), Px(320), Px(32));
  DesignMeters();
  DesignTable();
  DesignActions();
  DesignAdapters();
}

void frmMenu::DesignMeters() {
  Place({main_Label2, main_lblUpload, main_lblUploadUnit}, u"העלאה:", kPageWidth - 556);
  Place({main_Label3, main_lblDownload, main_lblDownloadUnit}, u"הורדה:", kPageWidth - 280);
}

void frmMenu::DesignTable() {
  main_ListView1.Clear();
  main_ListView1.ClearColumns();
  main_ListView1.SmallIcons = &main_ImList;
  main_ListView1.HeaderIcons = &main_headersIL;
  main_ListView1.TextFont = looks::kSmall;
  main_ListView1.Move(Px(kInset), Px(kTableTop), Px(kPageWidth - 2 * kInset), Px(kTableHeight));
  main_ImList.Clear();
  main_ImList.Add(forms::Picture::Artwork("default_process"));
  main_headersIL.Clear();
  main_headersIL.Add(forms::Picture::Artwork("header_upload"));
  main_headersIL.Add(forms::Picture::Artwork("header_download"));
  main_Pic.Visible = false;
  main_Pic.ScaleMode = 3;
  main_Pic.BackColour = forms::kWhite;
  main_Pic.Move(0, 0, Px(32), Px(32));
}

void frmMenu::DesignActions() {
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
      {main_cmdRpt, u"שלח דוח", kPageWidth - 146, 140},
  };
  for (const Action& action : actions) {
    looks::Button(action.label, action.caption);
    action.label.Move(Px(action.left), Px(kActionsTop), Px(action.width), Px(32));
  }
  looks::LeadingButton(main_cmdRpt, u"שלח דוח");
}

void frmMenu::DesignAdapters() {
  main_Frame1.Caption = Text(u" עקוב אחרי התקן ");
  main_Frame1.Border = true;
  main_Frame1.BackColour = looks::kPaper;
  main_Frame1.TextFont = looks::kSmall;
  main_Frame1.Move(Px(kInset), Px(kAdaptersTop), Px(kPageWidth - 2 * kInset), Px(60));
  main_cmbAdapters.Clear();
  main_cmbAdapters.TextFont = looks::kSmall;
  main_cmbAdapters.Move(Px(12), Px(21), Px(440), Px(28));
  looks::Text(main_lblCaptureState, u"", looks::kSmall, looks::kAlert);
  main_lblCaptureState.Move(Px(466), Px(25), Px(480), Px(22));
}

} // namespace quendra::shell
