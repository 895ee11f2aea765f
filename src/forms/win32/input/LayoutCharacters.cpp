#include "forms/win32/input/LayoutCharacters.h"

namespace quendra::forms::win32 {

char16_t CharacterAlone(UINT key, HKL layout) {
  constexpr UINT kWaitsForNext = 0x80000000;
  const UINT plain = ::MapVirtualKeyExW(key, MAPVK_VK_TO_CHAR, layout);
  if (plain == 0 || plain & kWaitsForNext) return u'\0';
  // The plain map knows letters by their Latin names alone.
  const BYTE nothingHeld[256] = {};
  wchar_t given[4] = {};
  const UINT scanCode = ::MapVirtualKeyExW(key, MAPVK_VK_TO_VSC, layout);
  const int count = ::ToUnicodeEx(key, scanCode, nothingHeld, given, 4, 0, layout);
  return count == 1 && given[0] >= L' ' ? static_cast<char16_t>(given[0]) : static_cast<char16_t>(plain);
}

char16_t LayoutCharacters::Of(UINT key, HKL layout) {
  if (key >= std::tuple_size_v<Characters>) return u'\0';
  const auto [found, isNew] = known_.try_emplace(layout);
  for (UINT each = 0; isNew && each < found->second.size(); ++each) found->second[each] = ask_(each, layout);
  return found->second[key];
}

} // namespace quendra::forms::win32
