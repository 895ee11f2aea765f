#include "forms/view/BoxContent.h"

#include "forms/MessageLoop.h"
#include "forms/view/VisibleText.h"

#include <algorithm>

namespace quendra::forms {

namespace {

BoxSign SignOf(int flags) {
  switch (flags & 0x70) {
  case kCritical: return BoxSign::Critical;
  case kQuestion: return BoxSign::Question;
  case kExclamation: return BoxSign::Exclamation;
  case kInformation: return BoxSign::Information;
  default: return BoxSign::None;
  }
}

bool HasLatinLetter(TextView line) {
  return std::any_of(line.begin(), line.end(), [](char16_t unit) {
    return (unit >= u'a' && unit <= u'z') || (unit >= u'A' && unit <= u'Z');
  });
}

/// Each line decides by itself how it reads; a mark in front has lines of numbers read with the others. A
/// path or an address on a line of its own keeps its order.
Text MarkedRightToLeft(TextView text) {
  constexpr char16_t kMark = u'\u200F';
  Text marked;
  for (bool more = true; more;) {
    const std::size_t end = std::min(text.find(u'\n'), text.size());
    const TextView line = text.substr(0, end);
    (marked += kMark) += HasLatinLetter(line) ? Isolated(line) : Text(line);
    more = end < text.size();
    if (more) marked += u'\n';
    text.remove_prefix(std::min(end + 1, text.size()));
  }
  return marked;
}

void AddButtons(BoxContent& box, int flags) {
  constexpr int kOk = 1;
  constexpr int kYes = 6;
  constexpr int kNo = 7;
  if ((flags & 0xF) != kYesNo) {
    box.buttons = {{kOk, box.rightToLeft ? u"אישור" : u"OK"}};
    box.defaultButton = box.cancelButton = kOk;
    return;
  }
  // A question wants an answer: nothing but its buttons closes it.
  box.buttons = {{kYes, box.rightToLeft ? u"כן" : u"Yes"}, {kNo, box.rightToLeft ? u"לא" : u"No"}};
  box.defaultButton = kYes;
}

} // namespace

BoxContent BoxContentOf(TextView text, int flags, TextView title) {
  BoxContent box;
  box.rightToLeft = (flags & kRightToLeft) != 0;
  box.title = VisibleText(title.empty() ? u"Quendra" : title);
  box.text = VisibleText(text, LineBreaks::Keep, kMostBoxText);
  if (box.rightToLeft) box.text = MarkedRightToLeft(box.text);
  box.sign = SignOf(flags);
  AddButtons(box, flags);
  return box;
}

} // namespace quendra::forms
