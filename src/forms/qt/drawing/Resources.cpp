#include "forms/qt/drawing/Resources.h"

#include <QtGlobal>

// The name that this stands for has no namespace.
static void RegisterArtwork() { Q_INIT_RESOURCE(artwork); }

namespace quendra::forms::qt {

void RegisterResources() { RegisterArtwork(); }

} // namespace quendra::forms::qt
