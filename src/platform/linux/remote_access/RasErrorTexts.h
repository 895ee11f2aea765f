#pragma once

#include <cstdint>
#include <string_view>

namespace quendra::platform::linux_ {

/// The published text of one of remote access's own numbers that can come here; empty for another number.
std::string_view RasErrorText(std::uint32_t number);

} // namespace quendra::platform::linux_
