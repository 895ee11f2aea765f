#include "capture/HostAddresses.h"

#include "platform/net/HostNames.h"
#include "platform/net/IpHelper.h"

namespace quendra::capture {

Text HostAddresses::LocalHostAddress(bool last) const {
  const auto name = machine_.hostNames.gethostname();
  if (!name) return {};
  const auto addresses = machine_.hostNames.gethostbyname(*name);
  if (!addresses) return {};
  const std::size_t fromEnd = last ? 1 : 2;
  if (addresses->size() < fromEnd) return {};
  return (*addresses)[addresses->size() - fromEnd].AsText();
}

Text HostAddresses::GatewayAddress() const {
  std::uint32_t size = 0;
  std::vector<platform::AdapterRecord> adapters;
  machine_.ipHelper.GetAdaptersInfo(adapters, size); // without room: it tells the size
  adapters.clear();
  if (machine_.ipHelper.GetAdaptersInfo(adapters, size) != 0) return {};
  for (const platform::AdapterRecord& adapter : adapters)
    for (const std::string& gateway : adapter.gateways)
      if (!gateway.empty()) return FromCodePage(gateway);
  return {};
}

} // namespace quendra::capture
