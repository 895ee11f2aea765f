#pragma once

#include "forms/controls/Colour.h"
#include "forms/view/Area.h"
#include "forms/view/ControlPlacement.h"
#include "forms/view/Direction.h"
#include "forms/view/Ring.h"
#include "forms/view/paint/Shapes.h"
#include "forms/win32/drawing/Bitmap.h"
#include "forms/win32/drawing/Surface.h"

#include <array>
#include <optional>
#include <vector>

namespace quendra::forms::win32 {

/// How a text is set in its place.
struct TextSetting {
  Direction direction = Direction::LeftToRight;
  Side side = Side::Left;
  bool wraps = false;   ///< on more than one line
  bool fromTop = false; ///< else half way down
  bool cuts = true;     ///< one line that is too long ends in an ellipsis; else it goes on
};

/// Draws on a surface, in the pixels of a window whose corner lies at `origin` of the surface's own. Nothing
/// is drawn outside the clip, which is given in the same pixels as all places.
class Drawing {
 public:
  Drawing(Surface& surface, Spot origin, Area clip);

  /// The same surface for what stands in an area: its corner is the new origin, and nothing leaves it.
  Drawing Within(Area area) const;

  void Fill(Area area, Colour colour);
  void Fill(const RoundBox& box, Colour colour);
  /// A line along the edge of a box, half of it on either side.
  void Stroke(const RoundBox& box, Colour colour, double width = 1);
  /// A box of whole pixels with smooth round corners. Its border lies within it, and the corner is that of
  /// the border's middle.
  void RoundRect(Area area, int corner, std::optional<Colour> fill, std::optional<Colour> border,
                 int borderWidth = 1);
  /// What a control that has the focus shows round an area.
  void Rings(Area ringed, const std::vector<Ring>& rings);
  /// Upright and level lines are sharp and hold both ends; others are smooth.
  void Line(Spot from, Spot to, Colour colour, int width);
  void Triangle(const std::array<Spot, 3>& corners, Colour colour);
  /// Scaled smoothly to the area.
  void Picture(const Bitmap& bitmap, Area area);
  void Text(TextView text, Area area, HFONT font, Colour colour, const TextSetting& setting = {});

  Area Clip() const { return clip_; }
  Surface& Target() const { return surface_; }
  Spot Origin() const { return origin_; }

 private:
  Raster Pixels() const;

  Surface& surface_;
  Spot origin_;
  Area clip_;
};

/// What a text takes on one line, or on as many as it needs within `width` where that isn't 0.
Extent MeasureText(TextView text, HFONT font, int width = 0);

} // namespace quendra::forms::win32
