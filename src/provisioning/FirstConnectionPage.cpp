#include "provisioning/FirstConnectionPage.h"

#include "foundation/Looks.h"
#include "provisioning/page/StepLooks.h"

namespace quendra::provisioning {

using foundation::Px;

namespace {

constexpr std::int16_t kNone = -1;

constexpr std::int16_t kPlainKeys = 0;
constexpr std::int16_t kSpecialKeys = -1;

// Places in the array of marks.
constexpr std::size_t kUsernameMark = 0;
constexpr std::size_t kPasswordMark = 1;
constexpr std::size_t kEmailUNMark = 2;

/// Around the panels of the steps, and above them the head of the page, whose link leaves them.
constexpr int kPanelInset = 6;
constexpr int kPanelTop = 52;

auto OnMove(std::function<void()> action) {
  return [action = std::move(action)](int, int, int, int) { action(); };
}

} // namespace

FirstConnectionPage::FirstConnectionPage(forms::PageWindow& window, const forms::PageRow& row,
                                         platform::KeyboardLayout& layout)
    : Page(window, row), frsCon_lblError(forms::MakeControls<forms::Label>(
                             u"frsCon_lblError",
                             [this](std::size_t mark) -> forms::Container& {
                               return mark == kEmailUNMark ? mail.frsCon_Frame2 : connection.frsCon_Frame1;
                             },
                             std::make_index_sequence<3>())),
      keys_(layout) {
  Start = [this] { PrepareFirstConnectionPage(); };
  Stop = [this] { CloseFirstConnectionPage(); };
  WireMenu();
  WireConnectionStep();
  WireMailStep();
}

void FirstConnectionPage::WireMenu() {
  frame.MouseMove = OnMove([this] { ClearMenuLines(); });
  menu.frsCon_lblCaption[0].Click = [this] { mail.frsCon_Frame2.Visible = true; };
  menu.frsCon_lblCaption[1].Click = [this] { connection.frsCon_Frame1.Visible = true; };
  for (forms::Label& hotSpot : menu.frsCon_lblCaption) OfferHand(hotSpot);
  frsCon_lblBack.Click = [this] { frsCon_lblBack_Click(); };
  OfferHand(frsCon_lblBack);
}

// The mouse has come over a row before it clicks there; a key has not, and its choice shall be seen as well.
void FirstConnectionPage::WireConnectionStep() {
  for (std::size_t i = 0; i < ConnectionPanel::kModems; ++i) {
    const auto row = static_cast<std::int16_t>(i);
    for (forms::Control* part : std::initializer_list<forms::Control*>{&connection.frsCon_imgModems[i],
                                                                       &connection.frsCon_lblModemBG[i],
                                                                       &connection.frsCon_lblModems[i]}) {
      part->Click = [this, row] {
        HoverModemRow(row);
        SelectModemRow(row);
      };
      part->MouseMove = OnMove([this, row] {
        this->window.ShowHandCursor();
        HoverModemRow(row);
      });
    }
  }
  connection.frsCon_Frame1.MouseMove = OnMove([this] {
    HideConnectionErrors();
    HoverModemRow(kNone);
  });
  for (forms::TextBox* field : {&connection.frsCon_txtUsername, &connection.frsCon_txtPassword}) {
    field->Change = [this] { UpdateCreateEnabled(); };
    field->GotFocus = [this] {
      HideConnectionErrors();
      HoverModemRow(SelectedModem);
    };
  }
  keys_.Watch(connection.frsCon_txtUsername, frsCon_lblError[kUsernameMark], kPlainKeys);
  keys_.Watch(connection.frsCon_txtPassword, frsCon_lblError[kPasswordMark], kSpecialKeys);
  connection.frsCon_cmdCreate.Click = [this] { CreateConnection(); };
  OfferHand(connection.frsCon_cmdCreate);
  OfferHand(connection.frsCon_Picture5);
}

void FirstConnectionPage::WireMailStep() {
  for (std::size_t i = 0; i < MailPanel::kTiles; ++i) {
    const auto row = static_cast<std::int16_t>(i);
    for (forms::Control* part :
         std::initializer_list<forms::Control*>{&mail.frsCon_imgMails[i], &mail.frsCon_lblMails[i]}) {
      part->Click = [this, row] {
        HoverMailRow(row);
        SelectMailRow(row);
      };
      part->MouseMove = OnMove([this, row] {
        this->window.ShowHandCursor();
        HoverMailRow(row);
      });
    }
    mail.frsCon_lblMailsBG[i].MouseMove = OnMove([this, row] { HoverMailRow(row); });
  }
  for (forms::Frame* ground : {&mail.frsCon_Frame2, &mail.Tiles})
    ground->MouseMove = OnMove([this] { HoverMailRow(kNone); });
  mail.frsCon_txtEmailUN.Change = [this] {
    mail.frsCon_cmdCreateEmail.Enabled = !mail.frsCon_txtEmailUN.Value().empty();
  };
  keys_.Watch(mail.frsCon_txtEmailUN, frsCon_lblError[kEmailUNMark], kPlainKeys);
  mail.frsCon_cmdCreateEmail.Click = [this] { CreateMailAccount(); };
  OfferHand(mail.frsCon_cmdCreateEmail);
  OfferHand(mail.frsCon_Picture12);
}

void FirstConnectionPage::OfferHand(forms::Control& control) {
  control.MouseMove = OnMove([this] { window.ShowHandCursor(); });
}

void FirstConnectionPage::Design() {
  const forms::Geometry page = frame.Position;
  steps::PageHead(frsCon_lblTitle, frsCon_lblBack, row.caption, page.width);
  menu.Design(page.width);
  const forms::Geometry panel{Px(kPanelInset), Px(kPanelTop), page.width - 2 * Px(kPanelInset),
                              page.height - Px(kPanelTop + kPanelInset)};
  mail.Design(panel);
  connection.Design(panel);
  steps::ErrorMark(frsCon_lblError[kUsernameMark], ConnectionPanel::kUsernameTop);
  steps::ErrorMark(frsCon_lblError[kPasswordMark], ConnectionPanel::kPasswordTop);
  steps::ErrorMark(frsCon_lblError[kEmailUNMark], MailPanel::kEmailUNTop);
  modems_.Selected = modems_.Hovered = mails_.Selected = mails_.Hovered = kNone;
}

// Nothing is painted: the rows keep the look of the last visit, and tiles stay once they are shown.
void FirstConnectionPage::PrepareFirstConnectionPage() {
  HideConnectionErrors();
  modems_.Selected = kNone;
  mails_.Selected = kNone;
  if (DetectMailClients) mail.PlaceTiles(DetectMailClients());
  frameFirstConnection.Visible = true;
}

void FirstConnectionPage::CloseFirstConnectionPage() { frameFirstConnection.Visible = false; }

void FirstConnectionPage::HideConnectionErrors() {
  frsCon_lblError[kUsernameMark].Visible = false;
  frsCon_lblError[kPasswordMark].Visible = false;
}

void FirstConnectionPage::HoverModemRow(std::int16_t row) {
  HideConnectionErrors();
  modems_.Hover(row);
}

void FirstConnectionPage::SelectModemRow(std::int16_t row) {
  HideConnectionErrors();
  modems_.Select(row);
  UpdateCreateEnabled();
}

void FirstConnectionPage::HoverMailRow(std::int16_t row) { mails_.Hover(row); }

void FirstConnectionPage::SelectMailRow(std::int16_t row) {
  frsCon_lblError[kEmailUNMark].Visible = false;
  mails_.Select(row);
}

void FirstConnectionPage::UpdateCreateEnabled() {
  connection.frsCon_cmdCreate.Enabled = SelectedModem > kNone &&
                                        !connection.frsCon_txtUsername.Value().empty() &&
                                        !connection.frsCon_txtPassword.Value().empty();
}

void FirstConnectionPage::frsCon_lblBack_Click() {
  if (connection.frsCon_Frame1.Visible())
    connection.frsCon_Frame1.Visible = false;
  else if (mail.frsCon_Frame2.Visible())
    mail.frsCon_Frame2.Visible = false;
  else
    CloseFirstConnectionPage();
}

} // namespace quendra::provisioning
