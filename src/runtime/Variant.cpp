#include "runtime/Variant.h"

#include "runtime/Format.h"

namespace quendra {

double Variant::Number() const {
  const double* number = std::get_if<double>(&value_);
  return number ? *number : NumberOf(std::get<Text>(value_));
}

Text Variant::AsText() const {
  const Text* text = std::get_if<Text>(&value_);
  return text ? *text : NumberText(std::get<double>(value_));
}

} // namespace quendra
