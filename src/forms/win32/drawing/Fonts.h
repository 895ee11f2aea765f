#pragma once

#include "forms/controls/Control.h"
#include "forms/view/Scale.h"
#include "winapi/Winapi.h"

#include <map>
#include <tuple>

namespace quendra::forms::win32 {

/// The letters of the program: a family that shows Hebrew, of the system or, where it has none, our own.
/// Fonts live as long as this.
class Fonts {
 public:
  Fonts();
  ~Fonts();
  Fonts(const Fonts&) = delete;
  Fonts& operator=(const Fonts&) = delete;

  HFONT FontOf(const Font& font, const Scale& scale);
  int LineHeight(HFONT font) const;

 private:
  Text family_;
  std::map<std::tuple<int, bool, bool>, HFONT> fonts_; ///< by height in pixels, bold, underlined
};

} // namespace quendra::forms::win32
