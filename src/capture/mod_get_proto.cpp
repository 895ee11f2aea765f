#include "capture/mod_get_proto.h"

#include "capture/modVBPcap.h"
#include "capture/mod_functions.h"

namespace quendra::capture::mod_get_proto {

IpHeader ReadIpHeader(const platform::FrameBytes& record, std::int32_t index) {
  IpHeader header;
  header.version = record[index] >> 4;
  header.headerLength = record[index] & 15;
  header.typeOfService = record[index + 1];
  header.totalLength = record[index + 2] != 0 ? record[index + 2] : record[index + 3];
  header.identification = modVBPcap::WordFromLowHigh(record[index + 4], record[index + 5]);
  header.timeToLive = record[index + 8];
  header.protocol = record[index + 9];
  header.source = mod_functions::ReadBytes(record, index + 12, 4);
  header.destination = mod_functions::ReadBytes(record, index + 16, 4);
  return header;
}

} // namespace quendra::capture::mod_get_proto
