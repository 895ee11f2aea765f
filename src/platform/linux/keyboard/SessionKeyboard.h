#pragma once

#include <optional>
#include <string>

namespace quendra::platform::linux_ {

/// The code of the layout with which a session that has a service for layouts on its bus reads keys now, as
/// in "us". Nothing where there is no such service, or it doesn't answer in a second.
std::optional<std::string> ActiveLayoutCode();

} // namespace quendra::platform::linux_
