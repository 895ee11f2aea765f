#pragma once

#include "winapi/Winapi.h"

namespace quendra::forms::win32 {

/// Letters that are all as wide.
class FixedFont {
 public:
  FixedFont() = default;
  ~FixedFont();
  FixedFont(const FixedFont&) = delete;
  FixedFont& operator=(const FixedFont&) = delete;

  /// In the size of another font. The one given before goes with the call.
  HFONT As(HFONT letters);

 private:
  HFONT made_ = nullptr;
};

} // namespace quendra::forms::win32
