#pragma once

#include "platform/HostNames.h"
#include "platform/linux/ProcFolder.h"

namespace quendra::platform::linux_ {

/// The own name stands for the addresses of the interfaces that are up, whatever the hosts file says: its
/// line for the own name is often a made-up loopback address. Other names are looked up, which may wait for a
/// name server.
class LinuxHostNames : public HostNames {
 public:
  explicit LinuxHostNames(const ProcFolder& folder) : folder_(folder) {}

  std::optional<std::string> gethostname() override;
  std::optional<std::vector<std::uint32_t>> gethostbyname(const std::string& name) override;

 private:
  const ProcFolder& folder_;
};

} // namespace quendra::platform::linux_
