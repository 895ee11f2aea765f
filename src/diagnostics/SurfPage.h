#pragma once

#include "diagnostics/AdvancedPanel.h"
#include "forms/Page.h"
#include "forms/controls/ControlArray.h"

namespace quendra::diagnostics {

/// The page for surf problems: the list of the checks with a rule for each that has begun, and the panel that
/// traces a route.
class SurfPage : public forms::Page {
  using Rules = std::array<forms::PictureBox, 8>;

 public:
  SurfPage(forms::PageWindow& window, const forms::PageRow& row);

  void Design() override;
  /// Where the rule of a check lies, counted from 0, in twips.
  static constexpr int RuleTop(std::size_t rule) { return static_cast<int>(rule) * 255 + 885; }

  forms::Frame& frameSurfProb = frame;
  forms::Label surf_lblTitle{frame, u"surf_lblTitle"};
  forms::Label surf_lblHint{frame, u"surf_lblHint"};
  Rules surf_picLine = forms::ControlArray<forms::PictureBox, 8>(frame, u"surf_picLine");
  forms::ListView surf_ListView1{frame, u"surf_ListView1"};
  forms::ImageList surf_ImageList1{frame, u"surf_ImageList1"};
  forms::CommandButton frmSurf_cmdAdvanced{frame, u"frmSurf_cmdAdvanced"};
  forms::CommandButton surf_cmdDownload{frame, u"surf_cmdDownload"};
  forms::Label surf_Label3{frame, u"surf_Label3"};
  AdvancedPanel advanced{frame};
  forms::Label surf_lblBack{frame, u"surf_lblBack"};
  forms::Timer surf_Timer1{window, u"surf_Timer1", 100, false};

 private:
  void DesignRules();
  void DesignList();
  void DesignButtons();
};

} // namespace quendra::diagnostics
