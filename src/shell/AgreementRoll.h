#pragma once

#include "forms/Canvas.h"
#include "forms/controls/Timer.h"
#include "shell/AgreementWrap.h"

namespace quendra::shell {

/// Rolls the lines of the agreement up over a grey gradient until the first stands at the top. Each tick
/// draws the fixed background and the lines into a buffer and copies that to what the user sees.
class AgreementRoll {
 public:
  struct Pictures {
    forms::PictureBox& picOut;
    forms::PictureBox& picBuffer;
    forms::PictureBox& picBackBuffer;
  };

  AgreementRoll(forms::Canvas& canvas, Pictures pictures, forms::Timer& reDrawTimer,
                const AgreementWrap& lines)
      : canvas_(canvas), pictures_(pictures), reDrawTimer_(reDrawTimer), lines_(lines) {}

  /// From the lower edge, also while a roll is on.
  void Show();
  void Hide();
  void Tick();

  /// Pixels; below 0 once the text has gone further up than its own first place.
  std::int32_t ScrollOffset() const { return scrollOffset_; }

 private:
  void PaintBackground(int height);
  void PrintLine(int number);

  forms::Canvas& canvas_;
  Pictures pictures_;
  forms::Timer& reDrawTimer_;
  const AgreementWrap& lines_;
  std::int32_t scrollOffset_ = 0;
  std::int32_t bufferWidth_ = 0;
  std::int32_t bufferHeight_ = 0;
};

} // namespace quendra::shell
