#include "provisioning/OwnPhoneBook.h"

namespace quendra::provisioning {

bool OwnPhoneBook::Get(Text name, RasEntryRecord& record) {
  Text own;
  return dun_.GetEntryProperties(record, name, own) != kFalse16;
}

bool OwnPhoneBook::Set(Text name, const RasEntryRecord& record, RasDialParamsRecord& dialParams) {
  Text own;
  return dun_.SetEntryProperties(name, record, dialParams, own) != kFalse16;
}

void OwnPhoneBook::Delete(Text name, Boolean16 show) {
  Text own;
  dun_.DeleteEntry(name, own, show);
}

RasDialParamsRecord OwnPhoneBook::DialParamsOf(Text name) {
  Text own;
  std::vector<std::uint8_t> image;
  Boolean16 hasPassword = kFalse16;
  RasDialParamsRecord dialParams;
  dun_.GetDialParamsBytes(image, own, name, hasPassword);
  dun_.DialParamsFromBytes(image, dialParams);
  return dialParams;
}

} // namespace quendra::provisioning
