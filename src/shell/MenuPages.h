#pragma once

#include "forms/Page.h"
#include "runtime/Integers.h"
#include "shell/MenuHighlight.h"

#include <array>
#include <vector>

namespace quendra::shell {

/// Switches between the pages of the main window. At most one is visible; none is at first.
class MenuPages {
 public:
  MenuPages(std::array<forms::Label, kEntryCount>& lblCaption, MenuHighlight& highlight)
      : lblCaption_(lblCaption), highlight_(highlight) {}

  /// In the order of the buttons, in which pages are stopped and hidden too.
  void Add(forms::Page& page) { pages_.push_back(&page); }
  const std::vector<forms::Page*>& All() const { return pages_; }

  /// A click on a menu label; a number that no label has does no more than put the menu back.
  void Choose(std::size_t entry);
  /// Puts the menu back to normal, stops the visible page and hides all.
  void resetButtons();
  /// The window unloads.
  void StopWithWindow();

  /// From the first click on a menu label on.
  Boolean16 PageChosen = kFalse16;

 private:
  void Open(std::size_t button);

  std::vector<forms::Page*> pages_;
  std::array<forms::Label, kEntryCount>& lblCaption_;
  MenuHighlight& highlight_;
};

} // namespace quendra::shell
