#include "provisioning/page/ConnectionPanel.h"

#include "provisioning/page/StepLooks.h"

namespace quendra::provisioning {

using foundation::Px;

namespace {

constexpr int kRowsTop = 56;
constexpr int kRowHeight = 80;
constexpr int kRowGap = 6;
constexpr int kRowWidth = 520;
constexpr int kPictureWidth = 112;
constexpr int kPictureHeight = 72;

struct Modem {
  const char16_t* caption;
  const char* artwork;
};
constexpr std::array<Modem, ConnectionPanel::kModems> kModemTable{{
    {u"Samsung AHT E300", "modem_0"},
    {u"     Alcatel     510", "modem_1"},
    {u"Alcatel Speed Touch Home", "modem_2"},
    {u"ECI B-FoCUS +270/312", "modem_3"},
    {u" Aztech  E600", "modem_4"},
}};

} // namespace

void ConnectionPanel::Design(const forms::Geometry& place) {
  steps::StepFrame(frsCon_Frame1, place);
  steps::StepTitle(Title, u"פרטי החיבור");
  steps::StepField(UsernamePrompt, u"שם משתמש:", frsCon_txtUsername, kUsernameTop);
  steps::StepField(PasswordPrompt, u"סיסמה:", frsCon_txtPassword, kPasswordTop);
  frsCon_txtPassword.Masked = true;
  DesignModems();
  steps::StepButton(frsCon_Picture5, "create_connection", frsCon_cmdCreate, u"צור חיבור", place.height);
}

void ConnectionPanel::DesignModems() {
  steps::ChoicePrompt(ModemsPrompt, u"בחר את המודם שלך:");
  int top = kRowsTop;
  for (std::size_t row = 0; row < kModems; ++row) {
    forms::Label& ground = frsCon_lblModemBG[row];
    ground.MouseOnly = true;
    ground.Transparent = true;
    ground.BackColour = forms::kWhite;
    ground.Move(Px(steps::kChoiceLeft), Px(top), Px(kRowWidth), Px(kRowHeight));
    frsCon_imgModems[row].Contents = forms::Picture::Artwork(kModemTable[row].artwork);
    frsCon_imgModems[row].Move(Px(steps::kChoiceLeft + 8), Px(top + 4), Px(kPictureWidth),
                               Px(kPictureHeight));
    steps::PlainText(frsCon_lblModems[row], kModemTable[row].caption, {11, true, false}, steps::kForest);
    frsCon_lblModems[row].Move(Px(steps::kChoiceLeft + kPictureWidth + 20), Px(top + 4),
                               Px(kRowWidth - kPictureWidth - 28), Px(kRowHeight - 8));
    top += kRowHeight + kRowGap;
  }
}

} // namespace quendra::provisioning
