#include "foundation/Value.h"

#include "runtime/Fault.h"
#include "runtime/Format.h"
#include "runtime/Integers.h"

namespace quendra::foundation {

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
  std::optional<double> operator()(std::uint8_t value) const { return value; }
  std::optional<double> operator()(std::int16_t value) const { return value; }
  std::optional<double> operator()(std::int32_t value) const { return value; }
  std::optional<double> operator()(float value) const { return value; }
  std::optional<double> operator()(double value) const { return value; }
  std::optional<double> operator()(Currency value) const { return static_cast<double>(value.scaled) / 10000; }
  std::optional<double> operator()(Date) const { return std::nullopt; }
  std::optional<double> operator()(const Text& text) const { return NumberInText(text); }
  std::optional<double> operator()(const ByteArray&) const { return std::nullopt; }
};

} // namespace

DataKind KindOf(const Value& value) {
  static constexpr DataKind kKinds[] = {DataKind::None,   DataKind::Other,   DataKind::Boolean,
                                        DataKind::Byte,   DataKind::Integer, DataKind::Long,
                                        DataKind::Single, DataKind::Double,  DataKind::Currency,
                                        DataKind::Date,   DataKind::String,  DataKind::ByteArray};
  static_assert(std::size(kKinds) == std::variant_size_v<Value>);
  return kKinds[value.index()];
}

std::optional<double> NumberIn(const Value& value) { return std::visit(NumberReader{}, value); }

std::int32_t ToInt32(const Value& value) {
  const auto number = NumberIn(value);
  if (!number) throw Fault(Fault::kTypeMismatch);
  return RoundToInt32(*number);
}

Text ToText(const Value& value) {
  if (const Text* text = std::get_if<Text>(&value)) return *text;
  if (IsEmpty(value)) return {};
  if (const bool* flag = std::get_if<bool>(&value)) return *flag ? u"True" : u"False";
  const auto number = NumberIn(value);
  if (!number) throw Fault(Fault::kTypeMismatch);
  return NumberText(*number);
}

} // namespace quendra::foundation
