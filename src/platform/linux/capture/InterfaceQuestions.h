#pragma once

#include "platform/linux/system/Descriptor.h"

#include <optional>
#include <string>

namespace quendra::platform::linux_ {

/// Asks the kernel about network interfaces by their names. It is asked itself and not sysfs, which may show
/// another network namespace.
class InterfaceQuestions {
 public:
  InterfaceQuestions();

  bool IsUp(const std::string& name) const;
  /// As in <net/if_arp.h>; nothing when there is no such interface.
  std::optional<unsigned> HardwareType(const std::string& name) const;
  /// Empty for an interface whose driver doesn't tell.
  std::string DriverName(const std::string& name) const;

 private:
  Descriptor socket_;
};

} // namespace quendra::platform::linux_
