#pragma once

#include "platform/net/IpHelper.h"

namespace quendra::platform::unavailable {

/// A system without the IP helper library's tables.
class UnavailableIpHelper : public IpHelper {
 public:
  std::uint32_t AllocateAndGetTcpExTableFromStack(TcpTable&) override { return kErrorNotSupported; }
  std::uint32_t SetTcpEntry(std::span<const std::uint8_t, TcpTableEntry::kBytesWithoutOwner>) override {
    return kErrorNotSupported;
  }
  std::uint32_t GetAdaptersInfo(std::vector<AdapterRecord>&, std::uint32_t&) override {
    return kErrorNotSupported;
  }
  std::uint32_t GetIfTable(std::span<std::uint8_t>, std::uint32_t&, bool) override {
    return kErrorNotSupported;
  }
};

} // namespace quendra::platform::unavailable
