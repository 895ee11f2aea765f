#pragma once

#include "platform/net/Ipv4Address.h"

#include <cstdint>
#include <string>
#include <vector>

namespace quendra::platform::linux_ {

/// What a name server says: addresses, or an error number of the socket library.
struct NameAnswer {
  std::int32_t error = 0;
  std::vector<Ipv4Address> addresses;
};
/// May wait for a name server; callable from any thread.
NameAnswer LookUpName(const std::string& name);

} // namespace quendra::platform::linux_
