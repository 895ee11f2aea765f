#pragma once

#include "forms/Control.h"
#include "forms/Picture.h"

namespace quendra::forms {

/// Pictures by index, from 1, each with a Tag.
class ImageList : public Control {
 public:
  using Control::Control;

  struct ListImage {
    Picture picture;
    Text Tag;
  };

  void Clear();
  /// The new image's index.
  int Add(Picture picture, Text tag = {});
  int Count() const { return static_cast<int>(images_.size()); }
  /// Fault 9 for an index outside the list.
  const ListImage& Item(int index) const;

 private:
  std::vector<ListImage> images_;
};

} // namespace quendra::forms
