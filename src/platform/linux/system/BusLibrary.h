#pragma once

#include "platform/linux/system/SharedLibrary.h"

#include <cstdint>

namespace quendra::platform::linux_ {

/// The bus library, looked up when it is needed: a machine without a session has no use for it. Each function
/// stands for the one of that name with "sd_bus_" before it, or "sd_bus_message_" where it starts with
/// "message".
struct BusLibrary {
  using Object = void;

  BusLibrary();

  int (*open_user)(Object** bus) = nullptr;
  int (*is_ready)(Object* bus) = nullptr;
  int (*process)(Object* bus, Object** message) = nullptr;
  int (*wait)(Object* bus, std::uint64_t microseconds) = nullptr;
  Object* (*close_unref)(Object* bus) = nullptr;
  int (*set_method_call_timeout)(Object* bus, std::uint64_t microseconds) = nullptr;
  int (*call_method)(Object* bus, const char* destination, const char* path, const char* interface,
                     const char* member, void* error, Object** reply, const char* types, ...) = nullptr;
  int (*message_read)(Object* message, const char* types, ...) = nullptr;
  int (*message_enter_container)(Object* message, char type, const char* contents) = nullptr;
  Object* (*message_unref)(Object* message) = nullptr;
  bool isThere = false;

 private:
  SharedLibrary library_{"libsystemd.so.0"};
};

} // namespace quendra::platform::linux_
