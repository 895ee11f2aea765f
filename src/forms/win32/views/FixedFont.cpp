#include "forms/win32/views/FixedFont.h"

#include <algorithm>

namespace quendra::forms::win32 {

namespace {
/// The first is there on each system from XP on, with the signs of Hebrew.
constexpr const wchar_t* kFamilies[] = {L"Courier New", L"DejaVu Sans Mono", L"Lucida Console"};

/// A system that lacks a family gives another one, whatever pitch is asked for.
bool IsFixed(HFONT font) {
  const HDC device = ::CreateCompatibleDC(nullptr);
  const HGDIOBJ before = ::SelectObject(device, font);
  TEXTMETRICW metrics{};
  ::GetTextMetricsW(device, &metrics);
  ::SelectObject(device, before);
  ::DeleteDC(device);
  return (metrics.tmPitchAndFamily & TMPF_FIXED_PITCH) == 0; // the bit means the opposite of its name
}
} // namespace

FixedFont::~FixedFont() {
  if (made_) ::DeleteObject(made_);
}

HFONT FixedFont::As(HFONT letters) {
  if (made_ && of_ == letters) return made_;
  of_ = letters;
  LOGFONTW wanted{};
  if (!::GetObjectW(letters, sizeof wanted, &wanted)) return letters;
  wanted.lfPitchAndFamily = FIXED_PITCH | FF_MODERN;
  for (const wchar_t* family : kFamilies) {
    *std::copy_n(family, std::min<std::size_t>(::lstrlenW(family), LF_FACESIZE - 1), wanted.lfFaceName) =
        L'\0';
    if (made_) ::DeleteObject(made_);
    made_ = ::CreateFontIndirectW(&wanted);
    if (made_ && IsFixed(made_)) break;
  }
  return made_ ? made_ : letters;
}

} // namespace quendra::forms::win32
