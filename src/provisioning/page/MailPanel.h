#pragma once

#include "forms/controls/ControlArray.h"
#include "forms/controls/Controls.h"

namespace quendra::provisioning {

/// The controls of the step that sets up a mail program: the names, and a tile a program. Only the tiles of
/// programs that were found are shown.
class MailPanel {
 public:
  static constexpr std::size_t kTiles = 5;
  static constexpr int kEmailUNTop = 150;

  explicit MailPanel(forms::Frame& page) : frsCon_Frame2(page, u"frsCon_Frame2") {
    Tiles.PlacesFromLeft = true;
  }

  void Design(const forms::Geometry& place);
  /// Shows a tile for each token of a text such as "OE|MSO XP|", from the right, each at the next place: a
  /// token that comes twice leaves the first of its places empty. Tokens that stand for no program take no
  /// place.
  void PlaceTiles(TextView tokens);

  forms::Frame frsCon_Frame2;
  forms::Label Title{frsCon_Frame2, u"MailTitle"};
  forms::Label FullNamePrompt{frsCon_Frame2, u"FullNamePrompt"};
  forms::TextBox frsCon_txtFullName{frsCon_Frame2, u"frsCon_txtFullName"};
  forms::Label EmailUNPrompt{frsCon_Frame2, u"EmailUNPrompt"};
  forms::TextBox frsCon_txtEmailUN{frsCon_Frame2, u"frsCon_txtEmailUN"};
  forms::Label MailsPrompt{frsCon_Frame2, u"MailsPrompt"};
  /// Holds the tiles, whose places are told from the left.
  forms::Frame Tiles{frsCon_Frame2, u"MailTiles"};
  std::array<forms::PictureBox, kTiles> frsCon_lblMailsBG =
      forms::ControlArray<forms::PictureBox, kTiles>(Tiles, u"frsCon_lblMailsBG");
  std::array<forms::Label, kTiles> frsCon_lblMailBG2 =
      forms::ControlArrayOn<forms::Label>(frsCon_lblMailsBG, u"frsCon_lblMailBG2");
  std::array<forms::Image, kTiles> frsCon_imgMails =
      forms::ControlArrayOn<forms::Image>(frsCon_lblMailsBG, u"frsCon_imgMails");
  std::array<forms::Label, kTiles> frsCon_lblMails =
      forms::ControlArrayOn<forms::Label>(frsCon_lblMailsBG, u"frsCon_lblMails");
  /// The plate of the button.
  forms::PictureBox frsCon_Picture12{frsCon_Frame2, u"frsCon_Picture12"};
  forms::CommandButton frsCon_cmdCreateEmail{frsCon_Picture12, u"frsCon_cmdCreateEmail"};

 private:
  void DesignTiles();
  void DesignTile(std::size_t tile);
};

} // namespace quendra::provisioning
