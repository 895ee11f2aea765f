#include "platform/windows/remote_access/RasLayouts.h"

#include "runtime/ByteFields.h"

#include <algorithm>
#include <cstring>

namespace quendra::platform::windows {

namespace {

void WidenText(std::span<const std::uint8_t> narrow, std::uint8_t* wide) {
  Text text = FromCodePage(CutAtNul({reinterpret_cast<const char*>(narrow.data()), narrow.size() - 1}));
  std::memcpy(wide, text.data(), text.size() * sizeof(char16_t));
  ::SecureZeroMemory(text.data(), text.size() * sizeof(char16_t)); // it may have been a password
}

void NarrowText(const std::uint8_t* wide, std::span<std::uint8_t> narrow) {
  const TextView text(reinterpret_cast<const char16_t*>(wide), narrow.size() - 1);
  const std::string bytes = ToCodePage(CutAtNul(text));
  std::ranges::fill(narrow, std::uint8_t{0});
  std::copy_n(bytes.begin(), std::min(bytes.size(), narrow.size() - 1), narrow.begin());
}

/// Goes over the pieces that a record of the program's holds: where its numbers begin and where its text.
template <typename See> void ForEachPiece(RasLayout layout, std::size_t narrowBytes, See see) {
  RasPlace at;
  for (const RasPiece& piece : layout) {
    const RasPlace text = at.BehindNumbers(piece.numbers);
    if (text.narrow + piece.characters > narrowBytes) return;
    const std::size_t bytes = 4 * piece.numbers;
    see({text.narrow - bytes, text.wide - bytes}, text, piece);
    at = text.BehindText(piece.characters);
  }
}

} // namespace

void Widen(RasLayout layout, std::span<const std::uint8_t> narrow, std::span<std::uint8_t> wide) {
  ForEachPiece(layout, narrow.size(), [&](RasPlace numbers, RasPlace text, const RasPiece& piece) {
    std::memcpy(&wide[numbers.wide], &narrow[numbers.narrow], 4 * piece.numbers);
    if (piece.characters > 0) WidenText(narrow.subspan(text.narrow, piece.characters), &wide[text.wide]);
  });
  PutLittle32(wide, 0, static_cast<std::uint32_t>(wide.size()));
}

void Narrow(RasLayout layout, std::span<const std::uint8_t> wide, std::span<std::uint8_t> narrow) {
  ForEachPiece(layout, narrow.size(), [&](RasPlace numbers, RasPlace text, const RasPiece& piece) {
    std::memcpy(&narrow[numbers.narrow], &wide[numbers.wide], 4 * piece.numbers);
    if (piece.characters > 0) NarrowText(&wide[text.wide], narrow.subspan(text.narrow, piece.characters));
  });
  PutLittle32(narrow, 0, static_cast<std::uint32_t>(narrow.size()));
}

} // namespace quendra::platform::windows
