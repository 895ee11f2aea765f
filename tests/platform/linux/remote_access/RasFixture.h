#pragma once

#include "forms/headless/posix/PolledDesktop.h"
#include "platform/linux/network_manager/PrivateBusFixture.h"
#include "platform/linux/remote_access/LinuxDialling.h"
#include "platform/linux/remote_access/LinuxPhoneBook.h"
#include "platform/process/SystemErrors.h"
#include "runtime/ByteFields.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <memory>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace quendra::platform::linux_ {

using Bytes = std::vector<std::uint8_t>;

inline void PutAt(Bytes& image, std::size_t at, std::string_view text) {
  std::ranges::copy(text, image.begin() + static_cast<std::ptrdiff_t>(at));
}
inline std::string TextAt(const Bytes& image, std::size_t at) {
  return reinterpret_cast<const char*>(image.data()) + at;
}

/// An image of an entry for a device of that type, with nothing else in it.
inline Bytes EntryFor(std::string_view deviceType) {
  Bytes image(RasEntry::kBytes);
  PutLittle32(image, 0, RasEntry::kBytes);
  PutAt(image, RasEntry::kDeviceType, deviceType);
  return image;
}

inline constexpr std::size_t kUserNameAt = 4 + 257 + 129 + 129;
inline constexpr std::size_t kPasswordAt = kUserNameAt + 257;

inline Bytes DialParamsFor(std::string_view entry, std::string_view user = {},
                           std::string_view password = {}) {
  Bytes image(RasDialParams::kBytes);
  PutLittle32(image, 0, RasDialParams::kBytes);
  PutAt(image, RasDialParams::kEntryName, entry);
  PutAt(image, kUserNameAt, user);
  PutAt(image, kPasswordAt, password);
  return image;
}

/// Keeps what a dial tells a window.
struct DialLoop : forms::headless::PolledDesktop {
  using Changes = std::vector<std::pair<std::uint32_t, std::uint32_t>>;

  void PostMessage(WindowHandle window, std::uint32_t message, std::uint32_t state,
                   std::uint32_t error) override {
    EXPECT_EQ(window, kWindow);
    EXPECT_EQ(message, RegisterWindowMessageA(kRasDialEventName));
    changes.emplace_back(state, error);
  }

  static constexpr WindowHandle kWindow{7};
  Changes changes;
};

/// Remote access over whatever stands on the system's bus, with its own desktop.
class RasTest : public testing::Test {
 protected:
  std::vector<std::string> Names() {
    std::uint32_t bytes = 0, count = 0;
    phoneBook.RasEnumEntriesA(nullptr, {}, bytes, count);
    Bytes records(bytes);
    if (!records.empty()) PutLittle32(records, 0, RasEntryName::kBytes);
    EXPECT_EQ(phoneBook.RasEnumEntriesA(nullptr, records, bytes, count), 0U);
    std::vector<std::string> names;
    for (std::size_t i = 0; i < count; ++i) names.push_back(TextAt(records, i * RasEntryName::kBytes + 4));
    return names;
  }
  /// Empty where there is none of that name.
  Bytes Entry(const char* name) {
    std::uint32_t bytes = 0;
    if (phoneBook.RasGetEntryPropertiesA(nullptr, name, {}, bytes) != kRasBufferTooSmall) return {};
    Bytes image(bytes);
    PutLittle32(image, 0, RasEntry::kBytes);
    EXPECT_EQ(phoneBook.RasGetEntryPropertiesA(nullptr, name, image, bytes), 0U);
    return image;
  }
  std::uint32_t Put(const char* name, const Bytes& image) {
    return phoneBook.RasSetEntryPropertiesA(nullptr, name, image);
  }
  std::uint32_t Save(std::string_view name, std::string_view user, std::string_view password) {
    return phoneBook.RasSetEntryDialParamsA(nullptr, DialParamsFor(name, user, password), false);
  }
  Bytes Saved(std::string_view name) {
    Bytes image = DialParamsFor(name);
    bool hasPassword = false;
    EXPECT_EQ(phoneBook.RasGetEntryDialParamsA(nullptr, image, hasPassword), 0U);
    EXPECT_EQ(hasPassword, !TextAt(image, kPasswordAt).empty());
    return image;
  }
  std::vector<std::string> Devices() {
    std::uint32_t bytes = 0, count = 0;
    phoneBook.RasEnumDevicesA({}, bytes, count);
    Bytes records(bytes);
    if (!records.empty()) PutLittle32(records, 0, RasDeviceInfo::kBytes);
    EXPECT_EQ(phoneBook.RasEnumDevicesA(records, bytes, count), 0U);
    std::vector<std::string> devices;
    for (std::size_t i = 0; i < count; ++i)
      devices.push_back(TextAt(records, i * RasDeviceInfo::kBytes + RasDeviceInfo::kType) + "/" +
                        TextAt(records, i * RasDeviceInfo::kBytes + RasDeviceInfo::kName));
    return devices;
  }
  /// Entry names of the connections that stand, and their handles.
  std::vector<std::pair<std::string, RasConnection>> Connections() { return ConnectionsOf(dialling); }
  static std::vector<std::pair<std::string, RasConnection>> ConnectionsOf(Dialling& dialling) {
    std::uint32_t bytes = RasConnectionRecord::kBytes, count = 0;
    Bytes records(bytes);
    PutLittle32(records, 0, bytes);
    if (dialling.RasEnumConnectionsA(records, bytes, count) == kRasBufferTooSmall) {
      records.resize(bytes);
      EXPECT_EQ(dialling.RasEnumConnectionsA(records, bytes, count), 0U);
    }
    std::vector<std::pair<std::string, RasConnection>> found;
    for (std::size_t i = 0; i < count; ++i) {
      const std::size_t at = i * RasConnectionRecord::kBytes;
      found.emplace_back(TextAt(records, at + RasConnectionRecord::kEntryName),
                         RasConnection(Little32(records, at + RasConnectionRecord::kHandle)));
    }
    return found;
  }

  /// Dials with the window as notifier, or without one.
  std::uint32_t Dial(std::string_view name, bool withWindow = true) {
    const Dialling::Notifier window{kRasNotifierIsWindow, DialLoop::kWindow};
    return dialling.RasDialA({}, nullptr, DialParamsFor(name), withWindow ? window : Dialling::Notifier(),
                             handle);
  }
  /// Waits for a change with that state or error.
  bool Comes(std::uint32_t state, std::uint32_t error) {
    return loop.WaitFor(
        [&] { return std::ranges::find(loop.changes, std::pair(state, error)) != loop.changes.end(); },
        20'000);
  }

  TemporaryFolder kernel; ///< which speaks PPP once there is a folder "ppp"
  DialLoop loop;
  NetworkManagerBus connection{loop, loop};
  ConnectionBook book{connection};
  LinuxPhoneBook phoneBook{book, connection};
  LinuxDialling dialling{book, connection, loop, kernel / "ppp"};
  RasConnection handle;
};

} // namespace quendra::platform::linux_
