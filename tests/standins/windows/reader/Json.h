#pragma once

#include "runtime/Text.h"

#include <string>
#include <vector>

namespace quendra::standins {

/// A text as JSON has it, in plain ASCII: half a character of two units gets through, too.
std::string Quoted(TextView text);

/// [one, two]
std::string Listed(const std::vector<std::string>& values);

} // namespace quendra::standins
