#include "foundation/LibraryName.h"

namespace quendra::foundation {

std::string LibraryName(const Text& name) { return std::string(CutAtNul(ToCodePage(name))); }

} // namespace quendra::foundation
