#pragma once

#include "forms/controls/Picture.h"
#include "forms/view/Area.h"
#include "forms/win32/drawing/Bitmap.h"

#include <map>
#include <string>

namespace quendra::forms::win32 {

/// Pictures as bitmaps. Artwork comes from the program itself, each piece unpacked once, at the density that
/// the screen needs. A missing one is a plain placeholder and is reported once on the error stream.
class PictureStore {
 public:
  /// `dense`: the screen shows more pixels for one than the artwork has.
  explicit PictureStore(bool dense) : dense_(dense) {}

  /// Empty for no picture. Valid as long as the picture and until the next call.
  const Bitmap& BitmapOf(const Picture& picture);
  /// The picture in another size. Of each piece of artwork the last size is kept: it is drawn again and
  /// again.
  const Bitmap& BitmapOf(const Picture& picture, Extent extent);
  /// The size in which the picture is laid out, whatever the density.
  static Extent LaidOut(const Picture& picture, const Bitmap& bitmap, bool dense);

 private:
  struct Artwork {
    Bitmap bitmap;
    Bitmap stretched;
  };
  Artwork& ArtworkOf(const std::string& name);
  Bitmap LoadArtwork(const std::string& name) const;

  bool dense_;
  std::map<std::string, Artwork> artwork_;
  Bitmap stretched_; ///< of the picture that was asked for last
};

} // namespace quendra::forms::win32
