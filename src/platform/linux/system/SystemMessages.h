#pragma once

#include <cstdint>
#include <string_view>

namespace quendra::platform::linux_ {

/// What the system says of one of its error numbers; empty for one that no operation here gives.
std::string_view SystemMessage(std::uint32_t number);

} // namespace quendra::platform::linux_
