#include "provisioning/remote_access/mdlDun.h"

#include "forms/Desktop.h"
#include "foundation/OsVersion.h"
#include "provisioning/remote_access/RecordFields.h"

namespace quendra::provisioning {

namespace {

constexpr std::int32_t kWindows95 = 95;
constexpr std::int32_t kWindows98 = 98;

} // namespace

RasEntryRecord& ClearRasEntry(RasEntryRecord& record) { return record = {}; }

bool mdlDun::HasNamedPhoneBooks() {
  std::int32_t code = 0;
  Text version;
  Text build;
  return GetOsVersion(code, version, build) != kFalse16 && code != kWindows95 && code != kWindows98;
}

std::string mdlDun::PhoneBookOf(Text& phoneBook) {
  EndInNul(phoneBook);
  if (!phoneBook.empty() && !HasNamedPhoneBooks()) phoneBook.clear();
  return ToCodePage(phoneBook);
}

Boolean16 mdlDun::GetOsVersion(std::int32_t& code, Text& version, Text& build) {
  return Trapping(u"GetOsVersion caused the following error while getting the OS version:", [&] {
    foundation::OsVersion read{.code = code};
    if (!foundation::ReadOsVersion(system_, desktop_, read)) return kFalse16;
    code = read.code;
    version = read.version;
    build = read.build;
    return kTrue16;
  });
}

void mdlDun::ShowExclamation(const Text& title, const Text& text) {
  desktop_.MessageBox(text, forms::kExclamation, title);
}

Boolean16 mdlDun::Trapping(const Text& words, const std::function<Boolean16()>& operation) {
  try {
    return operation();
  } catch (const Fault& fault) {
    ShowExclamation(u"  Error  -  " + fault.description, words + u"\r\rError Number = " +
                                                             DecimalText(fault.number) +
                                                             u"\rError Description = " + fault.description);
    return kFalse16;
  }
}

} // namespace quendra::provisioning
