#include "runtime/Variant.h"

#include "runtime/Fault.h"
#include "runtime/Format.h"
#include "runtime/Integers.h"

namespace quendra {

namespace {

std::optional<double> NumberInText(const Text& text) {
  try {
    return NumberOf(text);
  } catch (const Fault&) {
    return std::nullopt;
  }
}

struct NumberReader {
  std::optional<double> operator()(std::monostate) const { return 0; }
  std::optional<double> operator()(Null) const { return std::nullopt; }
  std::optional<double> operator()(bool value) const { return value ? -1 : 0; }
  template <typename Number> std::optional<double> operator()(Number value) const { return value; }
  std::optional<double> operator()(Currency value) const { return static_cast<double>(value.scaled) / 10000; }
  std::optional<double> operator()(Date) const { return std::nullopt; }
  std::optional<double> operator()(const Text& text) const { return NumberInText(text); }
  std::optional<double> operator()(const ByteArray&) const { return std::nullopt; }
};

struct KindReader {
  DataKind operator()(std::monostate) const { return DataKind::None; }
  DataKind operator()(Null) const { return DataKind::Other; }
  DataKind operator()(bool) const { return DataKind::Boolean; }
  DataKind operator()(std::uint8_t) const { return DataKind::Byte; }
  DataKind operator()(std::int16_t) const { return DataKind::Integer; }
  DataKind operator()(std::int32_t) const { return DataKind::Long; }
  DataKind operator()(float) const { return DataKind::Single; }
  DataKind operator()(double) const { return DataKind::Double; }
  DataKind operator()(Currency) const { return DataKind::Currency; }
  DataKind operator()(Date) const { return DataKind::Date; }
  DataKind operator()(const Text&) const { return DataKind::String; }
  DataKind operator()(const ByteArray&) const { return DataKind::ByteArray; }
};

bool IsPlainNumber(DataKind kind) {
  return kind == DataKind::Byte || kind == DataKind::Integer || kind == DataKind::Long ||
         kind == DataKind::Single || kind == DataKind::Double;
}

} // namespace

DataKind Variant::Kind() const { return Visit(KindReader{}); }

std::optional<double> Variant::NumberIfAny() const { return Visit(NumberReader{}); }

double Variant::ReadNumber() const {
  if (const Text* text = Find<Text>()) return NumberOf(*text);
  const auto number = NumberIfAny();
  if (!number) throw Fault(Fault::kTypeMismatch);
  return *number;
}

std::int32_t Variant::AsInt32() const {
  const auto number = NumberIfAny();
  if (!number) throw Fault(Fault::kTypeMismatch);
  return RoundToInt32(*number);
}

Text Variant::AsText() const {
  if (const Text* text = Find<Text>()) return *text;
  if (IsMissing()) return {};
  if (const bool* flag = Find<bool>()) return *flag ? u"True" : u"False";
  return NumberText(ReadNumber());
}

bool operator==(const Variant& left, const Variant& right) {
  if (left.value_.index() == right.value_.index()) return left.value_ == right.value_;
  return IsPlainNumber(left.Kind()) && IsPlainNumber(right.Kind()) && left.Number() == right.Number();
}

} // namespace quendra
