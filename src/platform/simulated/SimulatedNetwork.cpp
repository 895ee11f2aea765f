#include "platform/simulated/SimulatedNetwork.h"

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
  Put32(bytes, 0, static_cast<std::uint32_t>(Connections.size()));
  std::size_t at = 4;
  for (const Connection& connection : Connections) {
    Put32(bytes, at, connection.state);
    Put32(bytes, at + 4, AddressInMemory(connection.localAddress));
    Put32(bytes, at + 8, PortInMemory(connection.localPort));
    Put32(bytes, at + 12, AddressInMemory(connection.remoteAddress));
    Put32(bytes, at + 16, PortInMemory(connection.remotePort));
    Put32(bytes, at + 20, connection.owner);
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
  if (FailName) return {};
  return Name;
}

std::optional<std::vector<std::uint32_t>> SimulatedHostNames::gethostbyname(const std::string& name) {
  if (FailAddresses || CutText(name) != Name) return {};
  std::vector<std::uint32_t> addresses;
  for (const auto& address : Addresses) addresses.push_back(AddressInMemory(address));
  return addresses;
}

std::int32_t SimulatedSockets::recv(SocketHandle socket, std::span<std::uint8_t> buffer, std::int32_t) {
  core_.calls.push_back("recv " + std::to_string(socket) + " " + std::to_string(buffer.size()));
  auto& waiting = waiting_[socket];
  if (waiting.empty()) return 0;
  if (!waiting.front()) {
    waiting.pop_front();
    return -1;
  }
  auto& bytes = *waiting.front();
  const std::size_t length = std::min(bytes.size(), buffer.size());
  std::copy_n(bytes.begin(), length, buffer.begin());
  bytes.erase(bytes.begin(), bytes.begin() + static_cast<std::ptrdiff_t>(length));
  if (bytes.empty()) waiting.pop_front();
  return static_cast<std::int32_t>(length);
}

std::int32_t SimulatedSockets::WSAAsyncSelect(SocketHandle socket, std::uint32_t window,
                                              std::uint32_t message, std::int32_t events) {
  core_.calls.push_back("WSAAsyncSelect " + std::to_string(socket) + " " + std::to_string(window) + " " +
                        std::to_string(message) + " " + std::to_string(events));
  return 0;
}

std::int32_t SimulatedSockets::closesocket(SocketHandle socket) {
  core_.calls.push_back("closesocket " + std::to_string(socket));
  return 0;
}

bool SimulatedSockets::WSAIsBlocking() {
  core_.calls.push_back("WSAIsBlocking");
  return Blocking;
}

std::int32_t SimulatedSockets::WSACancelBlockingCall() {
  core_.calls.push_back("WSACancelBlockingCall");
  return 0;
}

std::int32_t SimulatedSockets::WSACleanup() {
  core_.calls.push_back("WSACleanup");
  return 0;
}

} // namespace quendra::platform::simulated
