#include "provisioning/FirstConnectionPage.h"

#include "foundation/Looks.h"

namespace quendra::provisioning {

FirstConnectionPage::FirstConnectionPage(forms::PageWindow& window, const forms::PageRow& row)
    : Page(window, row) {
  Start = [this] { PrepareFirstConnectionPage(); };
  Stop = [this] { CloseFirstConnectionPage(); };
  frsCon_lblBack.Click = [this] { CloseFirstConnectionPage(); };
}

void FirstConnectionPage::Design() {
  foundation::looks::PageHead(frsCon_lblTitle, frsCon_lblBack, row.caption, frame.Position().width);
}

void FirstConnectionPage::PrepareFirstConnectionPage() { frameFirstConnection.Visible = true; }

void FirstConnectionPage::CloseFirstConnectionPage() { frameFirstConnection.Visible = false; }

} // namespace quendra::provisioning
