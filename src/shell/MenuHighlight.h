#pragma once

#include "forms/controls/Controls.h"
#include "shell/PageTable.h"

namespace quendra::shell {

/// How the menu answers the mouse: the pictures of its buttons and the decorative lines of its entries.
class MenuHighlight {
 public:
  using Lines = std::array<forms::Line, kEntryCount>;

  struct Controls {
    std::array<forms::PictureBox, kEntryCount>& PicMenu;
    std::array<forms::PictureBox, kPageCount>& picMenu2; ///< highlighted
    std::array<forms::PictureBox, kPageCount>& picMenu3; ///< normal
    Lines& upperLines;
    Lines& lowerLines;
  };

  explicit MenuHighlight(Controls controls) : controls_(controls) {}

  /// The mouse moves over an entry. Once a page was chosen the buttons' pictures stand still.
  void Hover(std::size_t entry, bool pageChosen);
  /// The mouse moves beside the menu.
  void Leave(bool pageChosen);
  void ShowNormal();
  void ShowHighlighted(std::size_t button);

 private:
  /// Shows the lines of an entry of the second row and of the button over it, and hides all others.
  void ShowLinesOf(std::size_t entry);
  void HideAllLines();

  Controls controls_;
};

} // namespace quendra::shell
