#pragma once

#include "platform/Capture.h"
#include "runtime/Text.h"

namespace quendra::capture {

/// One line for the user that says what capture lacks; empty when it lacks nothing.
Text CaptureStateText(platform::CaptureLibrary::Availability availability);

} // namespace quendra::capture
