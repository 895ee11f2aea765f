#include "shell/AgreementRoll.h"

#include "runtime/Integers.h"

namespace quendra::shell {

namespace {

constexpr int kRollInterval = 5;
constexpr int kBandHeight = 5;
/// Three times white, spread over the height in bands of five pixels: the lower edge has a fifth of it, 153.
constexpr double kGradient = 765;
constexpr int kLineGap = 6;
constexpr int kTop = 5;

} // namespace

void AgreementRoll::Show() {
  pictures_.picBuffer.ScaleMode = forms::ScaleMode::Pixels;
  pictures_.picOut.Visible = true;
  pictures_.picBackBuffer.Visible = true;
  pictures_.picBuffer.Visible = true;
  reDrawTimer_.Interval = kRollInterval;
  reDrawTimer_.Enabled = true;
  bufferWidth_ = canvas_.ScaleWidth(pictures_.picBuffer);
  bufferHeight_ = canvas_.ScaleHeight(pictures_.picBuffer);
  scrollOffset_ = bufferHeight_;
  PaintBackground(bufferHeight_);
}

void AgreementRoll::Hide() {
  pictures_.picOut.Visible = false;
  pictures_.picBackBuffer.Visible = false;
  pictures_.picBuffer.Visible = false;
  reDrawTimer_.Enabled = false;
}

void AgreementRoll::Tick() {
  canvas_.BitBlt(pictures_.picBuffer, 0, 0, bufferWidth_, bufferHeight_, pictures_.picBackBuffer, 0, 0);
  for (int number = 1; number <= lines_.LineCount(); ++number) PrintLine(number);
  canvas_.BitBlt(pictures_.picOut, 0, 0, bufferWidth_, bufferHeight_, pictures_.picBuffer, 0, 0);
  canvas_.Refresh(pictures_.picOut);
  --scrollOffset_;
}

void AgreementRoll::PaintBackground(int height) {
  if (height <= 0) return;
  const double step = kGradient / height;
  double level = 0;
  for (int y = 0; y <= height; y += kBandHeight, level += step) {
    const auto grey = static_cast<unsigned>(RoundToInt32(level));
    canvas_.FillBox(pictures_.picBackBuffer, 0, y - 1, bufferWidth_, y + kBandHeight,
                    forms::Rgb(grey, grey, grey));
  }
}

void AgreementRoll::PrintLine(int number) {
  forms::PictureBox& buffer = pictures_.picBuffer;
  const Text& line = lines_.Line(number);
  const int y = number * canvas_.TextHeight(buffer, line) + number * kLineGap + scrollOffset_;
  buffer.CurrentX = 0;
  buffer.CurrentY = y;
  buffer.ForeColour = forms::kWhite;
  canvas_.Print(buffer, line);
  if (y < kTop) reDrawTimer_.Enabled = false;
}

} // namespace quendra::shell
