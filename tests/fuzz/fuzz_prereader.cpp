// Any bytes as the newest capture record, with whatever header length they state.

#include "capture/mod_get_header.h"
#include "capture/mod_get_proto.h"
#include "runtime/ByteFields.h"

#include <algorithm>
#include <cstdlib>

namespace {

using namespace quendra;
using namespace quendra::capture;

void Require(bool holds) {
  if (!holds) std::abort();
}

void ReadRecord(const platform::FrameBytes& record) {
  const auto header = mod_get_header::ReadCaptureHeader(record);
  std::int32_t index = header.headerLength;
  const auto link = mod_get_header::ReadEthernetHeader(record, index);
  Require(index == header.headerLength + 14);
  Require(link.Source().size() == 17 && link.Destination().size() == 17 && link.Type().size() == 5);
  const auto ip = mod_get_proto::ReadIpHeader(record, index);
  Require(ip.version <= 15 && ip.headerLength <= 15 && ip.totalLength >= 0 && ip.totalLength <= 255);
  Require(record[index + 9] == ip.protocol);
}

/// The one fault that a record may raise is that of a missing byte, and only where the buffer ends.
void ReadHostileRecord(const platform::FrameBytes& record) {
  try {
    ReadRecord(record);
  } catch (const Fault& fault) {
    Require(fault.number == Fault::kSubscript);
    const int stated = record.UpperBound() < 17 ? 0 : Little16({record.Data(), 18}, 16);
    Require(stated + 14 + 19 > record.UpperBound());
  }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  // As the event reads it: the record over the start of a fixed buffer of zeros.
  static std::uint8_t PeekBytes[15001];
  std::fill(std::begin(PeekBytes), std::end(PeekBytes), std::uint8_t{0});
  std::copy_n(data, std::min(size, sizeof PeekBytes), PeekBytes);
  ReadHostileRecord(platform::FrameBytes(PeekBytes, sizeof PeekBytes));
  // And without the room after it.
  ReadHostileRecord(platform::FrameBytes(data, static_cast<int>(size)));
  return 0;
}
