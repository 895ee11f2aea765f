#include "platform/linux/net/LinuxIpHelper.h"

#include "platform/linux/net/NetworkInterfaces.h"

#include <algorithm>

namespace quendra::platform::linux_ {

LinuxIpHelper::LinuxIpHelper(const ProcFolder& folder, SocketOwners::Rights rights, Clock clock)
    : folder_(folder), owners_(folder, rights, std::move(clock)) {}

std::uint32_t LinuxIpHelper::AllocateAndGetTcpExTableFromStack(TcpTable& table) {
  if (!diagnostics_.Read(sockets_)) return kErrorNotSupported;
  owners_.Update(sockets_);

  auto bytes = std::make_shared<std::vector<std::uint8_t>>(TcpTableEntry::kFirstOffset +
                                                           TcpTableEntry::kBytes * sockets_.size());
  PutLittle32(*bytes, 0, static_cast<std::uint32_t>(sockets_.size()));
  std::size_t at = TcpTableEntry::kFirstOffset;
  for (const TcpSocket& socket : sockets_) {
    const TcpTableEntry entry{socket.state,         socket.localAddress, socket.localPort,
                              socket.remoteAddress, socket.remotePort,   owners_.OwnerOf(socket.node)};
    entry.WriteTo(*bytes, at);
    at += TcpTableEntry::kBytes;
  }
  table = std::move(bytes);
  return 0;
}

std::uint32_t LinuxIpHelper::GetAdaptersInfo(std::vector<AdapterRecord>& adapters, std::uint32_t& size) {
  auto interfaces = ReadNetworkInterfaces(folder_);
  std::erase_if(interfaces, [](const auto& interface) { return interface.isLoopback; });
  const std::size_t needed = interfaces.size() * kAdapterBytes;
  if (size < needed) {
    size = static_cast<std::uint32_t>(needed);
    return kErrorBufferOverflow;
  }
  // The way to the world first: whoever takes the first gateway takes the one in use.
  const auto rank = [](const NetworkInterface& interface) {
    return interface.hasDefaultRoute ? std::uint64_t{interface.metric} : UINT64_MAX;
  };
  std::stable_sort(interfaces.begin(), interfaces.end(),
                   [&](const auto& left, const auto& right) { return rank(left) < rank(right); });
  adapters.clear();
  for (const auto& interface : interfaces) {
    AdapterRecord& adapter = adapters.emplace_back();
    adapter.name = adapter.description = interface.name;
    std::ranges::transform(interface.addresses, std::back_inserter(adapter.addresses), &Ipv4Address::AsAscii);
    std::ranges::transform(interface.gateways, std::back_inserter(adapter.gateways), &Ipv4Address::AsAscii);
  }
  return 0;
}

std::uint32_t LinuxIpHelper::GetIfTable(std::span<std::uint8_t> buffer, std::uint32_t& size, bool) {
  std::vector<InterfaceRow> rows;
  if (!interfaces_.Read(rows)) return kErrorNotSupported;
  return PutInterfaceTable(rows, buffer, size);
}

} // namespace quendra::platform::linux_
