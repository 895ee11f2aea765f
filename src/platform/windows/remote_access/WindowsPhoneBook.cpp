#include "platform/windows/remote_access/WindowsPhoneBook.h"

#include "platform/process/SystemErrors.h"
#include "platform/unavailable/UnavailablePhoneBook.h"
#include "platform/windows/remote_access/RasEntryForms.h"
#include "platform/windows/remote_access/RasRecords.h"

namespace quendra::platform::windows {

namespace {

/// XP's own record, which every later system takes, too.
constexpr std::uint32_t kEntryBytes = sizeof(RASENTRYA);
constexpr int kMostTries = 4;

} // namespace

std::uint32_t WindowsPhoneBook::RasEnumEntriesA(const char* phoneBook, std::span<std::uint8_t> names,
                                                std::uint32_t& bytes, std::uint32_t& count) {
  const auto call = ras_.Calls().EnumEntries;
  if (!call) return unavailable::UnavailablePhoneBook().RasEnumEntriesA(phoneBook, names, bytes, count);
  return FillList<RASENTRYNAMEW>(kRasEntryName, names, bytes, count, RasEntryName::kBytes,
                                 [&](auto* first, DWORD* room, DWORD* records) {
                                   return call(nullptr, BookNamed(phoneBook), first, room, records);
                                 });
}

std::uint32_t WindowsPhoneBook::RasDeleteEntryA(const char* phoneBook, const char* entryName) {
  const auto call = ras_.Calls().DeleteEntry;
  if (!call) return unavailable::UnavailablePhoneBook().RasDeleteEntryA(phoneBook, entryName);
  return call(BookNamed(phoneBook), WideName(entryName));
}

std::uint32_t WindowsPhoneBook::RasGetEntryPropertiesA(const char* phoneBook, const char* entryName,
                                                       std::span<std::uint8_t> entry, std::uint32_t& bytes) {
  const auto call = ras_.Calls().GetEntryProperties;
  if (!call)
    return unavailable::UnavailablePhoneBook().RasGetEntryPropertiesA(phoneBook, entryName, entry, bytes);
  const bool holdsSize = entry.size() >= 4;
  if (!holdsSize && (!entryName || *entryName == '\0')) return TellEntryBytes(BookNamed(phoneBook), bytes);
  const std::uint32_t recordBytes = holdsSize ? Little32(entry, 0) : kEntryBytes;
  const std::uint32_t wideBytes = WideBytes(kRasEntry, recordBytes);
  if (wideBytes == 0) return kRasInvalidSize;
  std::vector<std::uint8_t> wide;
  const WideName name(entryName ? entryName : "");
  if (const auto error = ReadEntry(BookNamed(phoneBook), name, wideBytes, wide)) return error;
  const std::vector<std::uint8_t> found = NarrowEntryOf(wide, recordBytes);
  const std::size_t room = std::min<std::size_t>(bytes, entry.size());
  bytes = static_cast<std::uint32_t>(found.size());
  if (!holdsSize || room < found.size()) return kRasBufferTooSmall;
  std::ranges::copy(found, entry.begin());
  return kRasSuccess;
}

// The system tells it without a phone book, which may not have been made yet.
std::uint32_t WindowsPhoneBook::TellEntryBytes(const wchar_t* phoneBook, std::uint32_t& bytes) {
  DWORD room = 0;
  const std::uint32_t result =
      ras_.Calls().GetEntryProperties(phoneBook, L"", nullptr, &room, nullptr, nullptr);
  if (result == kRasBufferTooSmall) bytes = kEntryBytes;
  return result;
}

std::uint32_t WindowsPhoneBook::ReadEntry(const wchar_t* phoneBook, const wchar_t* entryName,
                                          std::uint32_t recordBytes, std::vector<std::uint8_t>& entry) {
  const auto call = ras_.Calls().GetEntryProperties;
  std::uint32_t result = kRasBufferTooSmall;
  DWORD room = recordBytes;
  // Another program may give it more numbers in between.
  for (int i = 0; result == kRasBufferTooSmall && i < kMostTries; ++i) {
    entry.assign(std::max<std::size_t>(room, recordBytes), 0);
    PutLittle32(entry, 0, recordBytes);
    room = static_cast<DWORD>(entry.size());
    result = call(phoneBook, entryName, reinterpret_cast<RASENTRYW*>(entry.data()), &room, nullptr, nullptr);
  }
  return result;
}

std::uint32_t WindowsPhoneBook::RasSetEntryPropertiesA(const char* phoneBook, const char* entryName,
                                                       std::span<const std::uint8_t> entry) {
  const auto call = ras_.Calls().SetEntryProperties;
  if (!call) return unavailable::UnavailablePhoneBook().RasSetEntryPropertiesA(phoneBook, entryName, entry);
  if (!entryName) return kInvalidParameter;
  if (const std::uint32_t error = ErrorOfRecord(kRasEntry, entry)) return error;
  std::vector<std::uint8_t> wide = WideEntryOf(entry);
  return call(BookNamed(phoneBook), WideName(entryName), reinterpret_cast<RASENTRYW*>(wide.data()),
              static_cast<DWORD>(wide.size()), nullptr, 0);
}

std::uint32_t WindowsPhoneBook::RasGetEntryDialParamsA(const char* phoneBook, std::span<std::uint8_t> params,
                                                       bool& hasPassword) {
  hasPassword = false;
  const auto call = ras_.Calls().GetEntryDialParams;
  if (!call)
    return unavailable::UnavailablePhoneBook().RasGetEntryDialParamsA(phoneBook, params, hasPassword);
  if (const std::uint32_t error = ErrorOfRecord(kRasDialParams, params)) return error;
  WideRecord image(kRasDialParams, params);
  BOOL isSaved = FALSE;
  const std::uint32_t result = call(BookNamed(phoneBook), image.As<RASDIALPARAMSW>(), &isSaved);
  if (result != kRasSuccess) return result;
  image.PutInto(params);
  hasPassword = isSaved != FALSE;
  return result;
}

std::uint32_t WindowsPhoneBook::RasSetEntryDialParamsA(const char* phoneBook,
                                                       std::span<const std::uint8_t> params,
                                                       bool removePassword) {
  const auto call = ras_.Calls().SetEntryDialParams;
  if (!call)
    return unavailable::UnavailablePhoneBook().RasSetEntryDialParamsA(phoneBook, params, removePassword);
  if (const std::uint32_t error = ErrorOfRecord(kRasDialParams, params)) return error;
  WideRecord image(kRasDialParams, params);
  return call(BookNamed(phoneBook), image.As<RASDIALPARAMSW>(), removePassword ? TRUE : FALSE);
}

std::uint32_t WindowsPhoneBook::RasEnumDevicesA(std::span<std::uint8_t> devices, std::uint32_t& bytes,
                                                std::uint32_t& count) {
  const auto call = ras_.Calls().EnumDevices;
  if (!call) return unavailable::UnavailablePhoneBook().RasEnumDevicesA(devices, bytes, count);
  return FillList<RASDEVINFOW>(kRasDevice, devices, bytes, count, RasDeviceInfo::kBytes, call);
}

} // namespace quendra::platform::windows
