#pragma once

#include "platform/net/IpHelper.h"
#include "platform/windows/net/InterfaceCounters.h"
#include "platform/windows/net/IpHelperLibrary.h"

namespace quendra::platform::windows {

/// The tables of the system's IP helper library.
class WindowsIpHelper : public IpHelper {
 public:
  /// `isLater`: on a system whose interface table isn't that of XP any more.
  explicit WindowsIpHelper(const IpHelperLibrary& library, bool isLater = IsVistaOrLater());

  std::uint32_t AllocateAndGetTcpExTableFromStack(TcpTable& table) override;
  std::uint32_t GetAdaptersInfo(std::vector<AdapterRecord>& adapters, std::uint32_t& size) override;
  std::uint32_t GetIfTable(std::span<std::uint8_t> buffer, std::uint32_t& size, bool sorted) override;

  // Dormant.

  std::uint32_t SetTcpEntry(std::span<const std::uint8_t, TcpTableEntry::kBytesWithoutOwner> record) override;

 private:
  static bool IsVistaOrLater();
  std::uint32_t ReadExtendedTable(std::vector<std::uint8_t>& table) const;
  std::uint32_t ReadOlderTable(std::vector<std::uint8_t>& table) const;

  const IpHelperLibrary& library_;
  bool isLater_;
  InterfaceCounters counters_;
};

} // namespace quendra::platform::windows
