// A rasapi32.dll for tests on systems without remote access, with the record sizes of Windows XP: a phone
// book, the devices "pppoe" and "vpn", and dials by scripts (RasDials.h). Its errors are those that the calls
// are published with. The calls themselves stand in RasWide.cpp.

#include "platform/linux/remote_access/RasErrorTexts.h"
#include "platform/process/SystemErrors.h"
#include "platform/remote_access/RemoteAccessNumbers.h"
#include "runtime/ByteFields.h"
#include "standins/windows/RasDials.h"
#include "standins/windows/RasNarrow.h"
#include "standins/windows/RasPhoneBook.h"

#include <algorithm>
#include <array>
#include <functional>
#include <utility>

namespace quendra::standins {

namespace {

using namespace platform;
using Image = RasPhoneBook::Image;

constexpr std::uint32_t kCannotOpenPhoneBook = 621;
constexpr std::uint32_t kInsufficientBuffer = 122;

constexpr std::array<const char*, 2> kDevices{"pppoe", "vpn"};
constexpr std::array kDialParamsSizes{RasDialParams::kBytes, RasDialParams::kBytesWithoutNumbers,
                                      RasDialParams::kBytesOfShortNames};
constexpr std::array kConnectionSizes{
    std::uint32_t{sizeof(RASCONNA)}, RasConnectionRecord::kBytes, RasConnectionRecord::kBytesWithoutGuid,
    RasConnectionRecord::kBytesWithoutPhoneBook, RasConnectionRecord::kBytesOfShortNames};
constexpr std::uint32_t kEntryBytes = sizeof(RASENTRYA);
constexpr std::array kEntrySizes{kEntryBytes, RasEntry::kBytes, RasEntry::kBytesWithoutEntryType,
                                 RasEntry::kBytesWithoutSubEntries};
constexpr std::array kNameSizes{std::uint32_t{sizeof(RASENTRYNAMEA)}, RasEntryName::kBytes};

template <typename Sizes> bool IsOneOf(const Sizes& sizes, DWORD size) {
  return std::ranges::find(sizes, size) != sizes.end();
}

RasDials& Dials() {
  static RasDials dials;
  return dials;
}

/// A named book is another's, and there is none: not even one without letters.
bool IsOwnBook(const char* name) { return !name; }

DWORD Written(bool succeeded) { return succeeded ? DWORD{kRasSuccess} : DWORD{kAccessDenied}; }

template <typename Record> std::span<std::uint8_t> BytesOf(Record* record, std::size_t size) {
  return {reinterpret_cast<std::uint8_t*>(record), size};
}

void PutText(std::span<std::uint8_t> record, std::size_t at, std::size_t width, const std::string& text) {
  const auto field = record.subspan(at, width);
  std::ranges::fill(field, std::uint8_t{0});
  std::copy_n(text.begin(), std::min(text.size(), width - 1), field.begin());
}

std::string TextIn(std::span<const std::uint8_t> record, std::size_t at, std::size_t width) {
  const auto field = record.subspan(at, width);
  return {field.begin(), std::ranges::find(field, std::uint8_t{0})};
}

/// What every listing does: tells what is needed, and fills the records where there is room.
template <typename Record>
DWORD List(Record* first, DWORD size, DWORD* bytes, DWORD* count, std::size_t records,
           const std::function<void(std::size_t, std::span<std::uint8_t>)>& put) {
  const DWORD needed = static_cast<DWORD>(records) * size;
  const DWORD room = std::exchange(*bytes, needed);
  if (count) *count = static_cast<DWORD>(records);
  if (needed > room) return kRasBufferTooSmall;
  for (std::size_t i = 0; i < records; ++i) {
    const auto record = BytesOf(reinterpret_cast<std::uint8_t*>(first) + i * size, size);
    std::ranges::fill(record, std::uint8_t{0});
    PutLittle32(record, 0, size);
    put(i, record);
  }
  return kRasSuccess;
}

// RASDIALPARAMS.

std::size_t NameBytes(DWORD size) {
  return size == RasDialParams::kBytesOfShortNames ? RasDialParams::kShortEntryNameBytes
                                                   : RasDialParams::kEntryNameBytes;
}

constexpr std::size_t kTextBytes = RasDialParams::kPhoneNumberBytes + RasDialParams::kCallbackNumberBytes +
                                   RasDialParams::kUserNameBytes + RasDialParams::kPasswordBytes +
                                   RasDialParams::kDomainBytes;
constexpr std::size_t kPasswordInTexts =
    RasDialParams::kPhoneNumberBytes + RasDialParams::kCallbackNumberBytes + RasDialParams::kUserNameBytes;

/// All texts behind the name, which stand alike in every size.
std::span<std::uint8_t> TextsOf(std::span<std::uint8_t> params) {
  return params.subspan(RasDialParams::kEntryName + NameBytes(Little32(params, 0)), kTextBytes);
}

DWORD ErrorOfParams(const RASDIALPARAMSA* params) {
  if (!params) return kInvalidParameter;
  return IsOneOf(kDialParamsSizes, params->dwSize) ? kRasSuccess : kRasInvalidSize;
}

std::string EntryNameIn(const RASDIALPARAMSA* params) {
  return TextIn(BytesOf(const_cast<RASDIALPARAMSA*>(params), params->dwSize), RasDialParams::kEntryName,
                NameBytes(params->dwSize));
}

bool HasPassword(Image& saved) {
  PutLittle32(saved, 0, RasDialParams::kBytes);
  return TextsOf(saved)[kPasswordInTexts] != 0;
}

// RASENTRY.

Image AlternateNumbersIn(const RASENTRYA* entry, DWORD bytes) {
  if (entry->dwAlternateOffset == 0 || entry->dwAlternateOffset >= bytes) return {};
  const auto* const all = reinterpret_cast<const std::uint8_t*>(entry);
  Image numbers(all + entry->dwAlternateOffset, all + bytes);
  numbers.insert(numbers.end(), 2, 0);
  const std::array<std::uint8_t, 2> end{};
  const auto found = std::ranges::search(numbers, end);
  numbers.erase(found.end(), numbers.end());
  return numbers;
}

DWORD FillEntry(RASENTRYA* entry, DWORD* bytes, const Image& properties, const Image& alternateNumbers) {
  const bool isAskedForSize = !entry || *bytes < 4;
  const DWORD size = isAskedForSize ? kEntryBytes : entry->dwSize;
  const DWORD needed = size + static_cast<DWORD>(alternateNumbers.size());
  const DWORD room = std::exchange(*bytes, needed);
  if (isAskedForSize || room < needed) return kRasBufferTooSmall;
  if (!IsOneOf(kEntrySizes, size)) return kRasInvalidSize;
  const auto image = BytesOf(entry, needed);
  std::copy_n(properties.begin(), size, image.begin());
  std::ranges::copy(alternateNumbers, image.begin() + static_cast<std::ptrdiff_t>(size));
  PutLittle32(image, 0, size);
  PutLittle32(image, RasEntry::kAlternateOffset, alternateNumbers.empty() ? 0 : size);
  return kRasSuccess;
}

Image WholeProperties(const RasPhoneBook& book, const std::string& name) {
  Image properties = book.Properties(name);
  properties.resize(kEntryBytes);
  return properties;
}

void PutConnection(std::uint32_t handle, const RasDials::Connection& connection,
                   std::span<std::uint8_t> record) {
  using Record = RasConnectionRecord;
  const bool isShort = record.size() == Record::kBytesOfShortNames;
  PutLittle32(record, Record::kHandle, handle);
  PutText(record, Record::kEntryName, isShort ? Record::kShortEntryNameBytes : Record::kEntryNameBytes,
          connection.entryName);
  if (isShort) return;
  PutText(record, Record::kDeviceType, Record::kDeviceTypeBytes, connection.deviceType);
  PutText(record, Record::kDeviceName, Record::kDeviceNameBytes, connection.deviceName);
}

RasDials::Shared ConnectionBy(const std::string& entryName) {
  const Image properties = WholeProperties(RasPhoneBook(), entryName);
  auto connection = std::make_shared<RasDials::Connection>();
  connection->entryName = entryName;
  connection->deviceType = TextIn(properties, RasEntry::kDeviceType, RasEntry::kDeviceTypeBytes);
  connection->deviceName = TextIn(properties, RasEntry::kDeviceName, RasEntry::kDeviceNameBytes);
  return connection;
}

} // namespace

DWORD EnumEntries(const char* phoneBook, RASENTRYNAMEA* first, DWORD* bytes, DWORD* count) {
  if (!bytes || !count) return kInvalidParameter;
  if (!IsOwnBook(phoneBook)) return kCannotOpenPhoneBook;
  const DWORD size = first ? first->dwSize : DWORD{sizeof(RASENTRYNAMEA)};
  if (!IsOneOf(kNameSizes, size)) return kRasInvalidSize;
  const auto names = RasPhoneBook().Names();
  return List(first, size, bytes, count, names.size(), [&](std::size_t i, auto record) {
    PutText(record, RasEntryName::kName, RasEntryName::kNameBytes, names[i]);
  });
}

DWORD DeleteEntry(const char* phoneBook, const char* entryName) {
  if (!entryName) return kInvalidParameter;
  if (!IsOwnBook(phoneBook)) return kCannotOpenPhoneBook;
  return RasPhoneBook().Remove(entryName) ? kRasSuccess : kRasCannotFindPhonebookEntry;
}

DWORD GetEntryProperties(const char* phoneBook, const char* entryName, RASENTRYA* entry, DWORD* bytes) {
  if (!bytes) return kInvalidParameter;
  if (!IsOwnBook(phoneBook)) return kCannotOpenPhoneBook;
  const RasPhoneBook book;
  if (!entryName || *entryName == '\0') return FillEntry(entry, bytes, Image(kEntryBytes), {});
  if (!book.Has(entryName)) return kRasCannotFindPhonebookEntry;
  return FillEntry(entry, bytes, WholeProperties(book, entryName), book.AlternateNumbers(entryName));
}

DWORD SetEntryProperties(const char* phoneBook, const char* entryName, const RASENTRYA* entry, DWORD bytes) {
  if (!entry || !entryName || *entryName == '\0') return kInvalidParameter;
  if (!IsOwnBook(phoneBook)) return kCannotOpenPhoneBook;
  if (!IsOneOf(kEntrySizes, entry->dwSize)) return kRasInvalidSize;
  if (bytes < entry->dwSize) return kRasBufferInvalid;
  const auto record = BytesOf(const_cast<RASENTRYA*>(entry), entry->dwSize);
  Image properties(record.begin(), record.end());
  properties.resize(kEntryBytes);
  return Written(RasPhoneBook().Write(entryName, properties, AlternateNumbersIn(entry, bytes)));
}

DWORD GetEntryDialParams(const char* phoneBook, RASDIALPARAMSA* params, BOOL* hasPassword) {
  if (const DWORD error = ErrorOfParams(params)) return error;
  if (!hasPassword) return kInvalidParameter;
  if (!IsOwnBook(phoneBook)) return kCannotOpenPhoneBook;
  const RasPhoneBook book;
  const std::string name = EntryNameIn(params);
  if (!book.Has(name)) return kRasCannotFindPhonebookEntry;
  Image saved = book.DialParams(name);
  *hasPassword = HasPassword(saved);
  const auto record = BytesOf(params, params->dwSize);
  std::ranges::copy(TextsOf(saved), TextsOf(record).begin());
  if (record.size() >= RasDialParams::kBytes)
    std::ranges::copy(std::span(saved).subspan(RasDialParams::kSubEntry, 8),
                      record.begin() + RasDialParams::kSubEntry);
  return kRasSuccess;
}

DWORD SetEntryDialParams(const char* phoneBook, RASDIALPARAMSA* params, BOOL removePassword) {
  if (const DWORD error = ErrorOfParams(params)) return error;
  if (!IsOwnBook(phoneBook)) return kCannotOpenPhoneBook;
  const RasPhoneBook book;
  const std::string name = EntryNameIn(params);
  if (!book.Has(name)) return kRasCannotFindPhonebookEntry;
  Image saved = book.DialParams(name);
  PutLittle32(saved, 0, RasDialParams::kBytes);
  const auto record = BytesOf(params, params->dwSize);
  std::ranges::copy(TextsOf(record), TextsOf(saved).begin());
  if (removePassword)
    std::ranges::fill(TextsOf(saved).subspan(kPasswordInTexts, RasDialParams::kPasswordBytes),
                      std::uint8_t{0});
  if (record.size() >= RasDialParams::kBytes)
    std::ranges::copy(record.subspan(RasDialParams::kSubEntry, 8), saved.begin() + RasDialParams::kSubEntry);
  return Written(book.WriteDialParams(name, saved));
}

DWORD EnumDevices(RASDEVINFOA* first, DWORD* bytes, DWORD* count) {
  if (!bytes || !count) return kInvalidParameter;
  if (first && first->dwSize != RasDeviceInfo::kBytes) return kRasInvalidSize;
  return List(first, RasDeviceInfo::kBytes, bytes, count, kDevices.size(), [](std::size_t i, auto record) {
    PutText(record, RasDeviceInfo::kType, RasDeviceInfo::kTypeBytes, kDevices[i]);
    PutText(record, RasDeviceInfo::kName, RasDeviceInfo::kNameBytes, kDevices[i]);
  });
}

DWORD DialBy(RASDIALEXTENSIONS* extensions, const char* phoneBook, RASDIALPARAMSA* params,
             DialNotifier notifier, HRASCONN* connection) {
  if (!connection) return kInvalidParameter;
  if (const DWORD error = ErrorOfParams(params)) return error;
  if (extensions && extensions->dwSize != RasDialExtensions::kBytes &&
      extensions->dwSize != sizeof(RASDIALEXTENSIONS))
    return kRasInvalidSize;
  if (!IsOwnBook(phoneBook)) return kCannotOpenPhoneBook;
  // Procedures as notifiers are for others than us.
  if (notifier.target && notifier.type != kRasNotifierIsWindow) return kInvalidParameter;
  const std::string name = EntryNameIn(params);
  if (!RasPhoneBook().Has(name)) return kRasCannotFindPhonebookEntry;
  std::uint32_t handle = 0;
  const DWORD error = Dials().Start(ConnectionBy(name), static_cast<HWND>(notifier.target), handle);
  *connection = reinterpret_cast<HRASCONN>(handle);
  return error;
}

DWORD EndConnection(HRASCONN connection) {
  const auto handle = static_cast<std::uint32_t>(reinterpret_cast<std::uintptr_t>(connection));
  return Dials().HangUp(handle) ? std::uint32_t{kRasSuccess} : std::uint32_t{kErrorInvalidHandle};
}

DWORD ConnectStatus(HRASCONN connection) {
  const auto handle = static_cast<std::uint32_t>(reinterpret_cast<std::uintptr_t>(connection));
  return Dials().HasHandle(handle) ? std::uint32_t{kRasSuccess} : std::uint32_t{kErrorInvalidHandle};
}

DWORD EnumConnections(RASCONNA* first, DWORD* bytes, DWORD* count) {
  if (!bytes || !count) return kInvalidParameter;
  const DWORD size = first ? first->dwSize : DWORD{sizeof(RASCONNA)};
  if (!IsOneOf(kConnectionSizes, size)) return kRasInvalidSize;
  const auto connections = Dials().All();
  auto next = connections.begin();
  return List(first, size, bytes, count, connections.size(), [&next](std::size_t, auto record) {
    PutConnection(next->first, *next->second, record);
    ++next;
  });
}

DWORD ErrorText(UINT error, char* text, DWORD bytes) {
  const std::string_view found = linux_::RasErrorText(error);
  if (found.empty() || !text) return kInvalidParameter;
  if (bytes <= found.size()) return kInsufficientBuffer;
  *std::ranges::copy(found, text).out = '\0';
  return kRasSuccess;
}

} // namespace quendra::standins
