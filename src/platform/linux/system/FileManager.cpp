#include "platform/linux/system/FileManager.h"

#include "platform/linux/system/SessionBus.h"

#include <string_view>

namespace quendra::platform::linux_ {

namespace {

constexpr const char* kFileManager = "org.freedesktop.FileManager1";
constexpr const char* kBus = "org.freedesktop.DBus";
constexpr SessionBus::Method kGetNameOwner{kBus, "/org/freedesktop/DBus", kBus, "GetNameOwner"};
constexpr SessionBus::Method kStart{kBus, "/org/freedesktop/DBus", kBus, "StartServiceByName",
                                    3 * SessionBus::kSecond};
constexpr SessionBus::Method kShowItems{kFileManager, "/org/freedesktop/FileManager1", kFileManager,
                                        "ShowItems"};

/// One that runs need not be one that the bus could start. It is started by a question of its own: one that
/// comes up too slowly must not show the file later, when its folder has been opened in another way.
bool FileManagerIsThere(const SessionBus& bus) {
  return bus.Ask(kGetNameOwner, "s", kFileManager) || bus.Ask(kStart, "su", kFileManager, 0U);
}

} // namespace

std::string FileUri(const std::string& path) {
  static constexpr std::string_view kHarmless = "/-._~";
  static constexpr std::string_view kDigits = "0123456789ABCDEF";
  std::string uri = "file://";
  for (const char byte : path) {
    const bool isPlain = (byte >= 'a' && byte <= 'z') || (byte >= 'A' && byte <= 'Z') ||
                         (byte >= '0' && byte <= '9') || kHarmless.find(byte) != std::string_view::npos;
    const auto value = static_cast<std::uint8_t>(byte);
    if (isPlain)
      uri += byte;
    else
      (uri += '%').append({kDigits[value >> 4], kDigits[value & 15]});
  }
  return uri;
}

bool ShowInFileManager(const std::string& path) {
  const SessionBus bus;
  return FileManagerIsThere(bus) && bus.Ask(kShowItems, "ass", 1, FileUri(path).c_str(), "");
}

} // namespace quendra::platform::linux_
