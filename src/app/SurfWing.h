#pragma once

#include "diagnostics/RouteTracing.h"
#include "diagnostics/SurfChecks.h"
#include "diagnostics/dormant/DownloadOffer.h"
#include "platform/Machine.h"

namespace quendra::app {

/// The one object of each module that works for the page for surf problems. Only the program composes wings,
/// which spares its constructor the parts of each.
class SurfWing {
 public:
  SurfWing(const platform::Machine& machine, forms::Desktop& desktop,
           foundation::modSocketPlus& modSocketPlus, diagnostics::SurfPage& page);

  diagnostics::mdlInternetCache mdlInternetCache;
  foundation::RegEdit regEdit;
  diagnostics::LocalChecks localChecks;
  diagnostics::SurfChecks surfChecks;
  diagnostics::RouteTracing routeTracing;
  diagnostics::DownloadOffer downloadOffer;
};

} // namespace quendra::app
