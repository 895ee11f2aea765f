#include "shell/MenuPages.h"

namespace quendra::shell {

void MenuPages::Choose(std::size_t entry) {
  PageChosen = kTrue16;
  resetButtons();
  if (entry < kEntryCount) Open(PageOfEntry(entry));
}

void MenuPages::resetButtons() {
  for (forms::Label& label : lblCaption_) label.Visible = true;
  highlight_.ShowNormal();
  for (forms::Page* page : pages_)
    if (page->IsOpen()) page->Stop();
  for (forms::Page* page : pages_) page->frame.Visible = false;
}

void MenuPages::StopWithWindow() {
  for (forms::Page* page : pages_)
    if (page->row.stopsWithItsWindow && page->IsOpen()) page->Stop();
}

void MenuPages::Open(std::size_t button) {
  if (button >= pages_.size()) return;
  forms::Page& page = *pages_[button];
  if (page.IsOpen()) return;
  page.Start();
  page.frame.Visible = true;
  page.frame.BringToFront();
  highlight_.ShowHighlighted(button);
}

} // namespace quendra::shell
