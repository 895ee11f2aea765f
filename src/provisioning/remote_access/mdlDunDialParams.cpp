#include "platform/remote_access/PhoneBook.h"
#include "provisioning/remote_access/RasDialParamsImage.h"
#include "provisioning/remote_access/mdlDun.h"

namespace quendra::provisioning {

// A blank ends each of the texts: what follows it isn't dialled with.
Boolean16 mdlDun::SaveDialParams(const Text& entryName, RasDialParamsRecord& dialParams) {
  dialParams.entryName = entryName;
  for (Text* text :
       {&dialParams.entryName, &dialParams.userName, &dialParams.password, &dialParams.phoneNumber})
    *text = Replaced(*text, u" ", TextView(u"\0", 1));
  dialParams.size = platform::RasDialParams::kBytes;
  Bytes image;
  if (DialParamsToBytes(dialParams, image) != kTrue16) return kFalse16;
  Text noPhoneBook;
  const std::uint32_t error = SetDialParamsBytes(noPhoneBook, image, kFalse16);
  if (error == platform::kRasSuccess) return kTrue16;
  ReportRasError(error, u"SetEntryDialParams", kTrue16);
  return kFalse16;
}

std::uint32_t mdlDun::GetDialParamsBytes(std::vector<std::uint8_t>& image, Text& phoneBook, Text& entryName,
                                         Boolean16& hasPassword) {
  const std::string book = ToCodePage(phoneBook);
  std::uint32_t result = platform::kRasSuccess;
  for (const std::uint32_t bytes : kRasDialParamsSizes) {
    image = EmptyRasDialParams(bytes, entryName);
    bool has = false;
    result = phoneBook_.RasGetEntryDialParamsA(book.c_str(), image, has);
    hasPassword = has ? kTrue16 : kFalse16;
    if (result == platform::kRasSuccess) break;
  }
  return result;
}

std::uint32_t mdlDun::SetDialParamsBytes(Text& phoneBook, const std::vector<std::uint8_t>& image,
                                         Boolean16 removePassword) {
  return phoneBook_.RasSetEntryDialParamsA(ToCodePage(phoneBook).c_str(), image, removePassword != kFalse16);
}

Boolean16 mdlDun::DialParamsFromBytes(const std::vector<std::uint8_t>& image, RasDialParamsRecord& record) {
  return Trapping(u"DialParamsFromBytes encountered the following error:",
                  [&] { return TakeRasDialParams(record, image) ? kTrue16 : kFalse16; });
}

// No entry has an empty name: a system that misses it knows the size.
bool mdlDun::AcceptsDialParamsOf(std::uint32_t bytes) {
  Bytes image = EmptyRasDialParams(bytes, {});
  bool hasPassword = false;
  return phoneBook_.RasGetEntryDialParamsA(nullptr, image, hasPassword) ==
         platform::kRasCannotFindPhonebookEntry;
}

Boolean16 mdlDun::DialParamsToBytes(const RasDialParamsRecord& record, std::vector<std::uint8_t>& image) {
  return Trapping(u"DialParamsToBytes encountered the following error:", [&] {
    for (const std::uint32_t bytes : kRasDialParamsSizes) {
      if (!AcceptsDialParamsOf(bytes)) continue;
      image.assign(bytes, 0);
      PutRasDialParams(record, image);
      return kTrue16;
    }
    return kFalse16;
  });
}

} // namespace quendra::provisioning
