#pragma once

#include "forms/view/Scale.h"

namespace quendra::forms {

/// A rectangle with rounded corners, in pixels; right and bottom lie outside.
struct RoundRect {
  int left = 0;
  int top = 0;
  int right = 0;
  int bottom = 0;
  int ellipseWidth = 0;
  int ellipseHeight = 0;
  friend bool operator==(const RoundRect&, const RoundRect&) = default;

  /// That of a form that is shown in another size.
  RoundRect In(const Scale& scale) const {
    return {scale.Pixels(left),   scale.Pixels(top),          scale.Pixels(right),
            scale.Pixels(bottom), scale.Pixels(ellipseWidth), scale.Pixels(ellipseHeight)};
  }
};

} // namespace quendra::forms
