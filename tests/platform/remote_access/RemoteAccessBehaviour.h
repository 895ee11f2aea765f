#pragma once

#include "forms/headless/HeadlessDesktop.h"
#include "platform/remote_access/Dialling.h"
#include "platform/remote_access/PhoneBook.h"
#include "runtime/ByteFields.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <functional>
#include <map>
#include <memory>
#include <string>
#include <vector>

namespace quendra::platform {

/// A machine with remote access, an empty phone book and a device of the type "pppoe", on which a test may
/// do what it likes.
class RemoteAccessBackend {
 public:
  virtual ~RemoteAccessBackend() = default;

  virtual PhoneBook& Book() = 0;
  virtual Dialling& Dials() = 0;
  /// Whose windows the dials tell.
  virtual forms::headless::HeadlessDesktop& Desktop() = 0;
  /// Waits for what the machine does on its own; false when it doesn't come.
  virtual bool Until(const std::function<bool()>& condition) = 0;
  /// Whether dials come to stand here. Otherwise they end in an error.
  virtual bool Connects() const = 0;
};

struct RemoteAccessKind {
  const char* name;
  /// nullptr where this machine can't run it, with the reason.
  std::unique_ptr<RemoteAccessBackend> (*make)(std::string& whyNot);
};

/// What every machine with remote access must answer alike. A backend joins by an instantiation of its own.
struct RemoteAccessBehaviourTest : testing::TestWithParam<RemoteAccessKind> {
  using Bytes = std::vector<std::uint8_t>;
  using Lines = std::vector<std::string>;

  void SetUp() override {
    std::string whyNot;
    backend = GetParam().make(whyNot);
    if (!backend) GTEST_SKIP() << whyNot;
  }
  PhoneBook& Book() { return backend->Book(); }
  Dialling& Dials() { return backend->Dials(); }

  // Records.

  static Bytes Record(std::uint32_t bytes) {
    Bytes record(bytes);
    PutLittle32(record, 0, bytes);
    return record;
  }
  static void Put(Bytes& record, std::size_t at, const std::string& text) {
    std::copy(text.begin(), text.end(), record.begin() + static_cast<std::ptrdiff_t>(at));
  }
  static std::string Get(const Bytes& record, std::size_t at) {
    const auto begin = record.begin() + static_cast<std::ptrdiff_t>(at);
    return {begin, std::find(begin, record.end(), 0)};
  }

  // The phone book.

  Lines Names() {
    std::uint32_t bytes = 0;
    std::uint32_t count = 0;
    const auto asked = Book().RasEnumEntriesA(nullptr, {}, bytes, count);
    EXPECT_EQ(asked, bytes == 0 ? kRasSuccess : kRasBufferTooSmall);
    if (bytes == 0) return {};
    Bytes records(bytes);
    PutLittle32(records, 0, RasEntryName::kBytes);
    EXPECT_EQ(Book().RasEnumEntriesA(nullptr, records, bytes, count), kRasSuccess);
    Lines names;
    for (std::size_t at = 0; at < std::size_t{count} * RasEntryName::kBytes; at += RasEntryName::kBytes)
      names.push_back(Get(records, at + RasEntryName::kName));
    return names;
  }
  std::uint32_t EntryBytes() {
    std::uint32_t bytes = 0;
    EXPECT_EQ(Book().RasGetEntryPropertiesA(nullptr, nullptr, {}, bytes), kRasBufferTooSmall);
    return bytes;
  }
  /// An entry by which the machine can dial.
  Bytes BroadbandEntry() {
    Bytes entry = Record(EntryBytes());
    PutLittle32(entry, RasEntry::kNetProtocols, 4);
    PutLittle32(entry, RasEntry::kFramingProtocol, 1);
    Put(entry, RasEntry::kDeviceType, "pppoe");
    Put(entry, RasEntry::kDeviceName, Devices().at("pppoe"));
    if (entry.size() > RasEntry::kBytesWithoutEntryType) PutLittle32(entry, RasEntry::kEntryType, 5);
    return entry;
  }
  std::uint32_t Set(const std::string& name, const Bytes& entry) {
    return Book().RasSetEntryPropertiesA(nullptr, name.c_str(), entry);
  }
  std::uint32_t Read(const std::string& name, Bytes& entry) {
    std::uint32_t bytes = 0;
    const auto asked = Book().RasGetEntryPropertiesA(nullptr, name.c_str(), {}, bytes);
    if (asked != kRasBufferTooSmall) return asked;
    entry.assign(bytes, 0);
    PutLittle32(entry, 0, EntryBytes());
    return Book().RasGetEntryPropertiesA(nullptr, name.c_str(), entry, bytes);
  }
  /// The first device name of each type.
  std::map<std::string, std::string> Devices() {
    std::uint32_t bytes = 0;
    std::uint32_t count = 0;
    Book().RasEnumDevicesA({}, bytes, count);
    Bytes records(bytes);
    if (bytes == 0) return {};
    PutLittle32(records, 0, RasDeviceInfo::kBytes);
    EXPECT_EQ(Book().RasEnumDevicesA(records, bytes, count), kRasSuccess);
    std::map<std::string, std::string> devices;
    for (std::size_t at = 0; at < std::size_t{count} * RasDeviceInfo::kBytes; at += RasDeviceInfo::kBytes)
      devices.emplace(Get(records, at + RasDeviceInfo::kType), Get(records, at + RasDeviceInfo::kName));
    return devices;
  }

  // What is saved for dials, in the longest record.

  static constexpr std::size_t kUserName = 519;
  static constexpr std::size_t kPassword = 776;

  static Bytes Params(const std::string& name, const std::string& user = {}, const std::string& secret = {}) {
    Bytes params = Record(RasDialParams::kBytes);
    Put(params, RasDialParams::kEntryName, name);
    Put(params, kUserName, user);
    Put(params, kPassword, secret);
    return params;
  }

  // Dials.

  struct Event {
    std::uint32_t state = 0;
    std::uint32_t error = 0;
    bool IsLast() const { return error != 0 || state == kRasConnected; }
  };
  /// A window that keeps what dials tell it.
  WindowHandle Listener() {
    using Procedure = forms::WindowProcedure::element_type;
    const std::uint32_t told = backend->Desktop().RegisterWindowMessageA(kRasDialEventName);
    return backend->Desktop().Windows.Add(
        std::make_shared<Procedure>([this, told](auto, auto message, auto state, auto error) {
          if (message == told) events.push_back({state, error});
          return 0;
        }));
  }
  std::uint32_t Dial(const std::string& name, const Dialling::Notifier& notifier) {
    return Dials().RasDialA(Record(RasDialExtensions::kBytes), nullptr, Params(name, "user", "secret"),
                            notifier, connection);
  }
  bool UntilTheEndOfTheDial() {
    return backend->Until([this] { return !events.empty() && events.back().IsLast(); });
  }
  /// The names of the entries that stand connected, in records of a size.
  std::uint32_t Connections(std::uint32_t recordBytes, Lines& names) {
    Bytes records = Record(recordBytes);
    std::uint32_t bytes = recordBytes;
    std::uint32_t count = 0;
    auto result = Dials().RasEnumConnectionsA(records, bytes, count);
    if (result == kRasBufferTooSmall) {
      records.resize(bytes);
      result = Dials().RasEnumConnectionsA(records, bytes, count);
    }
    for (std::size_t i = 0; result == kRasSuccess && i < count; ++i)
      names.push_back(Get(records, i * recordBytes + RasConnectionRecord::kEntryName));
    return result;
  }

  std::unique_ptr<RemoteAccessBackend> backend;
  std::vector<Event> events;
  RasConnection connection;
};

} // namespace quendra::platform
