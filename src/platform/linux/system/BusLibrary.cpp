#include "platform/linux/system/BusLibrary.h"

namespace quendra::platform::linux_ {

BusLibrary::BusLibrary() {
  isThere = library_.Find("sd_bus_open_user", open_user) && library_.Find("sd_bus_is_ready", is_ready) &&
            library_.Find("sd_bus_process", process) && library_.Find("sd_bus_wait", wait) &&
            library_.Find("sd_bus_close_unref", close_unref) &&
            library_.Find("sd_bus_set_method_call_timeout", set_method_call_timeout) &&
            library_.Find("sd_bus_call_method", call_method) &&
            library_.Find("sd_bus_message_read", message_read) &&
            library_.Find("sd_bus_message_enter_container", message_enter_container) &&
            library_.Find("sd_bus_message_unref", message_unref);
}

} // namespace quendra::platform::linux_
