#include "platform/simulated/net/SimulatedNetwork.h"

#include <algorithm>

namespace quendra::platform::simulated {

namespace {

constexpr std::uint32_t kEntrySize = 24;
constexpr std::uint32_t kAdapterSize = 640;

std::uint32_t PortInMemory(std::uint16_t port) {
  return static_cast<std::uint32_t>(port >> 8) | static_cast<std::uint32_t>(port & 0xFF) << 8;
}

} // namespace

std::uint32_t SimulatedIpHelper::AllocateAndGetTcpExTableFromStack(TcpTable& table) {
  if (TableError != 0) return TableError;
  ++TablesFetched;
  std::vector<std::uint8_t> bytes(4 + kEntrySize * Connections.size());
  PutLittle32(bytes, 0, static_cast<std::uint32_t>(Connections.size()));
  std::size_t at = 4;
  for (const Connection& connection : Connections) {
    PutLittle32(bytes, at, connection.state);
    PutLittle32(bytes, at + 4, AddressOf(connection.localAddress).InMemory());
    PutLittle32(bytes, at + 8, PortInMemory(connection.localPort));
    PutLittle32(bytes, at + 12, AddressOf(connection.remoteAddress).InMemory());
    PutLittle32(bytes, at + 16, PortInMemory(connection.remotePort));
    PutLittle32(bytes, at + 20, connection.owner);
    at += kEntrySize;
  }
  table = std::make_shared<const std::vector<std::uint8_t>>(std::move(bytes));
  return 0;
}

std::uint32_t SimulatedIpHelper::SetTcpEntry(std::span<const std::uint8_t, 20> record) {
  std::copy(record.begin(), record.end(), Deleted.emplace_back().begin());
  return SetTcpEntryResult;
}

std::uint32_t SimulatedIpHelper::GetAdaptersInfo(std::vector<AdapterRecord>& adapters, std::uint32_t& size) {
  if (AdaptersError != 0) return AdaptersError;
  const auto needed = static_cast<std::uint32_t>(kAdapterSize * Adapters.size());
  if (size < needed) {
    size = needed;
    return kErrorBufferOverflow;
  }
  adapters = Adapters;
  return 0;
}

std::optional<std::string> SimulatedHostNames::gethostname() {
  lastError_ = FailName ? Error : 0;
  if (FailName) return {};
  return Name;
}

std::optional<std::vector<Ipv4Address>> SimulatedHostNames::gethostbyname(const std::string& name) {
  const auto other = others_.find(CutText(name));
  const bool isKnown = !FailAddresses && (other != others_.end() || CutText(name) == Name);
  std::vector<Ipv4Address> addresses;
  if (isKnown)
    for (const auto& address : other == others_.end() ? Addresses : other->second)
      addresses.push_back(AddressOf(address));
  lastError_ = addresses.empty() ? Error : 0;
  if (addresses.empty()) return {};
  return addresses;
}

} // namespace quendra::platform::simulated
