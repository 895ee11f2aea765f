#include "provisioning/page/Choice.h"

namespace quendra::provisioning {

namespace {
constexpr forms::Colour kChosen = forms::Rgb(220, 247, 193);
}

void Choice::Hover(std::int16_t row) {
  if (row == Hovered) return;
  for (forms::Label& ground : grounds_) ground.Transparent = true;
  if (forms::Label* ground = GroundOf(row)) ground->Transparent = false;
  Hovered = row;
}

void Choice::Select(std::int16_t row) {
  Selected = Hovered = row;
  for (forms::Label& ground : grounds_) ground.BackColour = forms::kWhite;
  if (forms::Label* ground = GroundOf(row)) ground->BackColour = kChosen;
}

forms::Label* Choice::GroundOf(std::int16_t row) const {
  const bool isRow = row >= 0 && static_cast<std::size_t>(row) < grounds_.size();
  return isRow ? &grounds_[static_cast<std::size_t>(row)] : nullptr;
}

} // namespace quendra::provisioning
