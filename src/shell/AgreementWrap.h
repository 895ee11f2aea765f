#pragma once

#include "runtime/Text.h"

#include <cstdint>
#include <functional>
#include <vector>

namespace quendra::shell {

/// Breaks a text into lines that fit a picture box, by blanks where there are any.
class AgreementWrap {
 public:
  /// Width of a text, in the unit of the limit.
  using TextWidth = std::function<int(TextView)>;

  /// A text's paragraphs end at CR LF. Fault 6 for more lines than a 16-bit number counts.
  void Wrap(TextView text, int limit, const TextWidth& textWidth);

  std::int16_t LineCount() const { return lineCount_; }
  /// Lines are numbered from 1; fault 9 for any other number.
  const Text& Line(int number) const;

 private:
  void Store(Text line);

  std::vector<Text> lines_;
  std::int16_t lineCount_ = 0;
};

} // namespace quendra::shell
