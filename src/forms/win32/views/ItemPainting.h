#pragma once

#include "forms/view/Direction.h"
#include "forms/win32/drawing/Drawing.h"

namespace quendra::forms::win32 {

/// An item of a list of texts that is due, in the colours of the house.
struct ItemFace {
  TextView text{};
  HFONT font = nullptr;
  Colour ground = kWhite;
  Direction list = Direction::LeftToRight; ///< from which side the list is read
};

/// Answers WM_DRAWITEM for a window whose items the program draws.
/// Pixels for the text of an item.
int TextRoomOfItem(int width);

void PaintItem(const DRAWITEMSTRUCT& due, const ItemFace& face);

} // namespace quendra::forms::win32
