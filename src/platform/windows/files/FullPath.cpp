#include "platform/windows/files/FullPath.h"

namespace quendra::platform::windows {

namespace {

bool IsLetter(char16_t unit) { return (unit >= u'A' && unit <= u'Z') || (unit >= u'a' && unit <= u'z'); }

bool IsPlainName(TextView name) {
  return !name.empty() && name != u"." && name != u".." && name.find_first_of(u"/:") == TextView::npos;
}

} // namespace

bool IsFullPath(TextView path) {
  if (path.size() < 3 || !IsLetter(path[0]) || path.substr(1, 2) != u":\\") return false;
  path.remove_prefix(3);
  while (true) {
    const std::size_t end = path.find(u'\\');
    if (!IsPlainName(path.substr(0, end))) return false;
    if (end == TextView::npos) return true;
    path.remove_prefix(end + 1);
  }
}

} // namespace quendra::platform::windows
