#include "platform/remote_access/PhoneBook.h"
#include "provisioning/remote_access/RasEntryImage.h"
#include "provisioning/remote_access/RecordFields.h"
#include "provisioning/remote_access/mdlDun.h"

namespace quendra::provisioning {

using platform::RasEntryName;

Boolean16 mdlDun::DeleteEntry(Text& entryName, Text& phoneBook, Boolean16 show) {
  EndNameInNul(entryName);
  const std::string book = PhoneBookOf(phoneBook);
  const std::uint32_t error = phoneBook_.RasDeleteEntryA(book.c_str(), ToCodePage(entryName).c_str());
  if (error == platform::kRasSuccess) return kTrue16;
  ReportRasError(error, u"RasDeleteEntry", show);
  return kFalse16;
}

Boolean16 mdlDun::EnumEntries(std::vector<Text>& names, std::int32_t& count, Text& phoneBook) {
  return Trapping(u"EnumEntries encountered the following error:",
                  [&] { return ListEntries(names, count, phoneBook); });
}

Boolean16 mdlDun::ListEntries(std::vector<Text>& names, std::int32_t& count, Text& phoneBook) {
  names.clear();
  count = 0;
  const std::string book = PhoneBookOf(phoneBook);
  Bytes first(RasEntryName::kBytes);
  PutLittle32(first, 0, RasEntryName::kBytes);
  std::uint32_t bytes = RasEntryName::kBytes;
  std::uint32_t found = 0;
  const std::uint32_t result = phoneBook_.RasEnumEntriesA(book.c_str(), first, bytes, found);
  if (result == platform::kRasSuccess) {
    // Also where there is exactly one entry, for which the first record was enough.
    ShowExclamation(u"  No Entries To List", u"There are no Dial-Up entries on this system.");
    return kFalse16;
  }
  if (result != platform::kRasBufferTooSmall) {
    ReportRasError(result, u"RasEnumEntries", kTrue16);
    return kFalse16;
  }
  Bytes block = RecordBlock(bytes);
  if (block.size() < first.size()) throw Fault(Fault::kSubscript);
  std::ranges::copy(first, block.begin());
  ListAll(std::move(block), book, names);
  count = static_cast<std::int32_t>(names.size());
  return kTrue16;
}

void mdlDun::ListAll(Bytes block, const std::string& phoneBook, std::vector<Text>& names) {
  auto bytes = static_cast<std::uint32_t>(block.size());
  std::uint32_t count = 0;
  if (const auto error = phoneBook_.RasEnumEntriesA(phoneBook.c_str(), block, bytes, count)) {
    ReportRasError(error, u"RasEnumEntries", kTrue16);
    return;
  }
  std::span<const std::uint8_t> records(block);
  for (; names.size() < count && records.size() >= RasEntryName::kBytes;
       records = records.subspan(RasEntryName::kBytes))
    names.push_back(FieldText(records.subspan(RasEntryName::kName, RasEntryName::kNameBytes)));
}

std::uint32_t mdlDun::EntryRecordBytes(std::uint32_t& bytes) {
  bytes = 0;
  return phoneBook_.RasGetEntryPropertiesA(nullptr, nullptr, {}, bytes);
}

Boolean16 mdlDun::GetEntryProperties(RasEntryRecord& record, Text& entryName, Text& phoneBook) {
  return Trapping(u"GetEntryProperties encountered the following error:",
                  [&] { return ReadEntry(record, entryName, phoneBook); });
}

Boolean16 mdlDun::ReadEntry(RasEntryRecord& record, Text& entryName, Text& phoneBook) {
  EndNameInNul(entryName);
  const std::string book = PhoneBookOf(phoneBook);
  const std::string name = ToCodePage(entryName);
  ClearRasEntry(record);
  std::uint32_t recordBytes = 0;
  EntryRecordBytes(recordBytes);
  std::uint32_t bytes = 0;
  std::uint32_t result = phoneBook_.RasGetEntryPropertiesA(book.c_str(), name.c_str(), {}, bytes);
  if (result != platform::kRasBufferTooSmall) {
    ReportRasError(result, u"RasGetEntryProperties", kTrue16);
    return kFalse16;
  }
  Bytes image = RecordBlock(bytes);
  if (image.size() < sizeof recordBytes) throw Fault(Fault::kSubscript);
  PutLittle32(image, 0, recordBytes);
  result = phoneBook_.RasGetEntryPropertiesA(book.c_str(), name.c_str(), image, bytes);
  if (result != platform::kRasSuccess) {
    ReportRasError(result, u"RasGetEntryProperties", kTrue16);
    return kFalse16;
  }
  TakeRasEntryImage(record, image, recordBytes);
  return kTrue16;
}

Boolean16 mdlDun::SetEntryProperties(Text& entryName, const RasEntryRecord& record,
                                     RasDialParamsRecord& dialParams, Text& phoneBook) {
  return Trapping(u"SetEntryProperties encountered the following error:",
                  [&] { return WriteEntry(entryName, record, dialParams, phoneBook); });
}

Boolean16 mdlDun::WriteEntry(const Text& entryName, const RasEntryRecord& record,
                             RasDialParamsRecord& dialParams, Text& phoneBook) {
  const std::string book = PhoneBookOf(phoneBook);
  std::uint32_t recordBytes = 0;
  if (const auto result = EntryRecordBytes(recordBytes); result != platform::kRasBufferTooSmall) {
    ReportRasError(result, u"RasGetEntryProperties", kTrue16);
    return kFalse16;
  }
  const Bytes image = RasEntryImageOf(record, recordBytes);
  const auto error = phoneBook_.RasSetEntryPropertiesA(book.c_str(), ToCodePage(entryName).c_str(), image);
  if (error != platform::kRasSuccess) {
    ReportRasError(error, u"RasSetEntryProperties", kTrue16);
    return kFalse16;
  }
  return SaveDialParams(entryName, dialParams);
}

} // namespace quendra::provisioning
