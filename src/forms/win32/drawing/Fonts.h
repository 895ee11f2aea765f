#pragma once

#include "forms/controls/Control.h"
#include "forms/view/Scale.h"
#include "winapi/Winapi.h"

#include <map>
#include <tuple>
#include <vector>

namespace quendra::forms::win32 {

/// The letters of the program: a family that shows Hebrew, of the system or, where it has none, our own.
/// Fonts live as long as this.
class Fonts {
 public:
  Fonts();
  ~Fonts();
  Fonts(const Fonts&) = delete;
  Fonts& operator=(const Fonts&) = delete;

  const Text& Family() const { return family_; }
  HFONT FontOf(const Font& font, const Scale& scale);
  /// Pixels from one line of it to the next.
  int LineHeight(HFONT font) const;

 private:
  void AddOwnFamily();

  Text family_;
  std::vector<HANDLE> ownFonts_;
  std::map<std::tuple<int, bool, bool>, HFONT> fonts_; ///< by height in pixels, bold, underlined
  std::map<HFONT, int> heights_;                       ///< of their lines, which each row of a list asks for
};

/// Whether a family of this very name is there and has the signs of Hebrew and Latin text.
bool ShowsHebrewAndLatin(const Text& family);

} // namespace quendra::forms::win32
