#pragma once

#include "forms/controls/Picture.h"

#include <QPixmap>

#include <map>
#include <string>

namespace quendra::forms::qt {

/// Pictures as the toolkit draws them. Artwork comes from the program's resources, each piece read once.
class PictureStore {
 public:
  /// Null for no picture. Missing artwork gives a plain placeholder and is reported once on the error stream.
  QPixmap PixmapOf(const Picture& picture);
  static QImage ImageOf(const Picture::Pixels& pixels);
  static Picture PictureOf(const QImage& image);

 private:
  QPixmap LoadArtwork(const std::string& name);

  std::map<std::string, QPixmap> artwork_;
};

} // namespace quendra::forms::qt
