#include "capture/clsTCP.h"

#include "capture/Protocols.h"
#include "capture/modVBPcap.h"

namespace quendra::capture {

namespace {

constexpr int kShortestTunnelBound = 94;
constexpr std::array<const char16_t*, 6> kFlagNames{u"FIN;",  u"SYN;", u"RESET;",
                                                    u"PUSH;", u"ACK;", u"URGENT;"};

using modVBPcap::WordAt;

std::int32_t LongAt(const platform::FrameBytes& frame, int index) {
  const std::int16_t high = WordAt(frame, index);
  return modVBPcap::LongFromWords(WordAt(frame, index + 2), high);
}

} // namespace

void clsTCP::Decode(const platform::FrameBytes& frame, std::int32_t /*lengthHint*/, bool tunnelled) {
  const int offset = tunnelled && frame.UpperBound() >= kShortestTunnelBound ? kTunnelOffset : 0;
  srcPort_ = WordAt(frame, offset + 34);
  dstPort_ = WordAt(frame, offset + 36);
  seqNumber_ = LongAt(frame, offset + 38);
  ackNumber_ = LongAt(frame, offset + 42);
  HLEN_ = frame[offset + 46] >> 4;
  flags_ = frame[offset + 47];
  window_ = WordAt(frame, offset + 48);
  WordAt(frame, offset + 50); // the checksum is read and dropped
  UrgentPointer_ = WordAt(frame, offset + 52);
  BuildFlagString();
}

void clsTCP::BuildFlagString() { flagStringBits_ = flags_; }

Text clsTCP::flagString() const {
  Text text;
  for (std::size_t bit = 0; bit < kFlagNames.size(); ++bit)
    if (flagStringBits_ >> bit & 1) text += kFlagNames[bit];
  return text;
}

} // namespace quendra::capture
