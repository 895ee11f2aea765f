#pragma once

#include "platform/remote_access/RemoteAccessNumbers.h"
#include "runtime/ByteFields.h"

#include <algorithm>
#include <functional>
#include <span>

namespace quendra::platform {

/// A buffer that a listing call fills with records of one size.
struct RecordList {
  std::span<std::uint8_t> buffer;
  std::uint32_t& bytes; ///< what the caller says that the buffer holds, afterwards what is needed
  std::uint32_t& count;

  /// What the first word of the buffer says that a record holds; nothing says 0.
  std::uint32_t StatedSize() const { return buffer.size() < 4 ? 0 : Little32(buffer, 0); }
  /// A buffer may be empty, to ask for the size.
  bool States(std::uint32_t recordBytes) const { return buffer.empty() || StatedSize() == recordBytes; }

  /// Lets `put` fill each cleared record behind its size. The records are counted also where they have no
  /// room.
  std::uint32_t Fill(std::uint32_t recordBytes, std::size_t records,
                     const std::function<void(std::size_t, std::span<std::uint8_t>)>& put) {
    const std::size_t room = std::min<std::size_t>(bytes, buffer.size());
    count = static_cast<std::uint32_t>(records);
    bytes = count * recordBytes;
    if (room < bytes) return kRasBufferTooSmall;
    for (std::size_t i = 0; i < records; ++i) {
      const auto record = buffer.subspan(i * recordBytes, recordBytes);
      std::ranges::fill(record, std::uint8_t{0});
      PutLittle32(record, 0, recordBytes);
      put(i, record);
    }
    return kRasSuccess;
  }
};

} // namespace quendra::platform
