#include "shell/MenuPages.h"

namespace quendra::shell {

namespace {

/// The second row repeats the entries of the first in reverse order.
constexpr int kButtonOf[] = {0, 1, 2, 2, 1, 0};

} // namespace

void MenuPages::Choose(int entry) {
  PageChosen = kTrue16;
  resetButtons();
  if (entry >= 0 && entry < MenuHighlight::kEntries) Open(kButtonOf[entry]);
}

void MenuPages::resetButtons() {
  for (forms::Label& label : lblCaption_) label.Visible = true;
  highlight_.ShowNormal();
  for (Page& page : pages_)
    if (page.frame.Visible) page.stop();
  for (Page& page : pages_) page.frame.Visible = false;
}

void MenuPages::Open(int button) {
  Page& page = pages_[static_cast<std::size_t>(button)];
  if (page.frame.Visible) return;
  page.start();
  page.frame.Visible = true;
  page.frame.BringToFront();
  highlight_.ShowHighlighted(button);
}

} // namespace quendra::shell
