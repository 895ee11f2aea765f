#include "platform/linux/keyboard/XcbLibrary.h"

namespace quendra::platform::linux_ {

XcbLibrary::XcbLibrary() {
  isThere = client_.Find("xcb_connect", connect) &&
            client_.Find("xcb_connection_has_error", connection_has_error) &&
            client_.Find("xcb_disconnect", disconnect) && client_.Find("xcb_get_atom_name", get_atom_name) &&
            client_.Find("xcb_get_atom_name_reply", get_atom_name_reply) &&
            keyboard_.Find("xcb_xkb_use_extension", xkb_use_extension) &&
            keyboard_.Find("xcb_xkb_use_extension_reply", xkb_use_extension_reply) &&
            keyboard_.Find("xcb_xkb_get_state", xkb_get_state) &&
            keyboard_.Find("xcb_xkb_get_state_reply", xkb_get_state_reply) &&
            keyboard_.Find("xcb_xkb_get_names", xkb_get_names) &&
            keyboard_.Find("xcb_xkb_get_names_reply", xkb_get_names_reply);
}

} // namespace quendra::platform::linux_
