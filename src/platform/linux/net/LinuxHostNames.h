#pragma once

#include "platform/linux/process/ProcFolder.h"
#include "platform/net/HostNames.h"

namespace quendra::platform::linux_ {

/// The own name stands for the addresses of the interfaces that are up, whatever the hosts file says: its
/// line for the own name is often a made-up loopback address. Other names are looked up, which may wait for a
/// name server.
class LinuxHostNames : public HostNames {
 public:
  explicit LinuxHostNames(const ProcFolder& folder) : folder_(folder) {}

  std::optional<std::string> gethostname() override;
  std::optional<std::vector<Ipv4Address>> gethostbyname(const std::string& name) override;
  std::int32_t LastError() override { return lastError_; }

 private:
  const ProcFolder& folder_;
  std::int32_t lastError_ = 0;
};

} // namespace quendra::platform::linux_
