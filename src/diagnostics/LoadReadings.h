#pragma once

#include "diagnostics/CheckRows.h"
#include "platform/system/System.h"

#include <functional>

namespace quendra::diagnostics {

/// Takes fifteen readings in three seconds, which hold the thread on purpose, and shows in bars how far it
/// is.
void TakeReadings(CheckRows& rows, platform::System& system, const std::function<void()>& takeReading);

/// Shows a load as a percentage. Above 40 it is a failure.
Outcome ShowLoad(CheckRows& rows, double load);

inline constexpr int kReadings = 15;

} // namespace quendra::diagnostics
