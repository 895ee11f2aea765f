#pragma once

#include "diagnostics/interfaces/CInterfaces.h"
#include "forms/MessageLoop.h"
#include "platform/net/IpHelper.h"

#include <span>

namespace quendra::diagnostics {

/// Reads the machine's network interfaces.
class CIpHelper {
 public:
  CIpHelper(platform::IpHelper& ipHelper, forms::MessageLoop& loop) : ipHelper_(ipHelper), loop_(loop) {}

  void Interfaces(std::shared_ptr<CInterfaces> interfaces) { interfaces_ = std::move(interfaces); }
  /// Reads them anew. Fault 6 at the 40th of them, and when their octets pass 2 GB together.
  std::shared_ptr<CInterfaces> Interfaces();
  /// Of all interfaces at the last read.
  std::int32_t BytesReceived() const { return bytesReceived_; }
  std::int32_t BytesSent() const { return bytesSent_; }

 private:
  bool ReadInterfaceTable();
  void ReadRows(std::span<const std::uint8_t> table);
  void Take(const CInterface& read);

  platform::IpHelper& ipHelper_;
  forms::MessageLoop& loop_;
  std::shared_ptr<CInterfaces> interfaces_;
  std::int32_t bytesReceived_ = 0;
  std::int32_t bytesSent_ = 0;
};

} // namespace quendra::diagnostics
