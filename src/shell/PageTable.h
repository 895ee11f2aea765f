#pragma once

#include "forms/Page.h"

#include <array>

namespace quendra::shell {

enum PageNumber : std::size_t { kMonitorPage, kSurfPage, kFirstConnectionPage, kPageCount };

/// The pages of the main window in the order of their buttons, in which they are stopped and hidden too.
inline constexpr std::array<forms::PageRow, kPageCount> kPageTable{{
    {u"ניטור תהליכים", "menu_monitor", u"frameMain", true},
    {u"בעיות גלישה", "menu_surf", u"frameSurfProb", false},
    {u"התחברות ראשונה", "menu_connect", u"frameFirstConnection", false},
}};

/// The menu has two rows of entries: the buttons, and at the foot of the window the same in reverse order.
inline constexpr std::size_t kEntryCount = 2 * kPageCount;

constexpr std::size_t PageOfEntry(std::size_t entry) {
  return entry < kPageCount ? entry : kEntryCount - 1 - entry;
}

} // namespace quendra::shell
