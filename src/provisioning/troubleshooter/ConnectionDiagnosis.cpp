#include "provisioning/troubleshooter/ConnectionDiagnosis.h"

#include "provisioning/Boxes.h"

namespace quendra::provisioning {

namespace {

constexpr const char16_t* kTestEntry = u"097tmp";
constexpr const char16_t* kTestUserName = u"1@1";

Text ErrorLine(std::int32_t error) { return u"שגיאה: " + DecimalText(error); }

} // namespace

bool ConnectionDiagnosis::IsTestEntry() const { return CurrentDialEntry == kTestEntry; }

void ConnectionDiagnosis::DiagnoseConnectionError(std::int32_t error) {
  const bool noAnswer = error == platform::kRasNoAnswer;
  const bool refused = error == platform::kRasAuthenticationFailure;
  if (IsTestEntry()) {
    if (noAnswer || refused) return ExchangeUnreachable(error);
    return Finish();
  }
  if (refused) return Finish(TestLogin());
  if (noAnswer || error == platform::kRasPortNotAvailable)
    CheckModemLine(error);
  else
    ReferToSupport(error);
  Finish();
}

void ConnectionDiagnosis::ExchangeUnreachable(std::int32_t error) {
  form_.Diagnose(u"לא מצליח להתחבר למרכזיה של \"זלמר\" - צלצל 1-800-000-000");
  form_.Append(ErrorLine(error));
  dun_.HangUpActive(kFalse16);
  phoneBook_.Delete(kTestEntry, kTrue16);
}

void ConnectionDiagnosis::CheckModemLine(std::int32_t error) {
  form_.Append(ErrorLine(error) + u" - מטפל...");
  dun_.HangUpActive(kFalse16);
  RasEntryRecord record;
  if (!phoneBook_.Get(CurrentDialEntry, record)) return TellFailure(boxes_, u"שגיאה!");
  if (!modemLineCheck_.ModemAnswers(record.deviceName))
    form_.Diagnose(u"נראה שהמודם לא מתקשר עם המחשב - בודק חיבורים...");
}

// The connection that failed isn't hung up: after a real failure the test's dial finds it open.
Text ConnectionDiagnosis::TestLogin() {
  RasEntryRecord record;
  if (!phoneBook_.Get(CurrentDialEntry, record)) {
    TellFailure(boxes_, u"שגיאה!");
    return {};
  }
  RasDialParamsRecord dialParams = phoneBook_.DialParamsOf(CurrentDialEntry);
  dialParams.userName = kTestUserName;
  if (!phoneBook_.Set(kTestEntry, record, dialParams)) {
    TellFailure(boxes_, u"שגיאה!");
    return {};
  }
  Text entryBefore = CurrentDialEntry;
  form_.Append(u"מנסה חיבור לזלמר...");
  Text entry = kTestEntry;
  Text phoneNumber;
  Text userName;
  Text password;
  dun_.DialEntry(kTrue16, entry, phoneNumber, userName, password, kNoWindow);
  return entryBefore;
}

void ConnectionDiagnosis::ReferToSupport(std::int32_t error) {
  form_.Append(ErrorLine(error) + u" - כרגע לא בערכת התקלות המטופלות - פנה לתומך...");
}

void ConnectionDiagnosis::Finish(const Text& entryBefore) {
  if (IsTestEntry()) {
    dun_.HangUpActive(kFalse16);
    phoneBook_.Delete(kTestEntry, kTrue16);
    CurrentDialEntry = entryBefore;
  } else {
    CurrentDialEntry.clear();
    dun_.UnhookDialEvents(dun_.HookedWindow);
    dun_.HangUpActive(kFalse16);
  }
  form_.cmdCheck.Enabled = true;
}

} // namespace quendra::provisioning
