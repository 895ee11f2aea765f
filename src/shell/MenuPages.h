#pragma once

#include "runtime/Integers.h"
#include "shell/MenuHighlight.h"

#include <array>
#include <functional>

namespace quendra::shell {

/// Switches between the three pages of the main window. At most one is visible; none is at first.
class MenuPages {
 public:
  struct Page {
    forms::Frame& frame;
    std::function<void()> start;
    std::function<void()> stop;
  };
  /// In the order in which they are stopped and hidden: monitor, surf problems, first connection. A page's
  /// place is the number of its button.
  using Pages = std::array<Page, MenuHighlight::kButtons>;

  MenuPages(Pages pages, std::array<forms::Label, MenuHighlight::kEntries>& lblCaption,
            MenuHighlight& highlight)
      : pages_(std::move(pages)), lblCaption_(lblCaption), highlight_(highlight) {}

  /// A click on a menu label; a number that no label has does no more than put the menu back.
  void Choose(int entry);
  /// Puts the menu back to normal, stops the visible page and hides all.
  void resetButtons();

  /// From the first click on a menu label on.
  Boolean16 PageChosen = kFalse16;

 private:
  void Open(int button);

  Pages pages_;
  std::array<forms::Label, MenuHighlight::kEntries>& lblCaption_;
  MenuHighlight& highlight_;
};

} // namespace quendra::shell
