#pragma once

#include "platform/net/IpHelper.h"
#include "platform/windows/net/IpHelperLibrary.h"

namespace quendra::platform::windows {

/// The tables of the system's IP helper library.
class WindowsIpHelper : public IpHelper {
 public:
  explicit WindowsIpHelper(const IpHelperLibrary& library) : library_(library) {}

  std::uint32_t AllocateAndGetTcpExTableFromStack(TcpTable& table) override;
  std::uint32_t GetAdaptersInfo(std::vector<AdapterRecord>& adapters, std::uint32_t& size) override;
  std::uint32_t GetIfTable(std::span<std::uint8_t> buffer, std::uint32_t& size, bool sorted) override;

  // Dormant.

  std::uint32_t SetTcpEntry(std::span<const std::uint8_t, TcpTableEntry::kBytesWithoutOwner> record) override;

 private:
  std::uint32_t ReadExtendedTable(std::vector<std::uint8_t>& table) const;
  std::uint32_t ReadOlderTable(std::vector<std::uint8_t>& table) const;

  const IpHelperLibrary& library_;
};

} // namespace quendra::platform::windows
