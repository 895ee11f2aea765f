#pragma once

#include "winapi/Winapi.h"

#include <ras.h>

#include <array>
#include <cstddef>
#include <cstdint>
#include <span>

/// The records of remote access as the program has them, with a byte of its own code page for a character,
/// and as the system's wide calls take them. Both have the same numbers and texts in the same order.
namespace quendra::platform::windows {

/// So many numbers of 32 bits, and behind them a text with room for so many characters, the NUL among them.
struct RasPiece {
  std::size_t numbers = 0;
  std::size_t characters = 0;
};
/// A record may end behind each piece: older systems had shorter ones.
using RasLayout = std::span<const RasPiece>;

inline constexpr std::array kRasEntryName{RasPiece{1, 257}};
inline constexpr std::array kRasDevice{RasPiece{1, 17}, RasPiece{0, 129}};
inline constexpr std::array kRasDialParams{RasPiece{1, 257}, RasPiece{0, 129}, RasPiece{0, 129},
                                           RasPiece{0, 257}, RasPiece{0, 257}, RasPiece{0, 16},
                                           RasPiece{2}};
inline constexpr std::array kRasConnection{RasPiece{2, 257}, RasPiece{0, 17}, RasPiece{0, 129},
                                           RasPiece{0, 260}, RasPiece{1},     RasPiece{4}};
inline constexpr std::array kRasEntry{RasPiece{4, 11},  RasPiece{0, 129}, RasPiece{9, 260}, RasPiece{0, 260},
                                      RasPiece{0, 260}, RasPiece{0, 17},  RasPiece{0, 129}, RasPiece{0, 33},
                                      RasPiece{0, 201}, RasPiece{0, 201}, RasPiece{0, 201}, RasPiece{3},
                                      RasPiece{7},      RasPiece{7, 260}, RasPiece{1},      RasPiece{2, 256},
                                      RasPiece{1, 260}, RasPiece{0, 257}, RasPiece{2}};

/// Where a piece stands in both.
struct RasPlace {
  std::size_t narrow = 0;
  std::size_t wide = 0;

  /// Numbers stand at a multiple of their size, and so does a record's end.
  constexpr RasPlace Whole() const { return {(narrow + 3) / 4 * 4, (wide + 3) / 4 * 4}; }
  constexpr RasPlace BehindNumbers(std::size_t count) const {
    return count == 0 ? *this : RasPlace{Whole().narrow + 4 * count, Whole().wide + 4 * count};
  }
  constexpr RasPlace BehindText(std::size_t count) const { return {narrow + count, wide + 2 * count}; }
};

/// What a record of the program's has on the system's side; 0 for a size that ends within a piece.
constexpr std::uint32_t WideBytes(RasLayout layout, std::size_t narrowBytes) {
  RasPlace at;
  for (const RasPiece& piece : layout) {
    at = at.BehindNumbers(piece.numbers).BehindText(piece.characters);
    if (at.Whole().narrow == narrowBytes) return static_cast<std::uint32_t>(at.Whole().wide);
  }
  return 0;
}

static_assert(WideBytes(kRasDevice, sizeof(RASDEVINFOA)) == sizeof(RASDEVINFOW));
static_assert(WideBytes(kRasDialParams, sizeof(RASDIALPARAMSA)) == sizeof(RASDIALPARAMSW));
static_assert(WideBytes(kRasEntry, sizeof(RASENTRYA)) == sizeof(RASENTRYW));

/// Fills a record of the system's, which is as long as WideBytes says and blank.
void Widen(RasLayout layout, std::span<const std::uint8_t> narrow, std::span<std::uint8_t> wide);
/// Fills a record of the program's.
void Narrow(RasLayout layout, std::span<const std::uint8_t> wide, std::span<std::uint8_t> narrow);

} // namespace quendra::platform::windows
