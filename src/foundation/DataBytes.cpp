#include "foundation/DataBytes.h"

#include "runtime/ByteFields.h"

#include <bit>

namespace quendra::foundation {

namespace {

/// The unsigned number of the same width, which has the same bits.
template <typename Number>
using BitsOf = std::conditional_t<
    sizeof(Number) == 8, std::uint64_t,
    std::conditional_t<sizeof(Number) == 4, std::uint32_t,
                       std::conditional_t<sizeof(Number) == 2, std::uint16_t, std::uint8_t>>>;

template <typename Number> ByteArray Raw(Number number) {
  ByteArray bytes(sizeof number);
  PutLittleField(bytes, 0, std::bit_cast<BitsOf<Number>>(number));
  return bytes;
}

template <typename Number> Number FromRaw(const ByteArray& bytes) {
  return std::bit_cast<Number>(LittleField<BitsOf<Number>>(bytes, 0));
}

struct ByteWriter {
  std::optional<ByteArray> operator()(std::monostate) const { return std::nullopt; }
  std::optional<ByteArray> operator()(Null) const { return std::nullopt; }
  std::optional<ByteArray> operator()(bool value) const { return Raw<std::int16_t>(value ? -1 : 0); }
  template <typename Number> std::optional<ByteArray> operator()(Number value) const { return Raw(value); }
  std::optional<ByteArray> operator()(Currency value) const { return Raw(value.scaled); }
  std::optional<ByteArray> operator()(Date value) const { return Raw(value.days); }
  std::optional<ByteArray> operator()(const ByteArray& bytes) const { return bytes; }
  std::optional<ByteArray> operator()(const Text& text) const {
    const std::string bytes = ToCodePage(text);
    return ByteArray(bytes.begin(), bytes.end());
  }
};

} // namespace

std::optional<ByteArray> BytesOf(const Variant& value) { return value.Visit(ByteWriter{}); }

std::size_t SizeOf(DataKind kind) {
  switch (kind) {
  case DataKind::Byte: return 1;
  case DataKind::Boolean:
  case DataKind::Integer: return 2;
  case DataKind::Long:
  case DataKind::Single: return 4;
  case DataKind::Currency:
  case DataKind::Date:
  case DataKind::Double: return 8;
  default: return 0;
  }
}

Variant ValueOf(DataKind kind, ByteArray bytes) {
  switch (kind) {
  case DataKind::Byte: return bytes[0];
  case DataKind::Boolean: return FromRaw<std::int16_t>(bytes) != 0;
  case DataKind::Integer: return FromRaw<std::int16_t>(bytes);
  case DataKind::Long: return FromRaw<std::int32_t>(bytes);
  case DataKind::Single: return FromRaw<float>(bytes);
  case DataKind::Double: return FromRaw<double>(bytes);
  case DataKind::Currency: return Currency{FromRaw<std::int64_t>(bytes)};
  case DataKind::Date: return Date{FromRaw<double>(bytes)};
  case DataKind::String: return FromCodePage({reinterpret_cast<const char*>(bytes.data()), bytes.size()});
  default: return bytes;
  }
}

} // namespace quendra::foundation
