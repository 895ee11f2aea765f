#include "platform/process/SystemErrors.h"
#include "platform/simulated/remote_access/DialParameters.h"
#include "platform/simulated/remote_access/SimulatedRemoteAccess.h"

namespace quendra::platform::simulated {

namespace {

bool IsEmpty(const char* text) { return !text || *text == '\0'; }

} // namespace

std::uint32_t SimulatedRemoteAccess::RasEnumEntriesA(const char* phoneBook, std::span<std::uint8_t> names,
                                                     std::uint32_t& bytes, std::uint32_t& count) {
  count = 0;
  if (const auto error = Enter("RasEnumEntriesA", phoneBook)) return error;
  RecordList list{names, bytes, count};
  if (!list.States(RasEntryName::kBytes)) return kRasInvalidSize;
  return list.Fill(RasEntryName::kBytes, book_.All().size(), [this](std::size_t i, auto record) {
    PutTextAt(record, RasEntryName::kName, RasEntryName::kNameBytes, book_.All()[i].name);
  });
}

std::uint32_t SimulatedRemoteAccess::RasDeleteEntryA(const char* phoneBook, const char* entryName) {
  const std::string name = entryName ? entryName : "";
  Record("RasDeleteEntryA", name);
  if (const auto error = Enter("RasDeleteEntryA", phoneBook)) return error;
  return book_.Remove(name) ? kRasSuccess : kRasCannotFindPhonebookEntry;
}

std::uint32_t SimulatedRemoteAccess::RasGetEntryPropertiesA(const char* phoneBook, const char* entryName,
                                                            std::span<std::uint8_t> entry,
                                                            std::uint32_t& bytes) {
  if (const auto error = Enter("RasGetEntryPropertiesA", phoneBook)) return error;
  std::vector<std::uint8_t> image(EntryBytes);
  if (!IsEmpty(entryName)) {
    const SimulatedEntry* found = book_.Find(entryName);
    if (!found) return kRasCannotFindPhonebookEntry;
    image = PropertiesImage(*found);
  }
  const std::size_t room = std::min<std::size_t>(bytes, entry.size());
  bytes = static_cast<std::uint32_t>(image.size());
  if (room < image.size()) return kRasBufferTooSmall;
  if (Little32(entry, 0) != EntryBytes) return kRasInvalidSize;
  PutLittle32(image, 0, EntryBytes);
  std::ranges::copy(image, entry.begin());
  return kRasSuccess;
}

std::uint32_t SimulatedRemoteAccess::RasSetEntryPropertiesA(const char* phoneBook, const char* entryName,
                                                            std::span<const std::uint8_t> entry) {
  Record("RasSetEntryPropertiesA", entryName ? entryName : "");
  if (const auto error = Enter("RasSetEntryPropertiesA", phoneBook)) return error;
  if (IsEmpty(entryName)) return kInvalidParameter;
  if (entry.size() < 4 || Little32(entry, 0) != EntryBytes) return kRasInvalidSize;
  if (entry.size() < EntryBytes) return kRasBufferInvalid;
  TakeProperties(book_.Made(entryName, EntryBytes), entry);
  return kRasSuccess;
}

std::uint32_t SimulatedRemoteAccess::ErrorOfParams(std::span<const std::uint8_t> params) const {
  if (params.size() < 4) return kRasBufferInvalid;
  const std::uint32_t size = Little32(params, 0);
  if (std::ranges::find(DialParamsSizes, size) == DialParamsSizes.end()) return kRasInvalidSize;
  return params.size() < size ? kRasBufferInvalid : kRasSuccess;
}

std::uint32_t SimulatedRemoteAccess::RasGetEntryDialParamsA(const char* phoneBook,
                                                            std::span<std::uint8_t> params,
                                                            bool& hasPassword) {
  hasPassword = false;
  if (const auto error = Enter("RasGetEntryDialParamsA", phoneBook)) return error;
  if (const auto error = ErrorOfParams(params)) return error;
  const SimulatedEntry* entry = book_.Find(EntryNameIn(params));
  if (!entry) return kRasCannotFindPhonebookEntry;
  PutDialParameters(*entry, params);
  hasPassword = !entry->password.empty();
  return kRasSuccess;
}

std::uint32_t SimulatedRemoteAccess::RasSetEntryDialParamsA(const char* phoneBook,
                                                            std::span<const std::uint8_t> params,
                                                            bool removePassword) {
  const auto wrong = ErrorOfParams(params);
  const std::string name = wrong ? "" : EntryNameIn(params);
  Record("RasSetEntryDialParamsA", name);
  if (const auto error = Enter("RasSetEntryDialParamsA", phoneBook)) return error;
  if (wrong) return wrong;
  SimulatedEntry* entry = book_.Find(name);
  if (!entry) return kRasCannotFindPhonebookEntry;
  TakeDialParameters(*entry, params);
  if (removePassword) entry->password.clear();
  return kRasSuccess;
}

std::uint32_t SimulatedRemoteAccess::RasEnumDevicesA(std::span<std::uint8_t> devices, std::uint32_t& bytes,
                                                     std::uint32_t& count) {
  count = 0;
  if (const auto error = Enter("RasEnumDevicesA")) return error;
  RecordList list{devices, bytes, count};
  if (!list.States(RasDeviceInfo::kBytes)) return kRasInvalidSize;
  return list.Fill(RasDeviceInfo::kBytes, Devices.size(), [this](std::size_t i, auto record) {
    PutTextAt(record, RasDeviceInfo::kType, RasDeviceInfo::kTypeBytes, Devices[i].type);
    PutTextAt(record, RasDeviceInfo::kName, RasDeviceInfo::kNameBytes, Devices[i].name);
  });
}

} // namespace quendra::platform::simulated
