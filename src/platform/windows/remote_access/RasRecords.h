#pragma once

#include "platform/remote_access/RemoteAccessNumbers.h"
#include "runtime/ByteFields.h"
#include "winapi/Winapi.h"

#include <algorithm>
#include <span>
#include <vector>

/// Byte images as the system's calls take them: it reads as far as a record's first word says, and a text as
/// far as its NUL.
namespace quendra::platform::windows {

/// The system has a name for every phone book but the user's own.
inline const char* BookNamed(const char* phoneBook) {
  return phoneBook && *phoneBook != '\0' ? phoneBook : nullptr;
}

/// 0 for a record that is as long as it says.
inline std::uint32_t ErrorOfRecord(std::span<const std::uint8_t> record) {
  const bool isWhole = record.size() >= 4 && Little32(record, 0) <= record.size();
  return isWhole ? kRasSuccess : kRasInvalidSize;
}

/// A record that the system may write to, and read to a NUL in whatever text of it.
class RecordCopy {
 public:
  explicit RecordCopy(std::span<const std::uint8_t> record) : bytes_(record.begin(), record.end()) {
    // A list of texts ends with two.
    bytes_.resize(record.size() + 2);
  }
  RecordCopy(const RecordCopy&) = delete;
  RecordCopy& operator=(const RecordCopy&) = delete;
  /// It may have held a password.
  ~RecordCopy() { ::SecureZeroMemory(bytes_.data(), bytes_.size()); }

  std::span<std::uint8_t> Bytes() { return std::span(bytes_).first(bytes_.size() - 2); }
  template <typename Record> Record* As() { return reinterpret_cast<Record*>(bytes_.data()); }

 private:
  std::vector<std::uint8_t> bytes_;
};

/// Lets a listing call of the system fill a buffer. For an empty one it gets a lone record of this size and
/// no room, so that what is needed is told in records of a size that the program knows.
template <typename Record, typename Call>
std::uint32_t FillList(std::span<std::uint8_t> buffer, std::uint32_t& bytes, std::uint32_t& count,
                       std::uint32_t recordBytes, Call call) {
  count = 0;
  std::vector<std::uint8_t> lone(recordBytes);
  PutLittle32(lone, 0, recordBytes);
  if (!buffer.empty() && buffer.size() < 4) return kRasInvalidSize;
  auto room = static_cast<DWORD>(std::min<std::size_t>(bytes, buffer.size()));
  DWORD records = 0;
  auto* const first = reinterpret_cast<Record*>(buffer.empty() ? lone.data() : buffer.data());
  const std::uint32_t result = call(first, &room, &records);
  bytes = room;
  count = records;
  return result;
}

} // namespace quendra::platform::windows
