#pragma once

#include "platform/net/HostNames.h"
#include "platform/net/SocketNumbers.h"

#include <map>

namespace quendra::platform::simulated {

/// The host's own name is known, and those that were added.
class SimulatedHostNames : public HostNames {
 public:
  std::string Name = "subscriber";
  std::vector<std::string> Addresses;
  /// Another name and its addresses.
  void Add(const std::string& name, std::vector<std::string> addresses) {
    others_[name] = std::move(addresses);
  }
  bool FailName = false;
  bool FailAddresses = false;
  /// What a question fails with.
  std::int32_t Error = kHostNotFound;

  /// Any address, loopback or one of the host's own.
  bool IsOwn(Ipv4Address address) const;
  /// From which of the own addresses traffic to that one comes.
  Ipv4Address OwnAddressTowards(Ipv4Address address) const;

  std::optional<std::string> gethostname() override;
  std::optional<std::vector<Ipv4Address>> gethostbyname(const std::string& name) override;
  std::int32_t LastError() override { return lastError_; }

 private:
  std::int32_t lastError_ = 0;
  std::map<std::string, std::vector<std::string>> others_;
};

} // namespace quendra::platform::simulated
