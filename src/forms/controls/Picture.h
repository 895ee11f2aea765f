#pragma once

#include "runtime/Text.h"

#include <memory>
#include <vector>

namespace quendra::forms {

/// A picture by value: none, a piece of the program's artwork by name, or pixels.
/// Two pictures are equal when they are the same artwork or share the same pixels.
class Picture {
 public:
  struct Pixels {
    int width = 0;
    int height = 0;
    std::vector<std::uint32_t> argb; ///< row by row from the top, 0xAARRGGBB, not premultiplied
  };

  Picture() = default;
  static Picture Artwork(std::string name) {
    Picture picture;
    picture.artwork_ = std::move(name);
    return picture;
  }
  static Picture Of(Pixels pixels) {
    Picture picture;
    picture.pixels_ = std::make_shared<const Pixels>(std::move(pixels));
    return picture;
  }

  bool IsNone() const { return artwork_.empty() && !pixels_; }
  /// The file name in artwork/ without its ending; empty for pixels and for none.
  const std::string& ArtworkName() const { return artwork_; }
  const Pixels* pixels() const { return pixels_.get(); }

  friend bool operator==(const Picture&, const Picture&) = default;

 private:
  std::string artwork_;
  std::shared_ptr<const Pixels> pixels_;
};

} // namespace quendra::forms
