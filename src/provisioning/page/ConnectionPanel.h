#pragma once

#include "forms/controls/ControlArray.h"
#include "forms/controls/Controls.h"

namespace quendra::provisioning {

/// The controls of the step that makes the connection: the name and the password, and a row a modem.
class ConnectionPanel {
 public:
  static constexpr std::size_t kModems = 5;
  // Pixels from the step's upper edge to the prompts of its fields.
  static constexpr int kUsernameTop = 66;
  static constexpr int kPasswordTop = 150;

  explicit ConnectionPanel(forms::Frame& page) : frsCon_Frame1(page, u"frsCon_Frame1") {}

  void Design(const forms::Geometry& place);

  forms::Frame frsCon_Frame1;
  forms::Label Title{frsCon_Frame1, u"ConnectionTitle"};
  forms::Label UsernamePrompt{frsCon_Frame1, u"UsernamePrompt"};
  forms::TextBox frsCon_txtUsername{frsCon_Frame1, u"frsCon_txtUsername"};
  forms::Label PasswordPrompt{frsCon_Frame1, u"PasswordPrompt"};
  forms::TextBox frsCon_txtPassword{frsCon_Frame1, u"frsCon_txtPassword"};
  forms::Label ModemsPrompt{frsCon_Frame1, u"ModemsPrompt"};
  std::array<forms::Label, kModems> frsCon_lblModemBG =
      forms::ControlArray<forms::Label, kModems>(frsCon_Frame1, u"frsCon_lblModemBG");
  std::array<forms::Image, kModems> frsCon_imgModems =
      forms::ControlArray<forms::Image, kModems>(frsCon_Frame1, u"frsCon_imgModems");
  std::array<forms::Label, kModems> frsCon_lblModems =
      forms::ControlArray<forms::Label, kModems>(frsCon_Frame1, u"frsCon_lblModems");
  /// The plate of the button.
  forms::PictureBox frsCon_Picture5{frsCon_Frame1, u"frsCon_Picture5"};
  forms::CommandButton frsCon_cmdCreate{frsCon_Picture5, u"frsCon_cmdCreate"};

 private:
  void DesignModems();
};

} // namespace quendra::provisioning
