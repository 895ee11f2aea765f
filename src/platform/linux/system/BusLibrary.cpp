#include "platform/linux/system/BusLibrary.h"

#include <chrono>

namespace quendra::platform::linux_ {

BusLibrary::BusLibrary() { isThere = FindConnections() && FindQuestions() && FindMessages(); }

bool BusLibrary::FindConnections() {
  return library_.Find("sd_bus_open_user", open_user) && library_.Find("sd_bus_open_system", open_system) &&
         library_.Find("sd_bus_is_ready", is_ready) && library_.Find("sd_bus_process", process) &&
         library_.Find("sd_bus_wait", wait) && library_.Find("sd_bus_get_fd", get_fd) &&
         library_.Find("sd_bus_close_unref", close_unref);
}

bool BusLibrary::FindQuestions() {
  return library_.Find("sd_bus_set_method_call_timeout", set_method_call_timeout) &&
         library_.Find("sd_bus_call_method", call_method) && library_.Find("sd_bus_call", call) &&
         library_.Find("sd_bus_call_async", call_async) && library_.Find("sd_bus_add_match", add_match) &&
         library_.Find("sd_bus_error_free", error_free) && library_.Find("sd_bus_slot_unref", slot_unref);
}

bool BusLibrary::FindMessages() {
  return library_.Find("sd_bus_message_new_method_call", message_new_method_call) &&
         library_.Find("sd_bus_message_append_basic", message_append_basic) &&
         library_.Find("sd_bus_message_open_container", message_open_container) &&
         library_.Find("sd_bus_message_close_container", message_close_container) &&
         library_.Find("sd_bus_message_read", message_read) &&
         library_.Find("sd_bus_message_read_basic", message_read_basic) &&
         library_.Find("sd_bus_message_peek_type", message_peek_type) &&
         library_.Find("sd_bus_message_enter_container", message_enter_container) &&
         library_.Find("sd_bus_message_exit_container", message_exit_container) &&
         library_.Find("sd_bus_message_get_error", message_get_error) &&
         library_.Find("sd_bus_message_get_sender", message_get_sender) &&
         library_.Find("sd_bus_message_get_path", message_get_path) &&
         library_.Find("sd_bus_message_get_interface", message_get_interface) &&
         library_.Find("sd_bus_message_get_member", message_get_member) &&
         library_.Find("sd_bus_message_unref", message_unref);
}

bool BusLibrary::LetsUsIn(Object* bus, std::uint64_t microseconds) const {
  using std::chrono::steady_clock;
  const auto end = steady_clock::now() + std::chrono::microseconds(microseconds);
  for (auto now = steady_clock::now(); now < end; now = steady_clock::now()) {
    if (is_ready(bus) > 0) return true;
    const int handled = process(bus, nullptr);
    if (handled < 0) return false;
    const auto left = std::chrono::duration_cast<std::chrono::microseconds>(end - now).count();
    if (handled == 0 && wait(bus, static_cast<std::uint64_t>(left)) < 0) return false;
  }
  return false;
}

} // namespace quendra::platform::linux_
