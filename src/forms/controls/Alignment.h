#pragma once

namespace quendra::forms {

enum class Alignment { Leading, Trailing, Centre };

} // namespace quendra::forms
