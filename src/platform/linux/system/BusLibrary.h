#pragma once

#include "platform/linux/system/SharedLibrary.h"

#include <cstdint>

namespace quendra::platform::linux_ {

/// The bus library's record of a failure, as it lies in memory.
struct BusFailure {
  const char* name = nullptr;
  const char* message = nullptr;
  int needsFree = 0;
};

/// The bus library, looked up when it is needed: a machine without a bus has no use for it. Each function
/// stands for the one of that name with "sd_bus_" before it, or "sd_bus_message_" where it starts with
/// "message".
struct BusLibrary {
  using Object = void;
  using Handler = int (*)(Object* message, void* context, BusFailure* failure);

  BusLibrary();

  int (*open_user)(Object** bus) = nullptr;
  int (*open_system)(Object** bus) = nullptr;
  int (*is_ready)(Object* bus) = nullptr;
  int (*process)(Object* bus, Object** message) = nullptr;
  int (*wait)(Object* bus, std::uint64_t microseconds) = nullptr;
  int (*get_fd)(Object* bus) = nullptr;
  Object* (*close_unref)(Object* bus) = nullptr;
  int (*set_method_call_timeout)(Object* bus, std::uint64_t microseconds) = nullptr;
  int (*call_method)(Object* bus, const char* destination, const char* path, const char* interface,
                     const char* member, void* error, Object** reply, const char* types, ...) = nullptr;
  int (*call)(Object* bus, Object* message, std::uint64_t microseconds, BusFailure* failure,
              Object** reply) = nullptr;
  int (*call_async)(Object* bus, Object** slot, Object* message, Handler handler, void* context,
                    std::uint64_t microseconds) = nullptr;
  int (*add_match)(Object* bus, Object** slot, const char* rule, Handler handler, void* context) = nullptr;
  void (*error_free)(BusFailure* failure) = nullptr;
  Object* (*slot_unref)(Object* slot) = nullptr;
  int (*message_new_method_call)(Object* bus, Object** message, const char* destination, const char* path,
                                 const char* interface, const char* member) = nullptr;
  int (*message_append_basic)(Object* message, char type, const void* value) = nullptr;
  int (*message_open_container)(Object* message, char type, const char* contents) = nullptr;
  int (*message_close_container)(Object* message) = nullptr;
  int (*message_read)(Object* message, const char* types, ...) = nullptr;
  int (*message_read_basic)(Object* message, char type, void* value) = nullptr;
  int (*message_peek_type)(Object* message, char* type, const char** contents) = nullptr;
  int (*message_enter_container)(Object* message, char type, const char* contents) = nullptr;
  int (*message_exit_container)(Object* message) = nullptr;
  const BusFailure* (*message_get_error)(Object* message) = nullptr;
  const char* (*message_get_sender)(Object* message) = nullptr;
  const char* (*message_get_path)(Object* message) = nullptr;
  const char* (*message_get_interface)(Object* message) = nullptr;
  const char* (*message_get_member)(Object* message) = nullptr;
  Object* (*message_unref)(Object* message) = nullptr;
  bool isThere = false;

  /// Waits until the bus has let us in; false when it refuses, or takes longer than that.
  bool LetsUsIn(Object* bus, std::uint64_t microseconds) const;

 private:
  bool FindConnections();
  bool FindQuestions();
  bool FindMessages();

  SharedLibrary library_{"libsystemd.so.0"};
};

} // namespace quendra::platform::linux_
