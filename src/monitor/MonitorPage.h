#pragma once

#include "forms/ComboBox.h"
#include "forms/Controls.h"
#include "forms/ListView.h"

namespace quendra::monitor {

/// The controls of the monitor page that its logic uses; the main window owns them.
struct MonitorPage {
  forms::Frame& frameMain;
  forms::ListView& main_ListView1;
  forms::ImageList& main_ImList;
  forms::ImageList& main_headersIL;
  forms::PictureBox& main_Pic;
  forms::Label& main_lblUpload;
  forms::Label& main_lblDownload;
  forms::ComboBox& main_cmbAdapters;
  /// One line under the adapter list that says why nothing can be captured; empty when all is well.
  forms::Label& main_lblCaptureState;
};

/// Fields of the main window that the parts of the monitor share.
struct MonitorFields {
  std::int32_t OsVersionCode =
      0; ///< 0, 32, 95, 98, 351, 40, 2000 or 2002; written when the main window loads
  std::int32_t LastRefreshTick = 0; ///< milliseconds; set by whoever runs a pass, never by the pass

  /// Milliseconds from the last refresh to `tick`, modulo 2^32 and without a sign: with one, a page opened
  /// when the system has been up for 25 days or more would never refresh, as the day number that seeds it
  /// would lie ahead.
  std::uint32_t SinceLastRefresh(std::uint32_t tick) const {
    return tick - static_cast<std::uint32_t>(LastRefreshTick);
  }
};

} // namespace quendra::monitor
