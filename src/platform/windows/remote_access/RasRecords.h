#pragma once

#include "platform/remote_access/RemoteAccessNumbers.h"
#include "platform/windows/remote_access/RasLayouts.h"
#include "runtime/ByteFields.h"
#include "winapi/Winapi.h"

#include <algorithm>
#include <optional>
#include <span>
#include <vector>

/// Byte images and names for the system's wide calls: the machine's own code page, in which the others have
/// their texts, may be another than the program's, and lack the letters of a name.
namespace quendra::platform::windows {

/// A text of the program's; nullptr stays that.
class WideName {
 public:
  explicit WideName(const char* bytes) {
    if (bytes) text_ = FromCodePage(bytes);
  }
  operator const wchar_t*() const { return text_ ? winapi::Wide(*text_) : nullptr; }

 private:
  std::optional<Text> text_;
};

/// The system has a name for every phone book but the user's own.
inline WideName BookNamed(const char* phoneBook) {
  return WideName(phoneBook && *phoneBook != '\0' ? phoneBook : nullptr);
}

/// 0 for a record that is as long as it says.
inline std::uint32_t ErrorOfRecord(std::span<const std::uint8_t> record) {
  const bool isWhole = record.size() >= 4 && Little32(record, 0) <= record.size();
  return isWhole ? kRasSuccess : kRasInvalidSize;
}
/// 0 for one that has a size of this layout, too.
inline std::uint32_t ErrorOfRecord(RasLayout layout, std::span<const std::uint8_t> record) {
  if (const std::uint32_t error = ErrorOfRecord(record)) return error;
  return WideBytes(layout, Little32(record, 0)) > 0 ? kRasSuccess : kRasInvalidSize;
}

/// The system's form of a record without an error.
class WideRecord {
 public:
  WideRecord(RasLayout layout, std::span<const std::uint8_t> record)
      : layout_(layout), bytes_(WideBytes(layout, Little32(record, 0))) {
    Widen(layout, record.first(Little32(record, 0)), bytes_);
  }
  WideRecord(const WideRecord&) = delete;
  WideRecord& operator=(const WideRecord&) = delete;
  /// It may have held a password.
  ~WideRecord() { ::SecureZeroMemory(bytes_.data(), bytes_.size()); }

  template <typename Record> Record* As() { return reinterpret_cast<Record*>(bytes_.data()); }
  /// Back into the record that it was made from.
  void PutInto(std::span<std::uint8_t> record) const {
    Narrow(layout_, bytes_, record.first(Little32(record, 0)));
  }

 private:
  RasLayout layout_;
  std::vector<std::uint8_t> bytes_;
};

/// Lets a listing call of the system fill a buffer. An empty one stands for a lone record of this size
/// without room, so that what is needed is told in records of a size that the program knows.
template <typename Record, typename Call>
std::uint32_t FillList(RasLayout layout, std::span<std::uint8_t> buffer, std::uint32_t& bytes,
                       std::uint32_t& count, std::uint32_t recordBytes, Call call) {
  count = 0;
  if (!buffer.empty() && buffer.size() < 4) return kRasInvalidSize;
  const std::uint32_t narrow = buffer.empty() ? recordBytes : Little32(buffer, 0);
  const std::uint32_t wide = WideBytes(layout, narrow);
  if (wide == 0) return kRasInvalidSize;
  const std::size_t rooms = std::min<std::size_t>(bytes, buffer.size()) / narrow;
  std::vector<std::uint8_t> records(std::max<std::size_t>(rooms, 1) * wide);
  PutLittle32(records, 0, wide);
  auto room = static_cast<DWORD>(rooms * wide);
  DWORD found = 0;
  const std::uint32_t result = call(reinterpret_cast<Record*>(records.data()), &room, &found);
  bytes = room / wide * narrow;
  count = found;
  for (std::size_t i = 0; result == kRasSuccess && i < std::min<std::size_t>(found, rooms); ++i)
    Narrow(layout, std::span(records).subspan(i * wide, wide), buffer.subspan(i * narrow, narrow));
  return result;
}

} // namespace quendra::platform::windows
