#pragma once

#include "forms/controls/Colour.h"

namespace quendra::forms {

/// The few colours of the house beside those that the forms name themselves, by what they are for.
struct Palette {
  static constexpr Colour Ink = Rgb(0x1F, 0x29, 0x33);
  static constexpr Colour QuietInk = Rgb(0x6B, 0x77, 0x85);
  static constexpr Colour Page = Rgb(0xFF, 0xFF, 0xFF);
  static constexpr Colour QuietPage = Rgb(0xF6, 0xF8, 0xF9);
  static constexpr Colour Border = Rgb(0xD5, 0xDB, 0xE1);
  static constexpr Colour StrongBorder = Rgb(0xB4, 0xBE, 0xC8);
  static constexpr Colour Link = Rgb(0x0B, 0x5F, 0xA5);
  static constexpr Colour Selection = Rgb(0xDD, 0xF3, 0xC8);
  static constexpr Colour Focus = Rgb(0x1B, 0x6E, 0xC2);
  /// The face of what the toolkit draws as a button by itself.
  static constexpr Colour Button = Rgb(0xFB, 0xFC, 0xFD);
  /// What stands where a piece of artwork is missing.
  static constexpr Colour Placeholder = Rgb(0xE4, 0xE7, 0xEB);
  static constexpr Colour PlaceholderBorder = Rgb(0x9A, 0xA5, 0xB1);
};

/// The colour that a control was given; the one of the house where it was given none.
constexpr Colour InkOr(Colour given, Colour ofTheHouse) { return given == kBlack ? ofTheHouse : given; }

/// The colour with its light divided by `percent` hundredths: darker above 100.
Colour Darker(Colour colour, unsigned percent);

} // namespace quendra::forms
