#include "diagnostics/dormant/DownloadOffer.h"

#include "foundation/Wording.h"

namespace quendra::diagnostics {

DownloadOffer::DownloadOffer(SurfPage& page, forms::MessageLoop& loop) : loop_(loop) {
  page.surf_cmdDownload.Click = [this] { surf_cmdDownload_Click(); };
}

void DownloadOffer::surf_cmdDownload_Click() {
  loop_.MessageBox(
      u"חשוב לציין:\r\nהתוכנות אינן של זלמר בינלאומי,\r\nואינן נתמכות במוקד התמיכה.\r\n\r\nלהמשיך?",
      forms::kYesNo | forms::kExclamation | forms::kHebrewBox, foundation::kTitle);
}

} // namespace quendra::diagnostics
