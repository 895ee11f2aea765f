#include "platform/windows/remote_access/WindowsPhoneBook.h"

#include "platform/process/SystemErrors.h"
#include "platform/unavailable/UnavailablePhoneBook.h"
#include "platform/windows/remote_access/RasRecords.h"

namespace quendra::platform::windows {

namespace {

/// Alternate numbers that lie outside the image are none: the system would look for them there.
void DropOffsetBeyond(std::span<std::uint8_t> entry) {
  if (entry.size() < RasEntry::kAlternateOffset + 4) return;
  if (Little32(entry, RasEntry::kAlternateOffset) >= entry.size())
    PutLittle32(entry, RasEntry::kAlternateOffset, 0);
}

} // namespace

std::uint32_t WindowsPhoneBook::RasEnumEntriesA(const char* phoneBook, std::span<std::uint8_t> names,
                                                std::uint32_t& bytes, std::uint32_t& count) {
  const auto call = ras_.Calls().EnumEntries;
  if (!call) return unavailable::UnavailablePhoneBook().RasEnumEntriesA(phoneBook, names, bytes, count);
  return FillList<RASENTRYNAMEA>(names, bytes, count, RasEntryName::kBytes,
                                 [&](auto* first, DWORD* room, DWORD* records) {
                                   return call(nullptr, BookNamed(phoneBook), first, room, records);
                                 });
}

std::uint32_t WindowsPhoneBook::RasDeleteEntryA(const char* phoneBook, const char* entryName) {
  const auto call = ras_.Calls().DeleteEntry;
  if (!call) return unavailable::UnavailablePhoneBook().RasDeleteEntryA(phoneBook, entryName);
  return call(BookNamed(phoneBook), entryName);
}

std::uint32_t WindowsPhoneBook::RasGetEntryPropertiesA(const char* phoneBook, const char* entryName,
                                                       std::span<std::uint8_t> entry, std::uint32_t& bytes) {
  const auto call = ras_.Calls().GetEntryProperties;
  if (!call)
    return unavailable::UnavailablePhoneBook().RasGetEntryPropertiesA(phoneBook, entryName, entry, bytes);
  const bool holdsSize = entry.size() >= 4;
  DWORD room = holdsSize ? static_cast<DWORD>(std::min<std::size_t>(bytes, entry.size())) : 0;
  const std::uint32_t result =
      call(BookNamed(phoneBook), entryName ? entryName : "",
           holdsSize ? reinterpret_cast<RASENTRYA*>(entry.data()) : nullptr, &room, nullptr, nullptr);
  bytes = room;
  return result;
}

std::uint32_t WindowsPhoneBook::RasSetEntryPropertiesA(const char* phoneBook, const char* entryName,
                                                       std::span<const std::uint8_t> entry) {
  const auto call = ras_.Calls().SetEntryProperties;
  if (!call) return unavailable::UnavailablePhoneBook().RasSetEntryPropertiesA(phoneBook, entryName, entry);
  if (!entryName) return kInvalidParameter;
  if (const std::uint32_t error = ErrorOfRecord(entry)) return error;
  RecordCopy image(entry);
  DropOffsetBeyond(image.Bytes());
  return call(BookNamed(phoneBook), entryName, image.As<RASENTRYA>(), static_cast<DWORD>(entry.size()),
              nullptr, 0);
}

std::uint32_t WindowsPhoneBook::RasGetEntryDialParamsA(const char* phoneBook, std::span<std::uint8_t> params,
                                                       bool& hasPassword) {
  hasPassword = false;
  const auto call = ras_.Calls().GetEntryDialParams;
  if (!call)
    return unavailable::UnavailablePhoneBook().RasGetEntryDialParamsA(phoneBook, params, hasPassword);
  if (const std::uint32_t error = ErrorOfRecord(params)) return error;
  RecordCopy image(params);
  BOOL isSaved = FALSE;
  const std::uint32_t result = call(BookNamed(phoneBook), image.As<RASDIALPARAMSA>(), &isSaved);
  if (result != kRasSuccess) return result;
  std::ranges::copy(image.Bytes(), params.begin());
  hasPassword = isSaved != FALSE;
  return result;
}

std::uint32_t WindowsPhoneBook::RasSetEntryDialParamsA(const char* phoneBook,
                                                       std::span<const std::uint8_t> params,
                                                       bool removePassword) {
  const auto call = ras_.Calls().SetEntryDialParams;
  if (!call)
    return unavailable::UnavailablePhoneBook().RasSetEntryDialParamsA(phoneBook, params, removePassword);
  if (const std::uint32_t error = ErrorOfRecord(params)) return error;
  RecordCopy image(params);
  return call(BookNamed(phoneBook), image.As<RASDIALPARAMSA>(), removePassword ? TRUE : FALSE);
}

std::uint32_t WindowsPhoneBook::RasEnumDevicesA(std::span<std::uint8_t> devices, std::uint32_t& bytes,
                                                std::uint32_t& count) {
  const auto call = ras_.Calls().EnumDevices;
  if (!call) return unavailable::UnavailablePhoneBook().RasEnumDevicesA(devices, bytes, count);
  return FillList<RASDEVINFOA>(devices, bytes, count, RasDeviceInfo::kBytes, call);
}

} // namespace quendra::platform::windows
