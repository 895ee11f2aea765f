#include "mail/mdlEmail.h"

#include "forms/MessageLoop.h"
#include "foundation/Wording.h"
#include "mail/ExpressAccount.h"
#include "mail/OutlookProfile.h"

namespace quendra::mail {

namespace {

constexpr int kAnsweredYes = 6;
constexpr std::int32_t kNoSuchProgram = -1;
constexpr TextView kRealm = u"@097";

} // namespace

void mdlEmail::CreateMailAccount() {
  if (!MayGoOn()) return;
  const std::int32_t result = CreateChosen();
  if (result == 0)
    Tell(u"חשבון דואר אלקטרוני נוצר בהצלחה.", forms::kInformation);
  else
    Tell(u"בעיה ביצירת חשבון הדואר.\r\n מס' שגיאה: " + DecimalText(result), forms::kCritical);
}

bool mdlEmail::MayGoOn() {
  if (form_.SelectedMail < 0) {
    Tell(u"יש לבחור תוכנת דואר להגדרה!", forms::kCritical);
    return false;
  }
  if (form_.frsCon_txtEmailUN.Value().empty()) {
    Tell(u"יש לתת שם משתמש!", forms::kCritical);
    return false;
  }
  MendUserName();
  // The box has the OK button alone, so nobody gets past it.
  return IsNameOfConnection() ||
         Tell(u"שם המשתמש בתוכנת הדואר יהיה שונה מזה שבחייגן!", forms::kCritical) == kAnsweredYes;
}

void mdlEmail::MendUserName() {
  const TextView typed = form_.frsCon_txtEmailUN.Value();
  form_.frsCon_txtEmailUN.Value = Text(Trimmed(Lowered(typed.substr(0, typed.find(u'@')))));
}

bool mdlEmail::IsNameOfConnection() const {
  const Text& connection = form_.frsCon_txtUsername.Value();
  return connection.empty() || Replaced(connection, kRealm, u"") == form_.frsCon_txtEmailUN.Value();
}

std::int32_t mdlEmail::CreateChosen() {
  const Text& userName = form_.frsCon_txtEmailUN.Value();
  const Text& fullName = form_.frsCon_txtFullName.Value();
  switch (form_.SelectedMail) {
  case kOutlookExpress: return express_.CreateExpressAccount(userName, fullName);
  case kOutlookXp:
  case kOutlook2000:
  case kOutlook2003: return outlook_.CreateOutlookProfile(userName, fullName);
  default: return kNoSuchProgram;
  }
}

int mdlEmail::Tell(const Text& text, int icon) {
  return loop_.MessageBox(text, icon | forms::kHebrewBox, foundation::kTitle);
}

} // namespace quendra::mail
