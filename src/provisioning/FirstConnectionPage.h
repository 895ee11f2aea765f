#pragma once

#include "forms/Page.h"

namespace quendra::provisioning {

/// The page on which a subscriber makes the first connection.
class FirstConnectionPage : public forms::Page {
 public:
  FirstConnectionPage(forms::PageWindow& window, const forms::PageRow& row);

  void Design() override;

  forms::Frame& frameFirstConnection = frame;
  forms::Label frsCon_lblTitle{frame, u"frsCon_lblTitle"};
  forms::Label frsCon_lblBack{frame, u"frsCon_lblBack"};

 private:
  void PrepareFirstConnectionPage();
  void CloseFirstConnectionPage();
};

} // namespace quendra::provisioning
