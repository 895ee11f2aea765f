#include "platform/simulated/net/SimulatedIpHelper.h"

#include "platform/simulated/SimulatedCore.h"

#include <algorithm>

namespace quendra::platform::simulated {

std::uint32_t SimulatedIpHelper::AllocateAndGetTcpExTableFromStack(TcpTable& table) {
  if (TableError != 0) return TableError;
  ++TablesFetched;
  std::vector<std::uint8_t> bytes(TcpTableEntry::kFirstOffset + TcpTableEntry::kBytes * Connections.size());
  PutLittle32(bytes, 0, static_cast<std::uint32_t>(Connections.size()));
  std::size_t at = TcpTableEntry::kFirstOffset;
  for (const Connection& connection : Connections) {
    const TcpTableEntry entry{connection.state,
                              AddressOf(connection.localAddress).InMemory(),
                              PortInMemory(connection.localPort),
                              AddressOf(connection.remoteAddress).InMemory(),
                              PortInMemory(connection.remotePort),
                              connection.owner};
    entry.WriteTo(bytes, at);
    at += TcpTableEntry::kBytes;
  }
  table = std::make_shared<const std::vector<std::uint8_t>>(std::move(bytes));
  return 0;
}

std::uint32_t
SimulatedIpHelper::SetTcpEntry(std::span<const std::uint8_t, TcpTableEntry::kBytesWithoutOwner> record) {
  std::copy(record.begin(), record.end(), Deleted.emplace_back().begin());
  return SetTcpEntryResult;
}

std::uint32_t SimulatedIpHelper::GetAdaptersInfo(std::vector<AdapterRecord>& adapters, std::uint32_t& size) {
  if (AdaptersError != 0) return AdaptersError;
  const auto needed = static_cast<std::uint32_t>(kAdapterBytes * Adapters.size());
  if (size < needed) {
    size = needed;
    return kErrorBufferOverflow;
  }
  adapters = Adapters;
  return 0;
}

std::uint32_t SimulatedIpHelper::GetIfTable(std::span<std::uint8_t> buffer, std::uint32_t& size,
                                            bool sorted) {
  InterfaceCalls.push_back(sorted);
  if (InterfacesError != 0) return InterfacesError;
  if (!buffer.empty() && InterfacesErrorWithRoom != 0) return InterfacesErrorWithRoom;
  return PutInterfaceTable(Interfaces, buffer, size);
}

} // namespace quendra::platform::simulated
