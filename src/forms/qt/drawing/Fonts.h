#pragma once

namespace quendra::forms::qt {

/// Adds the fonts that the program carries where the system has none for Hebrew, or none for Latin text.
void AddMissingFonts();

} // namespace quendra::forms::qt
