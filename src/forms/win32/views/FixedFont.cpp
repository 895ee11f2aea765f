#include "forms/win32/views/FixedFont.h"

#include <algorithm>
#include <iterator>

namespace quendra::forms::win32 {

namespace {
/// On each system from XP on, with the signs of Hebrew. Where it is missing, the pitch asks for its like.
constexpr wchar_t kFamily[] = L"Courier New";
} // namespace

FixedFont::~FixedFont() {
  if (made_) ::DeleteObject(made_);
}

HFONT FixedFont::As(HFONT letters) {
  LOGFONTW wanted{};
  if (!::GetObjectW(letters, sizeof wanted, &wanted)) return letters;
  wanted.lfPitchAndFamily = FIXED_PITCH | FF_MODERN;
  std::copy(std::begin(kFamily), std::end(kFamily), wanted.lfFaceName);
  if (made_) ::DeleteObject(made_);
  made_ = ::CreateFontIndirectW(&wanted);
  return made_ ? made_ : letters;
}

} // namespace quendra::forms::win32
