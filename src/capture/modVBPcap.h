#pragma once

#include "platform/capture/FrameBytes.h"
#include "runtime/ByteFields.h"
#include "runtime/Text.h"

/// Byte helpers of the frame decoders.
namespace quendra::capture::modVBPcap {

/// high * 256 + low as a signed value: 0xFF, 0xFF gives -1.
constexpr std::int16_t WordFromBytes(std::uint8_t high, std::uint8_t low) {
  return static_cast<std::int16_t>(Big16(std::array{high, low}, 0));
}

/// The same bytes in the opposite order.
constexpr std::int16_t WordFromLowHigh(std::uint8_t low, std::uint8_t high) {
  return WordFromBytes(high, low);
}

/// The word at `index` of a frame, its high byte first; fault 9 beyond the frame.
inline std::int16_t WordAt(const platform::FrameBytes& frame, int index) {
  return WordFromBytes(frame[index], frame[index + 1]);
}

/// high * 65536 + low, both taken without a sign, as a 32-bit pattern.
constexpr std::int32_t LongFromWords(std::int16_t low, std::int16_t high) {
  return static_cast<std::int32_t>(static_cast<std::uint32_t>(static_cast<std::uint16_t>(high)) << 16 |
                                   static_cast<std::uint16_t>(low));
}

/// Whether the run of bytes from `first` to `first + countLessOne` lies within the array. Indexes have 16
/// bits: a sum beyond them is fault 6.
bool RunIsInside(const platform::FrameBytes& bytes, std::int16_t first, std::int16_t countLessOne);

/// The bytes of that run in upper-case hexadecimal with ":" between them; "0" for a run that isn't inside.
Text HexRun(const platform::FrameBytes& bytes, std::int16_t first, std::int16_t countLessOne);

} // namespace quendra::capture::modVBPcap
