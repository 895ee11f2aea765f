#include "app/SurfWing.h"

namespace quendra::app {

SurfWing::SurfWing(const platform::Machine& machine, forms::Desktop& desktop,
                   foundation::modSocketPlus& modSocketPlus, diagnostics::SurfPage& page)
    : mdlInternetCache(machine.urlCache), regEdit(machine.registry, desktop),
      localChecks{
          diagnostics::CacheCheck(machine.urlCache, mdlInternetCache, regEdit),
          diagnostics::ProcessorCheck(machine.system, machine.performanceData, machine.registry),
          diagnostics::LineCheck(machine.ipHelper, machine.system, desktop),
          diagnostics::SharingCheck(machine.processes),
      },
      surfChecks(modSocketPlus, desktop, page, localChecks),
      routeTracing(page.advanced, {machine.sockets, machine.hostNames, machine.icmp}, desktop, desktop,
                   machine.keyboardLayout),
      downloadOffer(page, desktop) {}

} // namespace quendra::app
