#include "shell/MenuHighlight.h"

namespace quendra::shell {

void MenuHighlight::Hover(int entry, bool pageChosen) {
  if (entry >= kButtons) return ShowLinesOf(entry, entry - kButtons);
  if (pageChosen) return;
  ShowNormal();
  ShowHighlighted(entry);
}

void MenuHighlight::Leave(bool pageChosen) {
  ShowLinesOf(-1, -1);
  if (!pageChosen) ShowNormal();
}

void MenuHighlight::ShowNormal() {
  for (std::size_t button = 0; button < kButtons; ++button)
    controls_.PicMenu[button].Contents = controls_.picMenu3[button].Contents;
}

void MenuHighlight::ShowHighlighted(int button) {
  const auto index = static_cast<std::size_t>(button);
  controls_.PicMenu[index].Contents = controls_.picMenu2[index].Contents;
}

void MenuHighlight::ShowLinesOf(int entry, int second) {
  for (int each = 0; each < kEntries; ++each) {
    const bool shown = each == entry || each == second;
    controls_.upperLines[static_cast<std::size_t>(each)].Visible = shown;
    controls_.lowerLines[static_cast<std::size_t>(each)].Visible = shown;
  }
}

} // namespace quendra::shell
