#include "shell/MenuHighlight.h"

namespace quendra::shell {

void MenuHighlight::Hover(std::size_t entry, bool pageChosen) {
  if (entry >= kPageCount) return ShowLinesOf(entry);
  if (pageChosen) return;
  ShowNormal();
  ShowHighlighted(entry);
}

void MenuHighlight::Leave(bool pageChosen) {
  HideAllLines();
  if (!pageChosen) ShowNormal();
}

void MenuHighlight::ShowNormal() {
  for (std::size_t button = 0; button < kPageCount; ++button)
    controls_.PicMenu[button].Contents = controls_.picMenu3[button].Contents;
}

void MenuHighlight::ShowHighlighted(std::size_t button) {
  controls_.PicMenu[button].Contents = controls_.picMenu2[button].Contents;
}

void MenuHighlight::ShowLinesOf(std::size_t entry) {
  for (std::size_t each = 0; each < kEntryCount; ++each) {
    const bool shown = each == entry || each + kPageCount == entry;
    controls_.upperLines[each].Visible = shown;
    controls_.lowerLines[each].Visible = shown;
  }
}

void MenuHighlight::HideAllLines() {
  for (MenuHighlight::Lines* lines : {&controls_.upperLines, &controls_.lowerLines})
    for (forms::Line& line : *lines) line.Visible = false;
}

} // namespace quendra::shell
