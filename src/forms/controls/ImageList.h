#pragma once

#include "forms/controls/Control.h"
#include "forms/controls/Picture.h"

#include <unordered_map>

namespace quendra::forms {

/// Pictures by index, from 1, each with a Tag and a key, by which assistive technology tells it.
class ImageList : public Control {
 public:
  using Control::Control;
  void Accept(ControlVisitor& visitor) override { visitor.Visit(*this); }

  struct ListImage {
    Picture picture;
    Text Tag;
    Text Key;
  };

  void Clear();
  /// The new image's index.
  int Add(Picture picture, Text tag = {}, Text key = {});
  int Count() const { return static_cast<int>(images_.size()); }
  /// Fault 9 for an index outside the list.
  const ListImage& Item(int index) const;
  /// The first image with this Tag, 0 when there is none. Cheap in long lists too.
  int IndexOfTag(const Text& tag) const;

 private:
  std::vector<ListImage> images_;
  std::unordered_map<Text, int> firstOfTag_;
};

} // namespace quendra::forms
