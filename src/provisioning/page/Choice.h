#pragma once

#include "forms/controls/Label.h"

#include <cstdint>
#include <span>

namespace quendra::provisioning {

/// One of some rows of a page: which of them is chosen, which lies under the mouse, and how the grounds of
/// the rows show both. -1 stands for none.
class Choice {
 public:
  explicit Choice(std::span<forms::Label> grounds) : grounds_(grounds) {}

  std::int16_t Selected = -1;
  std::int16_t Hovered = -1;

  /// Only the ground of the row under the mouse is painted.
  void Hover(std::int16_t row);
  /// Only the ground of the chosen row is green.
  void Select(std::int16_t row);

 private:
  /// nullptr for -1 and whatever else is no row.
  forms::Label* GroundOf(std::int16_t row) const;

  std::span<forms::Label> grounds_;
};

} // namespace quendra::provisioning
