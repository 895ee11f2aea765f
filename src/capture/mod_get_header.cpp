#include "capture/mod_get_header.h"

#include "capture/mod_functions.h"
#include "platform/capture/CaptureRecordHeader.h"

namespace quendra::capture::mod_get_header {

namespace {

template <std::size_t size> Text HexOf(const std::array<std::uint8_t, size>& bytes) {
  const int count = static_cast<int>(size);
  return mod_functions::HexRun(platform::FrameBytes(bytes.data(), count), 0, count - 1);
}

template <std::size_t size>
void CopyRun(const platform::FrameBytes& record, std::int32_t index, std::array<std::uint8_t, size>& target) {
  for (std::uint8_t& byte : target) byte = record[index++];
}

} // namespace

Text EthernetHeader::Source() const { return HexOf(source); }
Text EthernetHeader::Destination() const { return HexOf(destination); }
Text EthernetHeader::Type() const { return HexOf(type); }

CaptureRecordHeader ReadCaptureHeader(const platform::FrameBytes& record) {
  namespace capture_record = platform::capture_record;
  CaptureRecordHeader header;
  header.seconds = mod_functions::ReadBytes(record, capture_record::kSeconds, 4);
  header.microseconds = mod_functions::ReadBytes(record, capture_record::kMicroseconds, 4);
  header.capturedLength = mod_functions::ReadBytes(record, capture_record::kCapturedLength, 4);
  header.lengthOnWire = mod_functions::ReadBytes(record, capture_record::kLengthOnWire, 4);
  header.headerLength =
      static_cast<std::uint16_t>(mod_functions::ReadBytes(record, capture_record::kHeaderLength, 2));
  return header;
}

EthernetHeader ReadEthernetHeader(const platform::FrameBytes& record, std::int32_t& index) {
  EthernetHeader header;
  CopyRun(record, index, header.destination);
  CopyRun(record, index + 6, header.source);
  CopyRun(record, index + 12, header.type);
  index += 14;
  return header;
}

} // namespace quendra::capture::mod_get_header
