#include "platform/linux/system/FileManager.h"

#include <dlfcn.h>

#include <cstdint>
#include <memory>
#include <string_view>

namespace quendra::platform::linux_ {

namespace {

constexpr const char* kFileManager = "org.freedesktop.FileManager1";
/// The bus itself answers at once; the limit is for one that doesn't.
constexpr std::uint64_t kMicrosecondsToAnswer = 1'000'000;

/// The bus library, looked up when it is needed: a machine without a session has no use for it.
struct BusLibrary {
  using Object = void;

  BusLibrary() : library(::dlopen("libsystemd.so.0", RTLD_NOW | RTLD_LOCAL), CloseLibrary) {
    isThere = library && Find("sd_bus_open_user", open) && Find("sd_bus_flush_close_unref", close) &&
              Find("sd_bus_set_method_call_timeout", setTimeout) && Find("sd_bus_call_method", call) &&
              Find("sd_bus_message_new_method_call", make) && Find("sd_bus_message_append", append) &&
              Find("sd_bus_message_set_expect_reply", expectReply) && Find("sd_bus_send", send) &&
              Find("sd_bus_message_unref", release);
  }

  int (*open)(Object** bus) = nullptr;
  Object* (*close)(Object* bus) = nullptr;
  int (*setTimeout)(Object* bus, std::uint64_t microseconds) = nullptr;
  int (*call)(Object* bus, const char* destination, const char* path, const char* interface,
              const char* member, void* error, Object** reply, const char* types, ...) = nullptr;
  int (*make)(Object* bus, Object** message, const char* destination, const char* path, const char* interface,
              const char* member) = nullptr;
  int (*append)(Object* message, const char* types, ...) = nullptr;
  int (*expectReply)(Object* message, int expected) = nullptr;
  int (*send)(Object* bus, Object* message, std::uint64_t* cookie) = nullptr;
  Object* (*release)(Object* message) = nullptr;
  bool isThere = false;

 private:
  template <typename Function> bool Find(const char* name, Function& function) {
    function = reinterpret_cast<Function>(::dlsym(library.get(), name));
    return function != nullptr;
  }

  static void CloseLibrary(void* handle) { ::dlclose(handle); }

  std::unique_ptr<void, void (*)(void*)> library;
};

/// Starts the file manager, where that can be done, and says whether there is one.
bool FileManagerIsThere(const BusLibrary& library, void* bus) {
  return library.call(bus, "org.freedesktop.DBus", "/org/freedesktop/DBus", "org.freedesktop.DBus",
                      "StartServiceByName", nullptr, nullptr, "su", kFileManager, 0U) >= 0;
}

bool Ask(const BusLibrary& library, void* bus, const std::string& uri) {
  void* raw = nullptr;
  if (library.make(bus, &raw, kFileManager, "/org/freedesktop/FileManager1", kFileManager, "ShowItems") < 0)
    return false;
  const std::unique_ptr<void, void* (*)(void*)> message(raw, library.release);
  return library.append(raw, "ass", 1, uri.c_str(), "") >= 0 && library.expectReply(raw, 0) >= 0 &&
         library.send(bus, raw, nullptr) >= 0;
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
  const BusLibrary library;
  void* raw = nullptr;
  if (!library.isThere || library.open(&raw) < 0) return false;
  const std::unique_ptr<void, void* (*)(void*)> bus(raw, library.close);
  library.setTimeout(raw, kMicrosecondsToAnswer);
  return FileManagerIsThere(library, raw) && Ask(library, raw, FileUri(path));
}

} // namespace quendra::platform::linux_
