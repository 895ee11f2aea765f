#pragma once

#include "forms/controls/Controls.h"

#include <array>
#include <cstdint>

namespace quendra::provisioning {

/// What of the page the making of a connection reads and changes.
struct ConnectionStep {
  const std::int16_t& SelectedModem;
  forms::TextBox& frsCon_txtUsername;
  forms::TextBox& frsCon_txtPassword;
  forms::Control& frsCon_cmdCreate;
  /// Those beside user name and password.
  std::array<forms::Control*, 2> frsCon_lblError;
  forms::Frame& frsCon_Frame1;
  forms::Frame& frsCon_Frame2;
  forms::TextBox& frsCon_txtEmailUN;
};

} // namespace quendra::provisioning
