#include "forms/win32/views/ItemPainting.h"

#include "forms/view/Palette.h"
#include "forms/view/VisibleText.h"

namespace quendra::forms::win32 {

namespace {
constexpr int kPadding = 4;
}

int TextRoomOfItem(int width) { return width - 2 * kPadding; }

void PaintItem(const DRAWITEMSTRUCT& due, const ItemFace& face) {
  const RECT& place = due.rcItem;
  const Area item{{},
                  {static_cast<int>(place.right - place.left), static_cast<int>(place.bottom - place.top)}};
  Surface surface(item.extent);
  Drawing drawing(surface, {}, item);
  drawing.Fill(item, face.ground);
  const Area room{{kPadding, 0}, {TextRoomOfItem(item.extent.width), item.extent.height}};
  const Direction reading = DirectionOf(face.text);
  drawing.Text(face.text, room, face.font, Palette::Ink, {reading, SideOf(Alignment::Leading, face.list)});
  POINT before{};
  ::SetViewportOrgEx(due.hDC, static_cast<int>(place.left), static_cast<int>(place.top), &before);
  surface.ShowOn(due.hDC, item);
  ::SetViewportOrgEx(due.hDC, before.x, before.y, nullptr);
}

} // namespace quendra::forms::win32
