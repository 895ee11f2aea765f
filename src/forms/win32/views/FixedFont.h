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

  /// In the size of another font. It stays until another one is asked for.
  HFONT As(HFONT letters);

 private:
  HFONT of_ = nullptr;
  HFONT made_ = nullptr;
};

} // namespace quendra::forms::win32
