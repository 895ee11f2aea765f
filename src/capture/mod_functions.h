#pragma once

#include "platform/capture/FrameBytes.h"
#include "runtime/Text.h"

/// Byte helpers of the pre-reader.
namespace quendra::capture::mod_functions {

/// The four bytes of the value in memory order as a dotted quad.
Text IpFromLong(std::uint32_t value);

/// Copies `count` bytes, at most four, into a value in memory order; the rest of the value is 0. Fault 9
/// beyond the array.
std::uint32_t ReadBytes(const platform::FrameBytes& bytes, std::int32_t index, std::int32_t count);

/// The bytes from `first` to `first + countLessOne` in upper-case hexadecimal with ":" between them. No test
/// of the bounds comes first: fault 9 beyond them.
Text HexRun(const platform::FrameBytes& bytes, std::int32_t first, std::int32_t countLessOne);

} // namespace quendra::capture::mod_functions
