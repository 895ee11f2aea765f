#include "platform/linux/registry/LinuxRegistry.h"

#include <cstdio>

namespace quendra::platform::linux_ {

void LinuxRegistry::TellUser(const std::string& message) { std::fprintf(stderr, "%s\n", message.c_str()); }

} // namespace quendra::platform::linux_
