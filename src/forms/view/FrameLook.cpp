#include "forms/view/FrameLook.h"

#include "forms/view/Palette.h"
#include "forms/view/VisibleText.h"

namespace quendra::forms {

namespace {

constexpr int kTitleInset = 12;
constexpr int kCorner = 8;

} // namespace

Text TitleOf(const Frame& frame) {
  return frame.Border() ? Text(Trimmed(VisibleText(frame.Caption()))) : Text();
}

double BorderTop(TextView title, int lineHeight) { return title.empty() ? 0 : lineHeight / 2.0; }

Area TitlePlace(Extent letters, int frameWidth, const Scale& scale, Direction direction) {
  const int inset = scale.Pixels(kTitleInset);
  const int width = letters.width + inset;
  const int left = direction == Direction::RightToLeft ? frameWidth - inset - width : inset;
  return {{left, 0}, {width, letters.height}};
}

Colour TitleInk(const Frame& frame) { return InkOr(frame.ForeColour(), Palette::QuietInk); }

int FrameCorner(const Scale& scale) { return scale.Pixels(kCorner); }

} // namespace quendra::forms
