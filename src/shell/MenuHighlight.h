#pragma once

#include "forms/Controls.h"

#include <array>

namespace quendra::shell {

/// How the menu answers the mouse: the pictures of its three buttons and the decorative lines of its six
/// entries.
class MenuHighlight {
 public:
  static constexpr int kButtons = 3;
  static constexpr int kEntries = 6;
  using Lines = std::array<forms::Line, kEntries>;

  struct Controls {
    std::array<forms::PictureBox, kEntries>& PicMenu;
    std::array<forms::PictureBox, kButtons>& picMenu2; ///< highlighted
    std::array<forms::PictureBox, kButtons>& picMenu3; ///< normal
    Lines& upperLines;
    Lines& lowerLines;
  };

  explicit MenuHighlight(Controls controls) : controls_(controls) {}

  /// The mouse moves over an entry, 0 to 5. Once a page was chosen the buttons' pictures stand still.
  void Hover(int entry, bool pageChosen);
  /// The mouse moves beside the menu.
  void Leave(bool pageChosen);
  void ShowNormal();
  /// A button, 0 to 2.
  void ShowHighlighted(int button);

 private:
  /// Shows the lines of two entries and hides all others; -1 stands for no entry.
  void ShowLinesOf(int entry, int second);

  Controls controls_;
};

} // namespace quendra::shell
