#include "forms/win32/boxes/BoxLines.h"

#include "forms/view/VisibleText.h"

#include <algorithm>

namespace quendra::forms::win32 {

namespace {

constexpr TextView kMarks = u"\u200F\u2066\u2069";
constexpr char16_t kIsolate = u'\u2066';

BoxLine LineOf(TextView marked, bool rightToLeft) {
  Text text(marked);
  std::erase_if(text, [](char16_t unit) { return kMarks.find(unit) != TextView::npos; });
  const bool isolated = marked.find(kIsolate) != TextView::npos;
  if (rightToLeft) return {text, isolated ? Direction::LeftToRight : Direction::RightToLeft};
  return {text, DirectionOf(text)};
}

} // namespace

std::vector<BoxLine> LinesOf(const BoxContent& content) {
  std::vector<BoxLine> lines;
  TextView rest = content.text;
  for (bool more = true; more;) {
    const std::size_t end = std::min(rest.find(u'\n'), rest.size());
    lines.push_back(LineOf(rest.substr(0, end), content.rightToLeft));
    more = end < rest.size();
    rest.remove_prefix(std::min(end + 1, rest.size()));
  }
  return lines;
}

} // namespace quendra::forms::win32
