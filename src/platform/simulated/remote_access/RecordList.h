#pragma once

#include "platform/remote_access/RemoteAccessNumbers.h"
#include "runtime/ByteFields.h"

#include <functional>
#include <span>

namespace quendra::platform::simulated {

/// A buffer that a listing call fills with records of one size.
struct RecordList {
  std::span<std::uint8_t> buffer;
  std::uint32_t& bytes; ///< what the caller says that the buffer holds, afterwards what is needed
  std::uint32_t& count;

  /// What the first word of the buffer says that a record holds; nothing says 0.
  std::uint32_t StatedSize() const { return buffer.size() < 4 ? 0 : Little32(buffer, 0); }

  /// Lets `put` write each record, in which the size stands already. The numbers of the records are told even
  /// when there isn't room for them.
  std::uint32_t Fill(std::uint32_t recordBytes, std::size_t records,
                     const std::function<void(std::size_t, std::span<std::uint8_t>)>& put) {
    const std::size_t room = std::min<std::size_t>(bytes, buffer.size());
    count = static_cast<std::uint32_t>(records);
    bytes = count * recordBytes;
    if (room < bytes) return kRasBufferTooSmall;
    for (std::size_t i = 0; i < records; ++i) {
      const auto record = buffer.subspan(i * recordBytes, recordBytes);
      PutLittle32(record, 0, recordBytes);
      put(i, record);
    }
    return kRasSuccess;
  }
};

} // namespace quendra::platform::simulated
