#pragma once

namespace quendra::forms {

/// How a form or a text is read.
enum class Direction { LeftToRight, RightToLeft };

} // namespace quendra::forms
