#pragma once

#include "winapi/Winapi.h"

#include <string>

namespace quendra::standins {

// What stands in windows of the system's kinds, as a screen reader asks for it. Each is a value of JSON;
// "null" when the window leaves a question open for too long.

/// An object: the text of an EDIT window, or of any other that tells one; of a secret one its length alone.
std::string FieldIn(HWND window);

/// Of a table, an object: headers with their places on the screen, rows of cells, and the numbers of the
/// selected rows.
std::string TableIn(HWND window);

/// Of a list box or a combo box, an object: its items, and which is chosen.
std::string ItemsIn(HWND window);

} // namespace quendra::standins
