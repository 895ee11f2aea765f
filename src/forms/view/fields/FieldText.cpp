#include "forms/view/fields/FieldText.h"

#include "forms/view/VisibleText.h"

#include <algorithm>

namespace quendra::forms {

namespace {

constexpr char16_t kVisibleTab = u'\u2409';

Text Visible(TextView text, bool ofManyLines) {
  Text shown = VisibleText(text, ofManyLines ? LineBreaks::Keep : LineBreaks::Show, text.size());
  if (ofManyLines) std::replace(shown.begin(), shown.end(), kVisibleTab, u'\t');
  return shown;
}

} // namespace

Text FieldText::Shown() const { return Visible(value_, ofManyLines_); }

int FieldText::ShownPlace(int place) const {
  const std::size_t end = std::min(static_cast<std::size_t>(std::max(place, 0)), value_.size());
  int shown = 0;
  for (std::size_t unit = 0; unit < end; ++unit) shown += IsShown(unit) ? 1 : 0;
  return shown;
}

int FieldText::ValuePlace(int shownPlace) const {
  std::size_t unit = 0;
  for (int shown = 0; unit < value_.size(); ++unit) {
    if (!IsShown(unit)) continue;
    if (shown == shownPlace) break;
    ++shown;
  }
  // Before a line break is before the whole of it.
  const bool splitsBreak =
      ofManyLines_ && unit > 0 && unit < value_.size() && value_[unit] == u'\n' && value_[unit - 1] == u'\r';
  return static_cast<int>(splitsBreak ? unit - 1 : unit);
}

Text FieldText::ValueOf(TextView shown, bool ofManyLines) {
  const Text visible = Visible(shown, ofManyLines);
  return ofManyLines ? Replaced(visible, u"\n", u"\r\n") : visible;
}

} // namespace quendra::forms
