#pragma once

namespace quendra::foundation {

/// Title of the main window and of every Hebrew message box.
inline constexpr const char16_t* kTitle = u"זלמר בינלאומי@נט";

} // namespace quendra::foundation
