#pragma once

namespace quendra::forms {

// Places and sizes as views count them. All numbers are pixels.

struct Extent {
  int width = 0;
  int height = 0;
  friend bool operator==(const Extent&, const Extent&) = default;
};

struct Spot {
  int left = 0;
  int top = 0;
  friend bool operator==(const Spot&, const Spot&) = default;
};

struct Area {
  Spot corner{};
  Extent extent{};
  friend bool operator==(const Area&, const Area&) = default;

  int Right() const { return corner.left + extent.width; }
  int Bottom() const { return corner.top + extent.height; }
  /// With so much more on every side; less where the margin is negative.
  Area GrownBy(int margin) const {
    return {{corner.left - margin, corner.top - margin},
            {extent.width + 2 * margin, extent.height + 2 * margin}};
  }
};

} // namespace quendra::forms
