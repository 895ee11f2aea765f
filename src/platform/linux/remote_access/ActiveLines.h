#pragma once

#include "platform/linux/remote_access/ConnectionBook.h"

#include <string>
#include <vector>

namespace quendra::platform::linux_ {

/// A connection that stands or is being made, by whomever.
struct ActiveLine {
  std::string path;
  Line line;
};

/// The error number of NetworkManager's answer.
std::uint32_t ReadActiveLines(NetworkManagerBus& bus, ConnectionBook& book, std::vector<ActiveLine>& active);
/// Asks for the end of one.
BusQuestion QuestionOfEnd(const std::string& path);
/// Success also where it has ended by itself.
std::uint32_t EndActiveLine(NetworkManagerBus& bus, const std::string& path);

} // namespace quendra::platform::linux_
