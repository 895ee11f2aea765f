#include "capture/modVBPcap.h"

#include "capture/mod_functions.h"
#include "runtime/Integers.h"

namespace quendra::capture::modVBPcap {

bool RunIsInside(const platform::FrameBytes& bytes, std::int16_t first, std::int16_t countLessOne) {
  return ToInt16(first + countLessOne) <= bytes.UpperBound() && first >= 0;
}

Text HexRun(const platform::FrameBytes& bytes, std::int16_t first, std::int16_t countLessOne) {
  return RunIsInside(bytes, first, countLessOne) ? mod_functions::HexRun(bytes, first, countLessOne) : u"0";
}

} // namespace quendra::capture::modVBPcap
