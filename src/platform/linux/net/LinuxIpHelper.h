#pragma once

#include "platform/linux/net/InterfaceTable.h"
#include "platform/linux/net/SocketDiagnostics.h"
#include "platform/linux/net/SocketOwners.h"
#include "platform/net/IpHelper.h"

namespace quendra::platform::linux_ {

/// The owner table from socket diagnostics and the descriptors of the processes; adapters and interfaces
/// from the kernel's links.
class LinuxIpHelper : public IpHelper {
 public:
  LinuxIpHelper(const ProcFolder& folder, SocketOwners::Rights rights, Clock clock = CoarseMilliseconds);

  std::uint32_t AllocateAndGetTcpExTableFromStack(TcpTable& table) override;
  std::uint32_t GetAdaptersInfo(std::vector<AdapterRecord>& adapters, std::uint32_t& size) override;
  /// Sorted either way.
  std::uint32_t GetIfTable(std::span<std::uint8_t> buffer, std::uint32_t& size, bool sorted) override;

  /// Dormant. Connections of others aren't ended on this system.
  std::uint32_t SetTcpEntry(std::span<const std::uint8_t, TcpTableEntry::kBytesWithoutOwner>) override {
    return kErrorNotSupported;
  }

 private:
  const ProcFolder& folder_;
  SocketDiagnostics diagnostics_;
  SocketOwners owners_;
  InterfaceTable interfaces_;
  std::vector<TcpSocket> sockets_;
};

} // namespace quendra::platform::linux_
