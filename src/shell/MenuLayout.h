#pragma once

/// Where the parts of the main window lie, in pixels: the menu's buttons at the top, the page below them, the
/// second row of entries at the foot.
namespace quendra::shell::layout {

inline constexpr int kWindowWidth = 1150;
inline constexpr int kWindowHeight = 760;
inline constexpr int kMargin = 16;

inline constexpr int kMenuTop = 14;
inline constexpr int kButtonWidth = 264;
inline constexpr int kButtonHeight = 64;
inline constexpr int kButtonGap = 12;

inline constexpr int kLinkWidth = 170;
inline constexpr int kLinkHeight = 26;
inline constexpr int kLinksLeft = (kWindowWidth - 3 * kLinkWidth - 2 * kButtonGap) / 2;
inline constexpr int kLinksTop = kWindowHeight - kLinkHeight - 8;

inline constexpr int kPageTop = kMenuTop + kButtonHeight + 12;
inline constexpr int kPageWidth = kWindowWidth - 2 * kMargin;
inline constexpr int kPageHeight = kLinksTop - kPageTop - 8;

} // namespace quendra::shell::layout
