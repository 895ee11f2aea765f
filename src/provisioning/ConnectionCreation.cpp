#include "provisioning/ConnectionCreation.h"

#include "provisioning/Boxes.h"
#include "provisioning/EntryFields.h"

namespace quendra::provisioning {

namespace {

constexpr const char16_t* kOwnEntry = u"097";
constexpr const char16_t* kTemporaryEntry = u"tmp097";
constexpr const char16_t* kRealm = u"@097";
constexpr TextView kOtherRealm = u"@izelmar";
constexpr TextView kOtherRealmAsSent = u"@IZelmar";

/// The user name with the realm that the provider's server asks for. It comes in small letters.
Text WithRealm(const Text& userName) {
  if (userName.find(kOtherRealm) != Text::npos) return Replaced(userName, kOtherRealm, kOtherRealmAsSent);
  return userName.find(kRealm) == Text::npos ? userName + kRealm : userName;
}

} // namespace

void ConnectionCreation::CreateConnection() {
  for (forms::Control* mark : page_.frsCon_lblError) mark->Visible = false;
  page_.frsCon_cmdCreate.Enabled = false;
  MendTexts();
  AskOsVersion();
  if (WriteEntry())
    GoOnToMail();
  else
    TellFailure(boxes_, u"נכשל!");
  page_.frsCon_cmdCreate.Enabled = true;
}

// The password, too, is made small on purpose. A box that changes enables the button, as after typing.
void ConnectionCreation::MendTexts() {
  page_.frsCon_txtUsername.Value = Lowered(page_.frsCon_txtUsername.Value());
  page_.frsCon_txtPassword.Value = Lowered(page_.frsCon_txtPassword.Value());
  page_.frsCon_txtUsername.Value = WithRealm(page_.frsCon_txtUsername.Value());
  page_.frsCon_cmdCreate.Enabled = false;
}

// Nothing depends on the answer; a version that can't be read is told in a box.
void ConnectionCreation::AskOsVersion() {
  std::int32_t code = 0;
  Text version;
  Text build;
  dun_.GetOsVersion(code, version, build);
}

bool ConnectionCreation::WriteEntry() {
  RasEntryRecord record;
  ClearRasEntry(record);
  RasDialParamsRecord dialParams;
  const Modem* modem = FindModem(page_.SelectedModem);
  if (modem) Describe(*modem, record, dialParams);
  if (modem && modem->viaTemporaryEntry) return WriteByWayOfAnother(record, dialParams);
  return phoneBook_.Set(kOwnEntry, record, dialParams);
}

void ConnectionCreation::Describe(const Modem& modem, RasEntryRecord& record,
                                  RasDialParamsRecord& dialParams) {
  const Text deviceType = DeviceTypeOf(modem.kind);
  const Text deviceName = dun_.FindDeviceName(deviceType, kTrue16);
  FillEntry(record, modem.kind);
  dialParams.userName = page_.frsCon_txtUsername.Value();
  dialParams.password = page_.frsCon_txtPassword.Value();
  if (modem.kind == ConnectionKind::Vpn)
    vpnAdapter_.ConfigureVpnAdapter(page_.frsCon_cmdCreate.OwnerForm(), VpnAdapter::Steps::Silent);
  record.deviceName = deviceName;
  record.deviceType = deviceType;
}

// What the system made of the record is what the entry is made of. After a failure half way the temporary
// entry stays.
bool ConnectionCreation::WriteByWayOfAnother(const RasEntryRecord& record, RasDialParamsRecord& dialParams) {
  if (!phoneBook_.Set(kTemporaryEntry, record, dialParams)) return false;
  phoneBook_.Delete(kOwnEntry, kFalse16); // there may be none
  RasEntryRecord made;
  if (!phoneBook_.Get(kTemporaryEntry, made)) return false;
  RasDialParamsRecord madeParams = phoneBook_.DialParamsOf(kTemporaryEntry);
  made.options = kOptionsOfCopiedEntry;
  if (!phoneBook_.Set(kOwnEntry, made, madeParams)) return false;
  phoneBook_.Delete(kTemporaryEntry, kTrue16);
  dun_.HangUpAllConnections();
  return true;
}

void ConnectionCreation::GoOnToMail() {
  boxes_.MessageBox(u"החייגן נוצר בהצלחה.", forms::kInformation | forms::kHebrewBox, foundation::kTitle);
  const Text& userName = page_.frsCon_txtUsername.Value();
  page_.frsCon_txtEmailUN.Value = userName.substr(0, userName.find(u'@'));
  page_.frsCon_Frame1.Visible = false;
  page_.frsCon_Frame2.Visible = true;
}

} // namespace quendra::provisioning
