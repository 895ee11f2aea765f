#pragma once

namespace quendra::forms::qt {

/// Makes the pictures and fonts that the program carries known: those of a static library register themselves
/// only when somebody asks for them.
void RegisterResources();

} // namespace quendra::forms::qt
