#include "forms/view/png/Inflate.h"

#include "forms/view/png/HuffmanCode.h"

#include <algorithm>

namespace quendra::forms {

namespace {

constexpr int kEndOfBlock = 256;
constexpr std::size_t kMostLiterals = 286;
constexpr std::size_t kMostDistances = 30;

/// A length or a distance: the least that a symbol means, and how many bits follow that add to it.
struct Range {
  std::uint16_t least;
  std::uint8_t bits;
};
constexpr Range kLengths[] = {{3, 0},   {4, 0},   {5, 0},   {6, 0},   {7, 0},  {8, 0},  {9, 0},  {10, 0},
                              {11, 1},  {13, 1},  {15, 1},  {17, 1},  {19, 2}, {23, 2}, {27, 2}, {31, 2},
                              {35, 3},  {43, 3},  {51, 3},  {59, 3},  {67, 4}, {83, 4}, {99, 4}, {115, 4},
                              {131, 5}, {163, 5}, {195, 5}, {227, 5}, {258, 0}};
constexpr Range kDistances[] = {{1, 0},     {2, 0},     {3, 0},     {4, 0},      {5, 1},      {7, 1},
                                {9, 2},     {13, 2},    {17, 3},    {25, 3},     {33, 4},     {49, 4},
                                {65, 5},    {97, 5},    {129, 6},   {193, 6},    {257, 7},    {385, 7},
                                {513, 8},   {769, 8},   {1025, 9},  {1537, 9},   {2049, 10},  {3073, 10},
                                {4097, 11}, {6145, 11}, {8193, 12}, {12289, 12}, {16385, 13}, {24577, 13}};
/// The order in which the code of the code's lengths is told.
constexpr std::uint8_t kOrder[] = {16, 17, 18, 0, 8, 7, 9, 6, 10, 5, 11, 4, 12, 3, 13, 2, 14, 1, 15};

class Inflater {
 public:
  Inflater(std::span<const std::uint8_t> packed, std::span<std::uint8_t> unpacked)
      : bits_(packed), out_(unpacked) {}

  bool Run() {
    bool last = false;
    while (!last && !Full()) {
      last = bits_.Take(1) != 0;
      if (!Block(bits_.Take(2)) || bits_.RanOut()) return false;
    }
    return Full();
  }

 private:
  bool Full() const { return written_ == out_.size(); }

  bool Block(std::uint32_t kind) {
    switch (kind) {
    case 0: return StoredBlock();
    case 1: return UseFixedCodes() && CodedBlock();
    case 2: return ReadCodes() && CodedBlock();
    default: return false;
    }
  }

  bool StoredBlock() {
    bits_.SkipToByte();
    std::uint32_t length = bits_.Take(16);
    if (bits_.Take(16) != (length ^ 0xFFFF)) return false;
    for (; length && !Full() && !bits_.RanOut(); --length)
      out_[written_++] = static_cast<std::uint8_t>(bits_.Take(8));
    return true;
  }

  bool UseFixedCodes() {
    std::array<std::uint8_t, 288> literals{};
    std::fill_n(literals.begin(), 144, std::uint8_t{8});
    std::fill_n(literals.begin() + 144, 112, std::uint8_t{9});
    std::fill_n(literals.begin() + 256, 24, std::uint8_t{7});
    std::fill_n(literals.begin() + 280, 8, std::uint8_t{8});
    std::array<std::uint8_t, kMostDistances> distances{};
    distances.fill(5);
    return literals_.Build(literals) && distances_.Build(distances);
  }

  bool ReadCodes() {
    const std::size_t literals = bits_.Take(5) + 257;
    const std::size_t distances = bits_.Take(5) + 1;
    const std::size_t told = bits_.Take(4) + 4;
    if (literals > kMostLiterals || distances > kMostDistances) return false;
    std::array<std::uint8_t, std::size(kOrder)> codeLengths{};
    for (std::size_t i = 0; i < told; ++i) codeLengths[kOrder[i]] = static_cast<std::uint8_t>(bits_.Take(3));
    HuffmanCode code;
    if (!code.Build(codeLengths)) return false;
    std::array<std::uint8_t, kMostLiterals + kMostDistances> lengths{};
    if (!ReadLengths(code, std::span(lengths).first(literals + distances))) return false;
    return literals_.Build(std::span(lengths).first(literals)) &&
           distances_.Build(std::span(lengths).subspan(literals, distances));
  }

  bool ReadLengths(const HuffmanCode& code, std::span<std::uint8_t> lengths) {
    std::size_t at = 0;
    while (at < lengths.size()) {
      const int symbol = code.Read(bits_);
      if (symbol < 0 || bits_.RanOut()) return false;
      if (symbol < 16) {
        lengths[at++] = static_cast<std::uint8_t>(symbol);
        continue;
      }
      if (symbol == 16 && at == 0) return false;
      const std::uint8_t repeated = symbol == 16 ? lengths[at - 1] : std::uint8_t{0};
      const std::size_t count = symbol == 16   ? bits_.Take(2) + 3
                                : symbol == 17 ? bits_.Take(3) + 3
                                               : bits_.Take(7) + 11;
      if (count > lengths.size() - at) return false;
      std::fill_n(lengths.begin() + static_cast<std::ptrdiff_t>(at), count, repeated);
      at += count;
    }
    return true;
  }

  bool CodedBlock() {
    while (!Full()) {
      const int symbol = literals_.Read(bits_);
      if (symbol < 0 || bits_.RanOut()) return false;
      if (symbol == kEndOfBlock) return true;
      if (symbol < kEndOfBlock)
        out_[written_++] = static_cast<std::uint8_t>(symbol);
      else if (!Repeat(static_cast<std::size_t>(symbol - kEndOfBlock - 1)))
        return false;
    }
    return true;
  }

  /// Copies what was unpacked before; it may reach into the copy itself.
  bool Repeat(std::size_t lengthSymbol) {
    if (lengthSymbol >= std::size(kLengths)) return false;
    const std::size_t length = Told(kLengths[lengthSymbol]);
    const int symbol = distances_.Read(bits_);
    if (symbol < 0 || static_cast<std::size_t>(symbol) >= std::size(kDistances)) return false;
    const std::size_t distance = Told(kDistances[symbol]);
    if (distance > written_) return false;
    Copy(distance, std::min(length, out_.size() - written_));
    return true;
  }

  void Copy(std::size_t distance, std::size_t length) {
    std::uint8_t* to = out_.data() + written_;
    const std::uint8_t* from = to - distance;
    if (distance >= length)
      std::copy_n(from, length, to);
    else if (distance == 1)
      std::fill_n(to, length, *from);
    else
      for (std::size_t i = 0; i < length; ++i) to[i] = from[i];
    written_ += length;
  }

  std::size_t Told(Range range) { return range.least + (range.bits ? bits_.Take(range.bits) : 0U); }

  BitReader bits_;
  std::span<std::uint8_t> out_;
  std::size_t written_ = 0;
  HuffmanCode literals_;
  HuffmanCode distances_;
};

} // namespace

bool Inflate(std::span<const std::uint8_t> packed, std::span<std::uint8_t> unpacked) {
  constexpr std::size_t kHeader = 2;
  constexpr int kDeflate = 8;
  constexpr int kDictionary = 0x20;
  if (packed.size() < kHeader || (packed[0] & 0xF) != kDeflate || packed[1] & kDictionary ||
      (packed[0] * 256 + packed[1]) % 31 != 0)
    return false;
  return Inflater(packed.subspan(kHeader), unpacked).Run();
}

} // namespace quendra::forms
