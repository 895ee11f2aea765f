#pragma once

#include "forms/controls/Picture.h"
#include "forms/view/Area.h"
#include "forms/win32/drawing/Bitmap.h"

#include <map>
#include <string>

namespace quendra::forms::win32 {

/// Pictures as bitmaps. Artwork is unpacked once, at the density that the screen needs; a missing one is a
/// placeholder.
class PictureStore {
 public:
  /// `dense`: the screen shows two pixels or more for one.
  explicit PictureStore(bool dense) : dense_(dense) {}

  /// Empty for no picture. Valid until the next call.
  const Bitmap& BitmapOf(const Picture& picture);
  /// The size in which the picture is laid out, whatever the density.
  static Extent LaidOut(const Picture& picture, const Bitmap& bitmap, bool dense);

 private:
  bool dense_;
  std::map<std::string, Bitmap> artwork_;
  Bitmap pixels_;
};

} // namespace quendra::forms::win32
