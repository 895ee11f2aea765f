#include "forms/controls/ImageList.h"

#include "runtime/Fault.h"

namespace quendra::forms {

void ImageList::Clear() {
  images_.clear();
  firstOfTag_.clear();
  TellChanged(*this, Aspect::Items);
}

int ImageList::Add(Picture picture, Text tag, Text key) {
  images_.push_back({std::move(picture), std::move(tag), std::move(key)});
  firstOfTag_.try_emplace(images_.back().Tag, Count());
  TellChanged(*this, Aspect::Items);
  return Count();
}

const ImageList::ListImage& ImageList::Item(int index) const {
  if (index < 1 || index > Count()) throw Fault(Fault::kSubscript);
  return images_[static_cast<std::size_t>(index - 1)];
}

int ImageList::IndexOfTag(const Text& tag) const {
  const auto found = firstOfTag_.find(tag);
  return found == firstOfTag_.end() ? 0 : found->second;
}

} // namespace quendra::forms
