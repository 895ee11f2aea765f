#include "platform/linux/keyboard/LinuxKeyboardLayout.h"

#include "platform/linux/keyboard/DisplayKeyboard.h"
#include "platform/linux/keyboard/KeyboardLayoutNames.h"
#include "platform/linux/keyboard/SessionKeyboard.h"

#include <cstdlib>
#include <string_view>

namespace quendra::platform::linux_ {

namespace {

std::string_view Variable(const char* name) {
  const char* value = std::getenv(name);
  return value == nullptr ? "" : value;
}

/// Where windows are Wayland's own, the X display beside them hears of no key. The toolkit shows its windows
/// on that display in sessions of GNOME all the same.
bool WindowsAreOfWayland() {
  return Variable("XDG_SESSION_TYPE") == "wayland" &&
         Variable("XDG_CURRENT_DESKTOP").find("GNOME") == std::string_view::npos;
}

} // namespace

std::optional<std::string> LinuxKeyboardLayout::GetKeyboardLayoutNameA() {
  if (WindowsAreOfWayland()) {
    const auto code = ActiveLayoutCode();
    return code ? LayoutNameOfCode(*code) : std::nullopt;
  }
  const auto keymap = ActiveKeymap();
  return keymap ? LayoutNameOfKeymap(*keymap) : std::nullopt;
}

} // namespace quendra::platform::linux_
