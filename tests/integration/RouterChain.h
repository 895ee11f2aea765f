#pragma once

#include "integration/SlowLink.h"

#include <memory>
#include <optional>
#include <vector>

namespace quendra::integration {

/// This host, routers in a row behind it and a host behind the last one, each in a namespace of its own. Link
/// 0 leads from this host to router 1. The thread is on this host.
class RouterChain {
 public:
  explicit RouterChain(int routers);
  /// The first link is the test's own.
  RouterChain(int routers, SlowLink::Rule firstLink);

  /// The near end of link i is 10.20.i.1, the far one 10.20.i.2: what a router shows of itself.
  static std::string NearAddress(int link) { return "10.20." + std::to_string(link) + ".1"; }
  static std::string FarAddress(int link) { return "10.20." + std::to_string(link) + ".2"; }
  std::string RouterAddress(int router) const { return FarAddress(router - 1); }
  std::string TargetAddress() const { return FarAddress(static_cast<int>(hosts_.size()) - 2); }

  const NetworkNamespace& Self() const { return *hosts_.front(); }
  const NetworkNamespace& Router(int router) const { return *hosts_[static_cast<std::size_t>(router)]; }
  /// The router passes everything on and never answers.
  void Silence(int router);

 private:
  void MakeHosts(int routers);
  void MakeLink(int link);
  void SetAddresses(int link);
  void SetRoutes(int host);

  // Made one after another from the outside, so each goes back there.
  std::vector<std::unique_ptr<NetworkNamespace>> hosts_;
  std::optional<SlowLink> slowLink_;
};

} // namespace quendra::integration
