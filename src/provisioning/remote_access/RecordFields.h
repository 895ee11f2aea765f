#pragma once

#include "runtime/ByteFields.h"
#include "runtime/Fault.h"
#include "runtime/Text.h"

#include <algorithm>
#include <array>
#include <span>
#include <string>
#include <variant>
#include <vector>

namespace quendra::provisioning {

/// Bytes that are 0, as many as the machine said. A size far above any record's is answered as memory that
/// isn't there: fault 7.
inline std::vector<std::uint8_t> RecordBlock(std::uint64_t bytes) {
  constexpr std::uint64_t kMost = 64U << 20;
  if (bytes > kMost) throw Fault(Fault::kOutOfMemory);
  return std::vector<std::uint8_t>(bytes);
}

/// A text argument of the platform's: where it isn't empty it ends in a NUL.
inline void EndInNul(Text& text) {
  if (!text.empty() && text.back() != u'\0') text.push_back(u'\0');
}
/// The same for a name, which becomes a NUL when it is empty.
inline void EndNameInNul(Text& name) {
  if (name.empty() || name.back() != u'\0') name.push_back(u'\0');
}

/// The text of a field that the machine filled: up to its first NUL, the whole field where there is none.
inline std::string FieldBytes(std::span<const std::uint8_t> field) {
  return {field.begin(), std::find(field.begin(), field.end(), 0)};
}
inline Text FieldText(std::span<const std::uint8_t> field) { return FromCodePage(FieldBytes(field)); }

/// Values in fields and out of them. A text is cut so that a NUL stands behind it.
inline void PutValue(std::span<std::uint8_t> field, std::uint32_t number) { PutLittle32(field, 0, number); }
inline void PutValue(std::span<std::uint8_t> field, const Text& text) {
  const std::string bytes = ToCodePage(text);
  std::ranges::fill(field, std::uint8_t{0});
  std::copy_n(bytes.begin(), std::min(bytes.size(), field.size() - 1), field.begin());
}
template <std::size_t Count>
void PutValue(std::span<std::uint8_t> field, const std::array<std::uint8_t, Count>& bytes) {
  std::copy_n(bytes.begin(), Count, field.begin());
}
inline void TakeValue(std::span<const std::uint8_t> field, std::uint32_t& number) {
  number = Little32(field, 0);
}
inline void TakeValue(std::span<const std::uint8_t> field, Text& text) { text = FieldText(field); }
template <std::size_t Count>
void TakeValue(std::span<const std::uint8_t> field, std::array<std::uint8_t, Count>& bytes) {
  std::copy_n(field.begin(), Count, bytes.begin());
}

/// Where a member of a record lies in the platform's byte image. A shorter record of an older system has what
/// lies within it.
template <typename Record> struct RecordField {
  using Number = std::uint32_t Record::*;
  using Words = Text Record::*;
  using Address = std::array<std::uint8_t, 4> Record::*;
  using Guid = std::array<std::uint8_t, 16> Record::*;

  constexpr RecordField(Number member_, std::size_t at_) : member(member_), at(at_), width(4) {}
  constexpr RecordField(Words member_, std::size_t at_, std::size_t width_)
      : member(member_), at(at_), width(width_) {}
  constexpr RecordField(Address member_, std::size_t at_) : member(member_), at(at_), width(4) {}
  constexpr RecordField(Guid member_, std::size_t at_) : member(member_), at(at_), width(16) {}

  bool IsIn(std::size_t bytes) const { return at + width <= bytes; }

  std::variant<Number, Words, Address, Guid> member;
  std::size_t at;
  std::size_t width;
};

template <typename Record>
void PutField(const Record& record, const RecordField<Record>& field, std::span<std::uint8_t> image) {
  const auto bytes = image.subspan(field.at, field.width);
  std::visit([&](auto member) { PutValue(bytes, record.*member); }, field.member);
}

template <typename Record>
void TakeField(Record& record, const RecordField<Record>& field, std::span<const std::uint8_t> image) {
  const auto bytes = image.subspan(field.at, field.width);
  std::visit([&](auto member) { TakeValue(bytes, record.*member); }, field.member);
}

} // namespace quendra::provisioning
