#include "platform/linux/remote_access/LinuxPhoneBook.h"

#include "platform/linux/network_manager/NewConnection.h"
#include "platform/linux/remote_access/DialParamsImage.h"
#include "platform/linux/remote_access/DialParamsStore.h"
#include "platform/linux/remote_access/DialSettings.h"
#include "platform/linux/remote_access/EntrySettings.h"
#include "platform/linux/remote_access/RemoteDevices.h"
#include "platform/process/SystemErrors.h"
#include "platform/remote_access/RecordList.h"
#include "runtime/Text.h"

namespace quendra::platform::linux_ {

namespace {

std::string_view TextOf(const char* text) { return text ? text : ""; }

} // namespace

LinuxPhoneBook::LinuxPhoneBook(ConnectionBook& book, NetworkManagerBus& bus, std::string pluginFolder)
    : book_(book), bus_(bus), pluginFolder_(std::move(pluginFolder)) {}

std::uint32_t LinuxPhoneBook::RasEnumEntriesA(const char*, std::span<std::uint8_t> names,
                                              std::uint32_t& bytes, std::uint32_t& count) {
  count = 0;
  std::vector<Line> lines;
  if (const std::uint32_t error = book_.ReadLines(lines)) return error;
  RecordList list{names, bytes, count};
  if (!list.States(RasEntryName::kBytes)) return kRasInvalidSize;
  return list.Fill(RasEntryName::kBytes, lines.size(), [&](std::size_t i, auto record) {
    PutFieldText(record, RasEntryName::kName, RasEntryName::kNameBytes, lines[i].name);
  });
}

std::uint32_t LinuxPhoneBook::RasDeleteEntryA(const char*, const char* entryName) {
  Line line;
  if (const std::uint32_t error = book_.Find(TextOf(entryName), line)) return error;
  return book_.Delete(line);
}

std::uint32_t LinuxPhoneBook::RasGetEntryPropertiesA(const char*, const char* entryName,
                                                     std::span<std::uint8_t> entry, std::uint32_t& bytes) {
  std::vector<std::uint8_t> image(RasEntry::kBytes);
  if (!TextOf(entryName).empty()) {
    Line line;
    NetworkSettings settings;
    if (const std::uint32_t error = book_.Find(TextOf(entryName), line)) return error;
    if (const std::uint32_t error = book_.ReadSettings(line, settings)) return error;
    image = EntryImageOf(settings, line.kind);
  } else if (!book_.IsThere()) {
    return kRasManagerCannotStart;
  }
  const std::size_t room = std::min<std::size_t>(bytes, entry.size());
  bytes = static_cast<std::uint32_t>(image.size());
  if (room < image.size()) return kRasBufferTooSmall;
  if (Little32(entry, 0) != RasEntry::kBytes) return kRasInvalidSize;
  std::ranges::copy(image, entry.begin());
  return kRasSuccess;
}

std::uint32_t LinuxPhoneBook::RasSetEntryPropertiesA(const char*, const char* entryName,
                                                     std::span<const std::uint8_t> entry) {
  Line line;
  const std::string_view name = TextOf(entryName);
  const std::uint32_t missing = book_.Find(name, line);
  if (missing != kRasSuccess && missing != kRasCannotFindPhonebookEntry) return missing;
  if (name.empty() || name.size() >= RasEntryName::kNameBytes) return kInvalidParameter;
  if (entry.size() < 4 || Little32(entry, 0) != RasEntry::kBytes) return kRasInvalidSize;
  if (entry.size() < RasEntry::kBytes) return kRasBufferInvalid;
  NetworkSettings settings = NewConnection(ToUtf8(FromCodePage(name)));
  if (missing == kRasSuccess)
    if (const std::uint32_t error = book_.ReadSettings(line, settings)) return error;
  if (!PutEntryImage(settings, entry)) return kInvalidParameter;
  return missing == kRasSuccess ? book_.Update(line, settings) : book_.Add(settings);
}

std::uint32_t LinuxPhoneBook::RasGetEntryDialParamsA(const char*, std::span<std::uint8_t> params,
                                                     bool& hasPassword) {
  hasPassword = false;
  if (!book_.IsThere()) return kRasManagerCannotStart;
  if (const std::uint32_t error = ErrorOfDialParams(params)) return error;
  Line line;
  if (const std::uint32_t error = book_.Find(EntryNameOf(params), line)) return error;
  std::vector<std::uint8_t> full(RasDialParams::kBytes);
  if (const std::uint32_t error = ReadDialParams(book_, line, full)) return error;
  hasPassword = !PasswordField(full).empty();
  GiveDialParams(full, params);
  return kRasSuccess;
}

std::uint32_t LinuxPhoneBook::RasSetEntryDialParamsA(const char*, std::span<const std::uint8_t> params,
                                                     bool removePassword) {
  if (!book_.IsThere()) return kRasManagerCannotStart;
  if (const std::uint32_t error = ErrorOfDialParams(params)) return error;
  Line line;
  if (const std::uint32_t error = book_.Find(EntryNameOf(params), line)) return error;
  return SaveDialParams(book_, line, params, removePassword);
}

std::uint32_t LinuxPhoneBook::RasEnumDevicesA(std::span<std::uint8_t> devices, std::uint32_t& bytes,
                                              std::uint32_t& count) {
  count = 0;
  std::vector<LineKind> kinds;
  if (const std::uint32_t error = ReadRemoteDevices(bus_, pluginFolder_, kinds)) return error;
  RecordList list{devices, bytes, count};
  if (!list.States(RasDeviceInfo::kBytes)) return kRasInvalidSize;
  return list.Fill(RasDeviceInfo::kBytes, kinds.size(), [&](std::size_t i, auto record) {
    PutFieldText(record, RasDeviceInfo::kType, RasDeviceInfo::kTypeBytes, DeviceTypeOf(kinds[i]));
    PutFieldText(record, RasDeviceInfo::kName, RasDeviceInfo::kNameBytes, DeviceTypeOf(kinds[i]));
  });
}

} // namespace quendra::platform::linux_
