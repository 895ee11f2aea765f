#include "platform/linux/network_manager/NewConnection.h"

#include <pwd.h>
#include <unistd.h>

#include <array>
#include <cstdio>

namespace quendra::platform::linux_ {

namespace {

/// The kernel makes one at each reading. It isn't a regular file of a size, so it isn't read as one.
std::string NewId() {
  std::array<char, 37> text{};
  if (FILE* file = std::fopen("/proc/sys/kernel/random/uuid", "re")) {
    if (!std::fgets(text.data(), text.size(), file)) text = {};
    std::fclose(file);
  }
  return text.data();
}

std::string NameOfUser() {
  std::array<char, 4096> buffer;
  passwd user{};
  passwd* found = nullptr;
  ::getpwuid_r(::geteuid(), &user, buffer.data(), buffer.size(), &found);
  return found && ::geteuid() != 0 ? found->pw_name : "";
}

} // namespace

NetworkSettings NewConnection(const std::string& name) {
  NetworkSettings settings;
  PutText(settings, "connection", "id", name);
  PutText(settings, "connection", "uuid", NewId());
  settings["connection"]["autoconnect"] = BusValue::Truth(false);
  if (const std::string user = NameOfUser(); !user.empty())
    settings["connection"]["permissions"] = BusValue::Array("s", {BusValue::Text("user:" + user + ":")});
  return settings;
}

} // namespace quendra::platform::linux_
