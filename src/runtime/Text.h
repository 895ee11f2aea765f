#pragma once

#include <cstdint>
#include <string>
#include <string_view>

namespace quendra {

/// A text of the program: 16-bit code units, as its strings have been since the first edition.
using Text = std::u16string;
using TextView = std::u16string_view;

/// UTF-8 for the systems and libraries that speak it. Malformed input becomes U+FFFD, never a failure.
Text FromUtf8(std::string_view bytes);
std::string ToUtf8(TextView text);

/// Single bytes of the system's code page (1255), as at platform calls and in files. What the page lacks
/// becomes "?".
std::string ToCodePage(TextView text);
Text FromCodePage(std::string_view bytes);

/// Decimal text of a whole number, with a leading "-" below zero.
Text DecimalText(std::int64_t value);
/// Upper-case hexadecimal text without leading zeros.
Text HexText(std::uint32_t value);

/// Everything before the first NUL; the whole text when there is none.
TextView CutAtNul(TextView text);
std::string_view CutAtNul(std::string_view bytes);

/// Without the blanks (U+0020 only) at both ends.
TextView Trimmed(TextView text);
/// All occurrences of `what`, compared code unit by code unit; an empty `what` replaces nothing.
Text Replaced(TextView text, TextView what, TextView with);
/// Latin letters made small; other letters have no case that the program compares.
Text Lowered(TextView text);
/// Equality without regard to the case of Latin letters.
bool SameIgnoringCase(TextView left, TextView right);
/// Padded on the left with `fill` to `width` code units.
Text PaddedLeft(TextView text, std::size_t width, char16_t fill);

} // namespace quendra
