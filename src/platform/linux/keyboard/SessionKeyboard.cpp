#include "platform/linux/keyboard/SessionKeyboard.h"

#include "platform/linux/system/SessionBus.h"

namespace quendra::platform::linux_ {

namespace {

constexpr const char* kService = "org.kde.keyboard";
constexpr const char* kLayoutsInterface = "org.kde.KeyboardLayouts";
constexpr SessionBus::Method kGetLayout{kService, "/Layouts", kLayoutsInterface, "getLayout"};
constexpr SessionBus::Method kGetLayoutsList{kService, "/Layouts", kLayoutsInterface, "getLayoutsList"};

/// The code of the layout with that index in a list of code, shown name and full name each.
std::optional<std::string> CodeAt(const BusLibrary& library, void* list, std::uint32_t index) {
  if (library.message_enter_container(list, 'a', "(sss)") <= 0) return {};
  for (std::uint32_t at = 0;; ++at) {
    const char* code = nullptr;
    const char* shown = nullptr;
    const char* full = nullptr;
    if (library.message_read(list, "(sss)", &code, &shown, &full) <= 0) return {};
    if (at == index) return code;
  }
}

} // namespace

std::optional<std::string> ActiveLayoutCode() {
  const SessionBus bus;
  const auto layout = bus.Ask(kGetLayout, "");
  std::uint32_t index = 0;
  if (!layout || bus.Library().message_read(layout.get(), "u", &index) <= 0) return {};
  const auto list = bus.Ask(kGetLayoutsList, "");
  return list ? CodeAt(bus.Library(), list.get(), index) : std::nullopt;
}

} // namespace quendra::platform::linux_
