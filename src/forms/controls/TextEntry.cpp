#include "forms/controls/TextEntry.h"

#include <algorithm>

namespace quendra::forms {

void TextEntry::WriteText(Text text) {
  if (!TakesText() || text == text_) return;
  ReplaceText(std::move(text));
  TellChanged(owner_, Aspect::Entry);
  TextChanged();
  Change();
}

void TextEntry::ReplaceText(Text text) {
  text_ = std::move(text);
  Keep(0, 0);
}

void TextEntry::Edited(Text text, int caret) {
  const bool another = text != text_;
  text_ = std::move(text);
  Keep(caret, 0);
  if (!another) return;
  TextChanged();
  Change();
}

void TextEntry::Selected(int start, int length) { Keep(start, length); }

void TextEntry::Select(int start, int length) {
  Keep(start, length);
  TellChanged(owner_, Aspect::Caret);
}

void TextEntry::Keep(int start, int length) {
  const int end = static_cast<int>(text_.size());
  start_ = std::clamp(start, 0, end);
  length_ = std::clamp(length, 0, end - start_);
}

} // namespace quendra::forms
