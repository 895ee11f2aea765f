#include "capture/HostAddresses.h"

namespace quendra::capture {

Text HostAddresses::LocalHostAddress(HostAddress which) const {
  const auto name = hostNames_.gethostname();
  if (!name) return {};
  const auto addresses = hostNames_.gethostbyname(*name);
  if (!addresses) return {};
  const std::size_t fromEnd = which == HostAddress::Last ? 1 : 2;
  if (addresses->size() < fromEnd) return {};
  return (*addresses)[addresses->size() - fromEnd].AsText();
}

Text HostAddresses::GatewayAddress() const {
  std::uint32_t size = 0;
  std::vector<platform::AdapterRecord> adapters;
  ipHelper_.GetAdaptersInfo(adapters, size); // without room: it tells the size
  adapters.clear();
  if (ipHelper_.GetAdaptersInfo(adapters, size) != 0) return {};
  for (const platform::AdapterRecord& adapter : adapters)
    for (const std::string& gateway : adapter.gateways)
      if (!gateway.empty()) return FromCodePage(gateway);
  return {};
}

} // namespace quendra::capture
