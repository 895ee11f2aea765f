#pragma once

#include "diagnostics/AdvancedPanel.h"
#include "diagnostics/mdlTracert.h"
#include "forms/FormHost.h"
#include "foundation/InputNormaliser.h"

namespace quendra::diagnostics {

/// What the controls of the advanced panel ask of other modules: the trace, and the mending of what is typed
/// with the Hebrew layout.
class RouteTracing {
 public:
  RouteTracing(AdvancedPanel& panel, const mdlTracert::Network& network, forms::FormHost& forms,
               forms::MessageLoop& loop, platform::KeyboardLayout& layout);

 private:
  mdlTracert mdlTracert_;
  foundation::InputNormaliser normaliser_;
};

} // namespace quendra::diagnostics
