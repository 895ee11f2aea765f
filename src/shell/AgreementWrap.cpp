#include "shell/AgreementWrap.h"

#include "runtime/Integers.h"

#include <utility>

namespace quendra::shell {

namespace {

constexpr TextView kLineBreak = u"\r\n";

/// One paragraph on its way into lines: `rest` waits, `line` is being built from its front.
struct Paragraph {
  Text rest;
  Text line;

  void MoveOne() {
    line += rest.front();
    rest.erase(0, 1);
  }

  /// Everything after the line's last blank goes back to the rest; the blank itself belongs to neither.
  void CutAtLastBlank() {
    const std::size_t blank = line.rfind(u' ');
    if (blank == Text::npos) return;
    rest.insert(0, line, blank + 1);
    line.erase(blank);
  }

  bool MayEndHere() const {
    return TextView(u" \r\n.").find(line.back()) != TextView::npos || line.find(u' ') == Text::npos;
  }
};

} // namespace

void AgreementWrap::Wrap(TextView text, int limit, const TextWidth& textWidth) {
  lines_.clear();
  lineCount_ = 0;

  const auto finish = [&](Paragraph& paragraph) {
    paragraph.CutAtLastBlank();
    Store(std::exchange(paragraph.line, {}));
  };
  const auto takeLinesWhileTooWide = [&](Paragraph& paragraph) {
    while (!paragraph.rest.empty() && textWidth(paragraph.rest) > limit) {
      paragraph.MoveOne();
      if (textWidth(paragraph.line) > limit) finish(paragraph);
    }
  };
  const auto wrapParagraph = [&](Paragraph paragraph) {
    for (;;) {
      takeLinesWhileTooWide(paragraph);
      if (paragraph.line.empty()) return Store(paragraph.rest);
      while (!paragraph.rest.empty() && textWidth(paragraph.line) < limit) paragraph.MoveOne();
      if (paragraph.MayEndHere()) {
        Store(paragraph.line);
        return Store(paragraph.rest);
      }
      finish(paragraph);
    }
  };

  for (std::size_t start = 0;;) {
    const std::size_t end = text.find(kLineBreak, start);
    wrapParagraph({Text(text.substr(start, end - start)), {}});
    if (end == TextView::npos) return;
    start = end + kLineBreak.size();
  }
}

const Text& AgreementWrap::Line(int number) const {
  if (number < 1 || number > lineCount_) throw Fault(Fault::kSubscript);
  return lines_[static_cast<std::size_t>(number - 1)];
}

void AgreementWrap::Store(Text line) {
  lineCount_ = ToInt16(lineCount_ + 1);
  lines_.push_back(std::move(line));
}

} // namespace quendra::shell
