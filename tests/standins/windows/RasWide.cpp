// The calls of the library, all of them the wide ones: the others don't exist here, for a program whose code
// page isn't the machine's gets wrong letters by them. Each hands what it is given to a call of rasapi32.cpp,
// in the code page in which the file of the phone book is.

#include "standins/windows/RasNarrow.h"

#include "platform/remote_access/RemoteAccessNumbers.h"

#include <algorithm>
#include <cstddef>
#include <cstring>
#include <optional>
#include <span>
#include <string>
#include <vector>

namespace quendra::standins {

namespace {

constexpr UINT kPage = 1255;

template <std::size_t kSize> void Put(CHAR (&to)[kSize], const WCHAR (&from)[kSize]) {
  ::WideCharToMultiByte(kPage, 0, from, kSize, to, kSize, nullptr, nullptr);
}
template <std::size_t kSize> void Put(WCHAR (&to)[kSize], const CHAR (&from)[kSize]) {
  ::MultiByteToWideChar(kPage, 0, from, kSize, to, kSize);
}
template <typename Number> void Put(Number& to, const Number& from) { to = from; }

/// A text that a call takes; nullptr for none.
class Narrowed {
 public:
  explicit Narrowed(const WCHAR* text) {
    if (!text) return;
    std::vector<char> bytes(std::wcslen(text) + 1);
    ::WideCharToMultiByte(kPage, 0, text, -1, bytes.data(), static_cast<int>(bytes.size()), nullptr, nullptr);
    text_ = bytes.data();
  }
  operator const char*() const { return text_ ? text_->c_str() : nullptr; }

 private:
  std::optional<std::string> text_;
};

// One list of fields for both ways.

template <typename To, typename From> void PutName(To& to, const From& from) {
  Put(to.szEntryName, from.szEntryName);
}
template <typename To, typename From> void PutDevice(To& to, const From& from) {
  Put(to.szDeviceType, from.szDeviceType);
  Put(to.szDeviceName, from.szDeviceName);
}
template <typename To, typename From> void PutConnectionFields(To& to, const From& from) {
  Put(to.hrasconn, from.hrasconn);
  PutName(to, from);
  PutDevice(to, from);
  Put(to.szPhonebook, from.szPhonebook);
  Put(to.dwSubEntry, from.dwSubEntry);
  Put(to.guidEntry, from.guidEntry);
}
template <typename To, typename From> void PutParams(To& to, const From& from) {
  PutName(to, from);
  Put(to.szPhoneNumber, from.szPhoneNumber);
  Put(to.szCallbackNumber, from.szCallbackNumber);
  Put(to.szUserName, from.szUserName);
  Put(to.szPassword, from.szPassword);
  Put(to.szDomain, from.szDomain);
  Put(to.dwSubEntry, from.dwSubEntry);
  Put(to.dwCallbackId, from.dwCallbackId);
}
template <typename To, typename From> void PutEntry(To& to, const From& from) {
  Put(to.dwfOptions, from.dwfOptions);
  Put(to.dwCountryID, from.dwCountryID);
  Put(to.dwCountryCode, from.dwCountryCode);
  Put(to.szAreaCode, from.szAreaCode);
  Put(to.szLocalPhoneNumber, from.szLocalPhoneNumber);
  Put(to.ipaddr, from.ipaddr);
  Put(to.ipaddrDns, from.ipaddrDns);
  Put(to.ipaddrDnsAlt, from.ipaddrDnsAlt);
  Put(to.ipaddrWins, from.ipaddrWins);
  Put(to.ipaddrWinsAlt, from.ipaddrWinsAlt);
  Put(to.dwFrameSize, from.dwFrameSize);
  Put(to.dwfNetProtocols, from.dwfNetProtocols);
  Put(to.dwFramingProtocol, from.dwFramingProtocol);
  Put(to.szScript, from.szScript);
  Put(to.szAutodialDll, from.szAutodialDll);
  Put(to.szAutodialFunc, from.szAutodialFunc);
  PutDevice(to, from);
  Put(to.szX25PadType, from.szX25PadType);
  Put(to.szX25Address, from.szX25Address);
  Put(to.szX25Facilities, from.szX25Facilities);
  Put(to.szX25UserData, from.szX25UserData);
  Put(to.dwChannels, from.dwChannels);
  Put(to.dwReserved1, from.dwReserved1);
  Put(to.dwReserved2, from.dwReserved2);
  Put(to.dwSubEntries, from.dwSubEntries);
  Put(to.dwDialMode, from.dwDialMode);
  Put(to.dwDialExtraPercent, from.dwDialExtraPercent);
  Put(to.dwDialExtraSampleSeconds, from.dwDialExtraSampleSeconds);
  Put(to.dwHangUpExtraPercent, from.dwHangUpExtraPercent);
  Put(to.dwHangUpExtraSampleSeconds, from.dwHangUpExtraSampleSeconds);
  Put(to.dwIdleDisconnectSeconds, from.dwIdleDisconnectSeconds);
  Put(to.dwType, from.dwType);
  Put(to.dwEncryptionType, from.dwEncryptionType);
  Put(to.dwCustomAuthKey, from.dwCustomAuthKey);
  Put(to.guidId, from.guidId);
  Put(to.szCustomDialDll, from.szCustomDialDll);
  Put(to.dwVpnStrategy, from.dwVpnStrategy);
  Put(to.dwfOptions2, from.dwfOptions2);
  Put(to.dwfOptions3, from.dwfOptions3);
  Put(to.szDnsSuffix, from.szDnsSuffix);
  Put(to.dwTcpWindowSize, from.dwTcpWindowSize);
  Put(to.szPrerequisitePbk, from.szPrerequisitePbk);
  Put(to.szPrerequisiteEntry, from.szPrerequisiteEntry);
  Put(to.dwRedialCount, from.dwRedialCount);
  Put(to.dwRedialPause, from.dwRedialPause);
}

/// A size of a record, and the same for the other calls.
struct Sizes {
  DWORD wide;
  DWORD narrow;
};
constexpr DWORD Whole(std::size_t bytes) { return static_cast<DWORD>((bytes + 3) / 4 * 4); }
#define UP_TO(record, field)                                                                                 \
  Sizes { Whole(offsetof(record##W, field)), Whole(offsetof(record##A, field)) }
#define WHOLE(record)                                                                                        \
  Sizes { sizeof(record##W), sizeof(record##A) }

constexpr Sizes kNames[]{UP_TO(RASENTRYNAME, dwFlags), WHOLE(RASENTRYNAME)};
constexpr Sizes kDevices[]{WHOLE(RASDEVINFO)};
constexpr Sizes kConnections[]{UP_TO(RASCONN, szPhonebook), UP_TO(RASCONN, guidEntry),
                               UP_TO(RASCONN, dwFlags), WHOLE(RASCONN)};
constexpr Sizes kParams[]{UP_TO(RASDIALPARAMS, dwSubEntry), WHOLE(RASDIALPARAMS)};
constexpr Sizes kEntries[]{UP_TO(RASENTRY, dwSubEntries), UP_TO(RASENTRY, dwType),
                           UP_TO(RASENTRY, dwfOptions2), WHOLE(RASENTRY)};

/// 0 for a size that this system hasn't.
DWORD NarrowSize(std::span<const Sizes> sizes, DWORD wide) {
  const auto found = std::ranges::find(sizes, wide, &Sizes::wide);
  return found == sizes.end() ? 0 : found->narrow;
}

/// As much of a record as it says that there is.
template <typename Record> Record Held(const Record* record) {
  Record held{};
  std::memcpy(&held, record, std::min<std::size_t>(record->dwSize, sizeof held));
  return held;
}
template <typename Record> void GiveBack(const Record& held, Record* record) {
  const DWORD size = record->dwSize;
  std::memcpy(record, &held, std::min<std::size_t>(size, sizeof held));
  record->dwSize = size;
}

template <typename Wide, typename Narrow, typename Call, typename PutRecord>
DWORD ListWide(std::span<const Sizes> sizes, Wide* first, DWORD* bytes, Call call, PutRecord put) {
  if (!bytes) return platform::kRasBufferInvalid;
  const DWORD wide = first ? first->dwSize : sizes.back().wide;
  const DWORD narrow = NarrowSize(sizes, wide);
  if (narrow == 0) return platform::kRasInvalidSize;
  const DWORD rooms = *bytes / wide;
  std::vector<std::uint8_t> records((rooms + 1) * narrow);
  auto* const head = reinterpret_cast<Narrow*>(records.data());
  head->dwSize = narrow;
  *bytes = rooms * narrow;
  const DWORD result = call(first ? head : nullptr, bytes);
  const DWORD told = *bytes / narrow;
  *bytes = told * wide;
  for (DWORD i = 0; result == 0 && first && i < std::min(told, rooms); ++i) {
    Wide record{};
    put(record, Held(reinterpret_cast<const Narrow*>(records.data() + i * narrow)));
    auto* const place = reinterpret_cast<Wide*>(reinterpret_cast<std::uint8_t*>(first) + i * wide);
    place->dwSize = wide;
    GiveBack(record, place);
  }
  return result;
}

/// nullptr stays that; a record of another size goes on as one.
class NarrowParams {
 public:
  explicit NarrowParams(const RASDIALPARAMSW* params) : isThere_(params != nullptr) {
    if (!isThere_) return;
    PutParams(params_, Held(params));
    params_.dwSize = NarrowSize(kParams, params->dwSize);
  }
  RASDIALPARAMSA* Get() { return isThere_ ? &params_ : nullptr; }

 private:
  RASDIALPARAMSA params_{};
  bool isThere_;
};

std::string NarrowList(const WCHAR* list, std::size_t room) {
  std::vector<char> bytes(room);
  ::WideCharToMultiByte(kPage, 0, list, static_cast<int>(room), bytes.data(), static_cast<int>(room), nullptr,
                        nullptr);
  return {bytes.begin(), bytes.end()};
}

} // namespace

} // namespace quendra::standins

using namespace quendra;
using namespace quendra::platform;
using namespace quendra::standins;

#define EXPORTED extern "C" __declspec(dllexport) DWORD WINAPI

EXPORTED RasEnumEntriesW(LPCWSTR, LPCWSTR phoneBook, LPRASENTRYNAMEW first, LPDWORD bytes, LPDWORD count) {
  return ListWide<RASENTRYNAMEW, RASENTRYNAMEA>(
      kNames, first, bytes,
      [&](auto* records, DWORD* room) { return EnumEntries(Narrowed(phoneBook), records, room, count); },
      [](auto& to, const auto& from) { PutName(to, from); });
}

EXPORTED RasEnumDevicesW(LPRASDEVINFOW first, LPDWORD bytes, LPDWORD count) {
  return ListWide<RASDEVINFOW, RASDEVINFOA>(
      kDevices, first, bytes, [&](auto* records, DWORD* room) { return EnumDevices(records, room, count); },
      [](auto& to, const auto& from) { PutDevice(to, from); });
}

EXPORTED RasEnumConnectionsW(LPRASCONNW first, LPDWORD bytes, LPDWORD count) {
  return ListWide<RASCONNW, RASCONNA>(
      kConnections, first, bytes,
      [&](auto* records, DWORD* room) { return EnumConnections(records, room, count); },
      [](auto& to, const auto& from) { PutConnectionFields(to, from); });
}

EXPORTED RasDeleteEntryW(LPCWSTR phoneBook, LPCWSTR entryName) {
  return DeleteEntry(Narrowed(phoneBook), Narrowed(entryName));
}

EXPORTED RasGetEntryPropertiesW(LPCWSTR phoneBook, LPCWSTR entryName, LPRASENTRYW entry, LPDWORD bytes,
                                LPBYTE, LPDWORD) {
  if (!bytes) return kRasBufferInvalid;
  std::vector<std::uint8_t> image(1 << 16);
  auto* const narrow = reinterpret_cast<RASENTRYA*>(image.data());
  const bool isAskedForSize = !entry || *bytes < 4;
  const DWORD wideBytes = isAskedForSize ? sizeof(RASENTRYW) : entry->dwSize;
  narrow->dwSize = NarrowSize(kEntries, wideBytes);
  if (narrow->dwSize == 0) return kRasInvalidSize;
  auto room = static_cast<DWORD>(image.size());
  const DWORD result = GetEntryProperties(Narrowed(phoneBook), Narrowed(entryName), narrow, &room);
  if (result != 0) return result;
  const DWORD characters = room - narrow->dwSize;
  const DWORD had = *bytes;
  *bytes = wideBytes + characters * sizeof(WCHAR);
  if (isAskedForSize || had < *bytes) return kRasBufferTooSmall;
  RASENTRYW found{};
  PutEntry(found, Held(narrow));
  found.dwAlternateOffset = characters > 0 ? wideBytes : 0;
  GiveBack(found, entry);
  ::MultiByteToWideChar(kPage, 0, reinterpret_cast<const char*>(image.data()) + narrow->dwSize,
                        static_cast<int>(characters),
                        reinterpret_cast<WCHAR*>(reinterpret_cast<std::uint8_t*>(entry) + wideBytes),
                        static_cast<int>(characters));
  return result;
}

EXPORTED RasSetEntryPropertiesW(LPCWSTR phoneBook, LPCWSTR entryName, LPRASENTRYW entry, DWORD bytes, LPBYTE,
                                DWORD) {
  if (!entry) return kRasBufferInvalid;
  if (bytes < entry->dwSize) return kRasBufferInvalid;
  const DWORD offset = entry->dwAlternateOffset;
  std::string list;
  if (offset > 0 && offset < bytes)
    list = NarrowList(reinterpret_cast<const WCHAR*>(reinterpret_cast<const std::uint8_t*>(entry) + offset),
                      (bytes - offset) / sizeof(WCHAR));
  RASENTRYA narrow{};
  PutEntry(narrow, Held(entry));
  narrow.dwSize = NarrowSize(kEntries, entry->dwSize);
  narrow.dwAlternateOffset = list.empty() ? 0 : narrow.dwSize;
  std::vector<std::uint8_t> image(narrow.dwSize);
  std::memcpy(image.data(), &narrow, std::min(image.size(), sizeof narrow));
  image.insert(image.end(), list.begin(), list.end());
  image.resize(std::max(image.size(), sizeof narrow)); // of which another size says less
  return SetEntryProperties(Narrowed(phoneBook), Narrowed(entryName),
                            reinterpret_cast<RASENTRYA*>(image.data()),
                            narrow.dwSize + static_cast<DWORD>(list.size()));
}

EXPORTED RasGetEntryDialParamsW(LPCWSTR phoneBook, LPRASDIALPARAMSW params, LPBOOL hasPassword) {
  NarrowParams narrow(params);
  const DWORD result = GetEntryDialParams(Narrowed(phoneBook), narrow.Get(), hasPassword);
  if (result != 0) return result;
  RASDIALPARAMSW found{};
  PutParams(found, *narrow.Get());
  GiveBack(found, params);
  return result;
}

EXPORTED RasSetEntryDialParamsW(LPCWSTR phoneBook, LPRASDIALPARAMSW params, BOOL removePassword) {
  return SetEntryDialParams(Narrowed(phoneBook), NarrowParams(params).Get(), removePassword);
}

EXPORTED RasDialW(LPRASDIALEXTENSIONS extensions, LPCWSTR phoneBook, LPRASDIALPARAMSW params,
                  DWORD notifierType, LPVOID notifier, LPHRASCONN connection) {
  return DialBy(extensions, Narrowed(phoneBook), NarrowParams(params).Get(), {notifierType, notifier},
                connection);
}

EXPORTED RasHangUpW(HRASCONN connection) { return EndConnection(connection); }

EXPORTED RasGetConnectStatusW(HRASCONN connection, LPRASCONNSTATUSW) { return ConnectStatus(connection); }

EXPORTED RasGetErrorStringW(UINT error, LPWSTR text, DWORD characters) {
  std::vector<char> bytes(characters);
  const DWORD result = ErrorText(error, text ? bytes.data() : nullptr, characters);
  if (result == 0) ::MultiByteToWideChar(kPage, 0, bytes.data(), -1, text, static_cast<int>(characters));
  return result;
}
