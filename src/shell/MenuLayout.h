#pragma once

#include "shell/PageTable.h"

#include <algorithm>

/// Where the parts of the main window lie, in pixels: the menu's buttons at the top, the page below them, the
/// second row of entries at the foot. The window, its frame and a panel find room on a screen of 1024 by 768.
namespace quendra::shell::layout {

inline constexpr int kWindowWidth = 1000;
inline constexpr int kWindowHeight = 680;
inline constexpr int kMargin = 14;

inline constexpr int kPages = kPageCount;
inline constexpr int kMenuTop = 10;
inline constexpr int kAboutWidth = 80;
inline constexpr int kButtonGap = 12;
inline constexpr int kButtonWidth =
    std::min(264, (kWindowWidth - 2 * kMargin - kAboutWidth) / kPages - kButtonGap);
inline constexpr int kButtonHeight = 56;

inline constexpr int kLinkWidth = 170;
inline constexpr int kLinkHeight = 24;
inline constexpr int kLinksLeft = (kWindowWidth - kPages * kLinkWidth - (kPages - 1) * kButtonGap) / 2;
inline constexpr int kLinksTop = kWindowHeight - kLinkHeight - 6;

inline constexpr int kPageTop = kMenuTop + kButtonHeight + 8;
inline constexpr int kPageWidth = kWindowWidth - 2 * kMargin;
inline constexpr int kPageHeight = kLinksTop - kPageTop - 6;

} // namespace quendra::shell::layout
