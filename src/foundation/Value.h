#pragma once

#include "foundation/ByteArray.h"
#include "runtime/Text.h"

#include <optional>
#include <variant>

namespace quendra::foundation {

struct Null {
  friend bool operator==(Null, Null) { return true; }
};
/// Ten-thousandths.
struct Currency {
  std::int64_t scaled = 0;
  friend bool operator==(const Currency&, const Currency&) = default;
};
/// Days, 1 being 31 December 1899.
struct Date {
  double days = 0;
  friend bool operator==(const Date&, const Date&) = default;
};

/// A value of any kind that the language's variables hold; starts empty. What the socket class takes for an
/// index, for arguments that callers may leave out or get wrong, and for data.
using Value = std::variant<std::monostate, Null, bool, std::uint8_t, std::int16_t, std::int32_t, float,
                           double, Currency, Date, Text, ByteArray>;

inline bool IsEmpty(const Value& value) { return std::holds_alternative<std::monostate>(value); }

/// The kinds of data that can be asked for.
enum class DataKind {
  None,
  Boolean,
  Byte,
  Currency,
  Date,
  Double,
  Integer,
  Long,
  Single,
  String,
  ByteArray,
  Other
};

/// The kind of a value's own type; None for an empty value, Other for one that no data is read into.
DataKind KindOf(const Value& value);

/// The number that a value stands for: numbers, booleans (-1 and 0), the empty value (0) and texts that hold
/// a number; nothing for a value that is not numeric.
std::optional<double> NumberIn(const Value& value);
/// A numeric value rounded to 32 bits; fault 13 for one that is not numeric, 6 for one that doesn't fit.
std::int32_t ToInt32(const Value& value);
/// The value as text; fault 13 for bytes and for Null.
Text ToText(const Value& value);

} // namespace quendra::foundation
