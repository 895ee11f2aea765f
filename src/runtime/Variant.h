#pragma once

#include "runtime/ByteArray.h"
#include "runtime/Text.h"

#include <optional>
#include <variant>

namespace quendra {

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

/// The kinds of data that can be asked for: None for nothing at all, Other for one that no data is read into.
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

/// A value of any kind that the language's variables hold; starts as nothing, which reads as the empty text.
/// What the Tags of rows and cells hold, and what the socket class takes for an index, for data and for
/// arguments that callers may leave out or get wrong.
class Variant {
 public:
  Variant() = default;
  Variant(Null value) : value_(value) {}
  Variant(bool value) : value_(value) {}
  Variant(std::uint8_t value) : value_(value) {}
  Variant(std::int16_t value) : value_(value) {}
  Variant(std::int32_t value) : value_(value) {}
  /// The language has no such type: a double.
  Variant(std::uint32_t value) : value_(static_cast<double>(value)) {}
  Variant(float value) : value_(value) {}
  Variant(double value) : value_(value) {}
  Variant(Currency value) : value_(value) {}
  Variant(Date value) : value_(value) {}
  Variant(Text value) : value_(std::move(value)) {}
  Variant(const char16_t* value) : value_(Text(value)) {}
  Variant(ByteArray value) : value_(std::move(value)) {}

  DataKind Kind() const;
  /// True where nothing stands at all, as for an argument that was left out.
  bool IsMissing() const { return Is<std::monostate>(); }
  /// True for nothing and for the empty text; a number is never empty.
  bool IsEmpty() const {
    const Text* text = Find<Text>();
    return text ? text->empty() : IsMissing();
  }
  template <typename Type> bool Is() const { return std::holds_alternative<Type>(value_); }
  /// The value where it is of this very type, nullptr where it is of another.
  template <typename Type> const Type* Find() const { return std::get_if<Type>(&value_); }
  template <typename Type> Type* Find() { return std::get_if<Type>(&value_); }
  template <typename Visitor> auto Visit(Visitor&& visitor) const { return std::visit(visitor, value_); }

  /// The number that stands here: numbers, booleans (-1 and 0), nothing (0) and texts that hold a number;
  /// nothing for a value that is not numeric.
  std::optional<double> NumberIfAny() const;
  /// The same; fault 13 for a value that is not numeric, 6 for a text whose number no double holds.
  double Number() const {
    const double* number = Find<double>();
    return number ? *number : ReadNumber();
  }
  /// The number rounded to 32 bits; fault 13 for a value that is not numeric, 6 for one that doesn't fit.
  std::int32_t AsInt32() const;
  /// The value as text; fault 13 for bytes, dates and Null.
  Text AsText() const;
  /// The number in place, or nullptr when no double stands here: for adding to it in a hot loop.
  double* NumberInPlace() { return Find<double>(); }

  /// Numbers are the same whatever their width; a number and its text are not.
  friend bool operator==(const Variant& left, const Variant& right);

 private:
  double ReadNumber() const;

  std::variant<std::monostate, Null, bool, std::uint8_t, std::int16_t, std::int32_t, float, double, Currency,
               Date, Text, ByteArray>
      value_;
};

} // namespace quendra
