#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

namespace quendra::platform {

/// A network card with an address, as the system's management knows it. Texts are bytes of the code page.
class NetworkCard {
 public:
  virtual ~NetworkCard() = default;

  virtual std::string Description() = 0;
  /// Gives the card these addresses with these masks and no others. 0 for success.
  virtual std::uint32_t EnableStatic(const std::vector<std::string>& addresses,
                                     const std::vector<std::string>& masks) = 0;
  /// 0 for success.
  virtual std::uint32_t SetGateways(const std::vector<std::string>& gateways,
                                    const std::vector<std::uint16_t>& metrics) = 0;
};

/// What a moniker of the system's management leads to.
class ManagementServices {
 public:
  virtual ~ManagementServices() = default;

  /// The network cards that have an address, by ascending index, loopback excepted: the one query that the
  /// program makes. A card outlives the services.
  virtual std::vector<std::shared_ptr<NetworkCard>> ExecQuery(const std::string& query) = 0;
};

/// The system's management of network cards.
class Adapters {
 public:
  virtual ~Adapters() = default;

  static constexpr const char* kMoniker = "winmgmts:\\\\.\\root\\cimv2";
  static constexpr const char* kCards =
      "Select * from Win32_NetworkAdapterConfiguration where IPEnabled=TRUE";

  /// Raises fault 429 where there is no such management.
  virtual std::unique_ptr<ManagementServices> GetObject(const std::string& moniker) = 0;
};

} // namespace quendra::platform
