#pragma once

#include "diagnostics/SurfPage.h"
#include "forms/MessageLoop.h"

namespace quendra::diagnostics {

/// Dormant: the warning before outside helper programs are offered. Its button is hidden, and there is no
/// menu of programs that a Yes could open.
class DownloadOffer {
 public:
  DownloadOffer(SurfPage& page, forms::MessageLoop& loop);

  void surf_cmdDownload_Click();

 private:
  forms::MessageLoop& loop_;
};

} // namespace quendra::diagnostics
