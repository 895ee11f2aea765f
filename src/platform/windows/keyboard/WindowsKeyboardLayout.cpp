#include "platform/windows/keyboard/WindowsKeyboardLayout.h"

#include "winapi/Winapi.h"

#include <array>

namespace quendra::platform::windows {

std::optional<std::string> WindowsKeyboardLayout::GetKeyboardLayoutNameA() {
  std::array<wchar_t, KL_NAMELENGTH> name{};
  if (!::GetKeyboardLayoutNameW(name.data())) return {};
  return ToCodePage(winapi::TextOf(name.data()));
}

} // namespace quendra::platform::windows
