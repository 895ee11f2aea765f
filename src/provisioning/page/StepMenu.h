#pragma once

#include "forms/controls/ControlArray.h"
#include "forms/controls/Controls.h"

namespace quendra::provisioning {

/// The menu of the page: a picture a step with a hot spot on it and lines that frame the one under the mouse.
/// The pictures bear the captions. Number 0 is the mail account, 1 the connection.
class StepMenu {
 public:
  static constexpr std::size_t kSteps = 2;
  static constexpr std::size_t kLines = 13;
  using Lines = std::array<forms::Line, kSteps>;

  explicit StepMenu(forms::Frame& page);

  /// `pageWidth` is in twips.
  void Design(int pageWidth);
  void ClearMenuLines();

  std::array<forms::PictureBox, kSteps> frsCon_PicMenu;
  std::array<forms::Label, kSteps> frsCon_lblCaption =
      forms::ControlArrayOn<forms::Label>(frsCon_PicMenu, u"frsCon_lblCaption");
  /// `frsCon_Line1` to `frsCon_Line13`.
  std::array<Lines, kLines> frsCon_Lines;
  forms::Label frsCon_lblConnectProb;

 private:
  void frsCon_PicMenu_MouseMove(std::size_t step);
};

} // namespace quendra::provisioning
