#pragma once

#include "runtime/Text.h"

#include <variant>

namespace quendra {

/// What the Tag of a row or cell holds: a text or a double. Starts as the empty text.
class Variant {
 public:
  Variant() = default;
  Variant(Text text) : value_(std::move(text)) {}
  Variant(const char16_t* text) : value_(Text(text)) {}
  Variant(double number) : value_(number) {}
  Variant(std::int32_t number) : value_(static_cast<double>(number)) {}
  Variant(std::uint32_t number) : value_(static_cast<double>(number)) {}

  /// True for the empty text only; a number is never empty.
  bool IsEmpty() const {
    const Text* text = std::get_if<Text>(&value_);
    return text && text->empty();
  }

  /// The number, or the number that the text holds; fault 13 when it holds none.
  double Number() const;
  /// The text, or the number's decimal text.
  Text AsText() const;
  /// The number in place, or nullptr when a text stands here: the road for those that add in a hot loop.
  double* NumberInPlace() { return std::get_if<double>(&value_); }

  friend bool operator==(const Variant&, const Variant&) = default;

 private:
  std::variant<Text, double> value_;
};

} // namespace quendra
