// Any bytes as a picture: as packed data, and as a file whose check sums are right. What is read has as many
// pixels as it says.

#include "forms/view/png/Inflate.h"
#include "forms/view/png/PngReader.h"

#include "../forms/view/png/PngBytes.h"

#include <algorithm>
#include <cstdlib>

namespace {

using namespace quendra::forms;

constexpr std::uint32_t kLargestArea = 64 * 64;

/// The file with the check sum that each chunk should have, or else no change would ever get past it.
Bytes WithCheckSums(Bytes file) {
  constexpr std::size_t kAround = 12;
  std::size_t at = 8;
  while (at + kAround <= file.size()) {
    const auto length = static_cast<std::size_t>(file[at + 2]) << 8 | file[at + 3];
    if (length > file.size() - at - kAround) break;
    file[at] = file[at + 1] = 0;
    Bytes sum;
    AppendNumber(sum, CheckSumOf(std::span(file).subspan(at + 4, length + 4)));
    std::copy(sum.begin(), sum.end(), file.begin() + static_cast<std::ptrdiff_t>(at + 8 + length));
    at += length + kAround;
  }
  return file;
}

/// Large ones take the fuzzer's time and tell it nothing.
bool IsSmall(const Bytes& file) {
  constexpr std::size_t kSizes = 16;
  if (file.size() < kSizes + 8) return true;
  const auto number = [&](std::size_t at) {
    return static_cast<std::uint64_t>(file[at]) << 24 | static_cast<std::uint64_t>(file[at + 1]) << 16 |
           static_cast<std::uint64_t>(file[at + 2]) << 8 | file[at + 3];
  };
  return number(kSizes) > 2048 || number(kSizes + 4) > 2048 ||
         number(kSizes) * number(kSizes + 4) <= kLargestArea;
}

void Require(bool holds) {
  if (!holds) std::abort();
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const Bytes bytes(data, data + size);
  Bytes unpacked(kLargestArea);
  Inflate(bytes, unpacked);
  ReadPng(bytes);
  const Bytes file = WithCheckSums(bytes);
  if (!IsSmall(file)) return 0;
  if (const auto pixels = ReadPng(file)) {
    Require(pixels->width > 0 && pixels->height > 0);
    Require(pixels->argb.size() ==
            static_cast<std::size_t>(pixels->width) * static_cast<std::size_t>(pixels->height));
  }
  return 0;
}
