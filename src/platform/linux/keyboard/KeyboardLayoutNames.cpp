#include "platform/linux/keyboard/KeyboardLayoutNames.h"

#include <algorithm>
#include <array>

namespace quendra::platform::linux_ {

namespace {

struct Layout {
  std::string_view code;
  std::string_view keymap;
  const char* name;
};

constexpr std::array kLayouts{
    Layout{"us", "English (US)", "00000409"},
    Layout{"us", "English (US, intl., with dead keys)", "00020409"},
    Layout{"us", "English (Dvorak)", "00010409"},
    Layout{"gb", "English (UK)", "00000809"},
    Layout{"il", "Hebrew", "0000040D"},
    // The same keys, with points for vowels on a further level.
    Layout{"il", "Hebrew (lyx)", "0000040D"},
    Layout{"ara", "Arabic", "00000401"},
    Layout{"ru", "Russian", "00000419"},
    Layout{"ru", "Russian (typewriter)", "00010419"},
    Layout{"ua", "Ukrainian", "00000422"},
    Layout{"fr", "French", "0000040C"},
    Layout{"de", "German", "00000407"},
    Layout{"es", "Spanish", "0000040A"},
    Layout{"it", "Italian", "00000410"},
    Layout{"pt", "Portuguese", "00000816"},
    Layout{"br", "Portuguese (Brazil)", "00000416"},
    Layout{"ro", "Romanian", "00000418"},
    Layout{"pl", "Polish", "00000415"},
    Layout{"hu", "Hungarian", "0000040E"},
    Layout{"tr", "Turkish", "0000041F"},
    Layout{"gr", "Greek", "00000408"},
    Layout{"ir", "Persian", "00000429"},
    Layout{"et", "Amharic", "0000045E"},
};

/// The first one fits a code, which doesn't tell a layout's variants apart.
std::optional<std::string> NameOf(std::string_view Layout::*key, std::string_view wanted) {
  const auto found = std::ranges::find(kLayouts, wanted, key);
  if (found == kLayouts.end()) return {};
  return found->name;
}

} // namespace

std::optional<std::string> LayoutNameOfKeymap(std::string_view keymap) {
  return NameOf(&Layout::keymap, keymap);
}

std::optional<std::string> LayoutNameOfCode(std::string_view code) { return NameOf(&Layout::code, code); }

} // namespace quendra::platform::linux_
