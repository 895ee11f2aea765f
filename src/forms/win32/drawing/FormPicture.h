#pragma once

#include "forms/view/paint/DueAreas.h"
#include "forms/win32/drawing/Drawing.h"

#include <functional>
#include <optional>

namespace quendra::forms::win32 {

/// What a form shows of its own drawing, put together, in the pixels of its body: each of its many windows
/// shows its part. Put together a window at a time it would be drawn as often as windows lie on each other.
class FormPicture {
 public:
  using Painter = std::function<void(Drawing&)>;

  /// What stands there has changed. All of it changes with the size.
  void Forget(Area place) { due_.Add(place); }
  /// Has the painter draw what of a part is not as it should be.
  void Bring(Area part, Extent size, const Painter& paint);
  /// Copies a part to the same place of a device.
  void ShowOn(HDC device, Area part) const { surface_->ShowOn(device, part); }

 private:
  std::optional<Surface> surface_;
  DueAreas due_;
};

} // namespace quendra::forms::win32
