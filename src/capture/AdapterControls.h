#pragma once

#include "forms/controls/ComboBox.h"
#include "forms/controls/Controls.h"

namespace quendra::capture {

/// The choice of the adapter that is followed, on the monitor page.
class AdapterControls {
 public:
  explicit AdapterControls(forms::Frame& page) : frameMain(page) {}

  /// The page that they stand on.
  forms::Frame& frameMain;
  forms::Frame main_Frame1{frameMain, u"main_Frame1"};
  forms::ComboBox main_cmbAdapters{main_Frame1, u"main_cmbAdapters"};
  /// One line under the list that says why nothing can be captured; empty when all is well.
  forms::Label main_lblCaptureState{main_Frame1, u"main_lblCaptureState"};
};

} // namespace quendra::capture
