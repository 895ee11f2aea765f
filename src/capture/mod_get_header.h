#pragma once

#include "platform/capture/FrameBytes.h"
#include "runtime/Text.h"

#include <array>

/// Reads the headers that stand before the packet in a capture record.
namespace quendra::capture::mod_get_header {

/// The record's own header, low byte first.
struct CaptureRecordHeader {
  std::uint32_t seconds = 0;
  std::uint32_t microseconds = 0;
  std::uint32_t capturedLength = 0;
  std::uint32_t lengthOnWire = 0;
  std::uint16_t headerLength = 0; ///< where the frame begins in the record
};

/// Three texts of colon-separated hexadecimal. They are built when asked for: the pre-reader runs with each
/// event and nobody reads them there.
struct EthernetHeader {
  std::array<std::uint8_t, 6> source{};
  std::array<std::uint8_t, 6> destination{};
  std::array<std::uint8_t, 2> type{};

  Text Source() const;
  Text Destination() const;
  Text Type() const;
};

/// Fault 9 for an array that ends within the header, here and below.
CaptureRecordHeader ReadCaptureHeader(const platform::FrameBytes& record);

/// Reads destination, source and type at `index` and moves it on by their 14 bytes.
EthernetHeader ReadEthernetHeader(const platform::FrameBytes& record, std::int32_t& index);

} // namespace quendra::capture::mod_get_header
