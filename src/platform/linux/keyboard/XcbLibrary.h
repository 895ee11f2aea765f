#pragma once

#include "platform/linux/system/SharedLibrary.h"

#include <cstdint>

namespace quendra::platform::linux_ {

/// The display's client library and its keyboard extension, looked up when they are needed: a machine without
/// such displays has no use for them. Each function stands for the one of that name with "xcb_" before it. A
/// request's answer is asked for by what the request gave, and is to be freed; it is null where none came.
struct XcbLibrary {
  using Connection = void;
  /// As the library hands it over, by value.
  struct Request {
    unsigned int sequence;
  };
  using Reply = void* (*)(Connection* display, Request request, void** error);

  XcbLibrary();

  Connection* (*connect)(const char* name, int* screen) = nullptr;
  int (*connection_has_error)(Connection* display) = nullptr;
  void (*disconnect)(Connection* display) = nullptr;
  Request (*xkb_use_extension)(Connection* display, std::uint16_t major, std::uint16_t minor) = nullptr;
  Reply xkb_use_extension_reply = nullptr;
  Request (*xkb_get_state)(Connection* display, std::uint16_t device) = nullptr;
  Reply xkb_get_state_reply = nullptr;
  Request (*xkb_get_names)(Connection* display, std::uint16_t device, std::uint32_t which) = nullptr;
  Reply xkb_get_names_reply = nullptr;
  Request (*get_atom_name)(Connection* display, std::uint32_t atom) = nullptr;
  Reply get_atom_name_reply = nullptr;
  bool isThere = false;

 private:
  SharedLibrary client_{"libxcb.so.1"};
  SharedLibrary keyboard_{"libxcb-xkb.so.1"};
};

} // namespace quendra::platform::linux_
