#pragma once

#include "platform/capture/CaptureLibrary.h"
#include "runtime/Text.h"

#include <cstdint>
#include <optional>

namespace quendra::capture {

/// One line for the user that says what capture lacks; empty when it lacks nothing. `goneSince` is the second
/// of the day at which the adapter went, when that was seen.
Text CaptureStateText(platform::CaptureLibrary::Availability availability,
                      std::optional<std::int32_t> goneSince = {});

} // namespace quendra::capture
