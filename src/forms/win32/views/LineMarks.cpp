#include "forms/win32/views/LineMarks.h"

#include "forms/view/VisibleText.h"

#include <algorithm>
#include <iterator>

namespace quendra::forms::win32 {

namespace {

constexpr char16_t kFromLeft = u'\u202A';
constexpr char16_t kFromRight = u'\u202B';

void AppendLine(Text& marked, TextView line, Direction ofAll) {
  if (DirectionOf(line) == Direction::RightToLeft)
    marked.push_back(kFromRight);
  else if (ofAll == Direction::RightToLeft && !line.empty())
    marked.push_back(kFromLeft);
  marked.append(line);
}

} // namespace

bool IsLineMark(char16_t unit) { return unit == kFromLeft || unit == kFromRight; }

Text WithLineMarks(TextView lines) {
  const Direction ofAll = DirectionOf(lines);
  Text marked;
  std::size_t begin = 0;
  for (std::size_t end = 0; (end = lines.find(u'\n', begin)) != TextView::npos; begin = end + 1) {
    AppendLine(marked, lines.substr(begin, end - begin), ofAll);
    marked.push_back(u'\n');
  }
  AppendLine(marked, lines.substr(begin), ofAll);
  return marked;
}

Text WithoutLineMarks(TextView lines) {
  Text plain;
  std::remove_copy_if(lines.begin(), lines.end(), std::back_inserter(plain), IsLineMark);
  return plain;
}

} // namespace quendra::forms::win32
