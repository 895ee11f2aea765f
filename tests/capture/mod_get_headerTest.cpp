#include "capture/mod_get_header.h"
#include "capture/mod_get_proto.h"

#include "capture/TestFrames.h"

#include <bit>
#include <gtest/gtest.h>

namespace quendra::capture {
namespace {

/// A record with a header of `headerLength` bytes and the frame after it.
Bytes RecordOf(const Bytes& frame, std::uint16_t headerLength) {
  Bytes record{0x78, 0x56, 0x34, 0x12, 0x40, 0xE2, 0x01, 0x00, 60, 0, 0, 0, 0xEA, 0x05, 0, 0};
  record.resize(std::max<std::size_t>(headerLength, 18));
  PutLittle16(record, 16, headerLength);
  record.resize(headerLength);
  record.insert(record.end(), frame.begin(), frame.end());
  return record;
}

Bytes FrameWithMacs() {
  Bytes frame = TestFrame{}.Build();
  for (std::uint8_t i = 0; i < 12; ++i) frame[i] = static_cast<std::uint8_t>(0xA0 + i);
  return frame;
}

TEST(ReadCaptureHeader, Reads_five_values_in_host_order) {
  const auto header = mod_get_header::ReadCaptureHeader(FrameOf(RecordOf({}, 20)));
  EXPECT_EQ(header.seconds, 0x12345678u);
  EXPECT_EQ(header.microseconds, 123456u);
  EXPECT_EQ(header.capturedLength, 60u);
  EXPECT_EQ(header.lengthOnWire, 1514u);
  EXPECT_EQ(header.headerLength, 20);
}

TEST(ReadCaptureHeader, Takes_the_header_length_without_a_sign) {
  EXPECT_EQ(mod_get_header::ReadCaptureHeader(FrameOf(RecordOf({}, 0xFFFE))).headerLength, 65534);
}

TEST(ReadEthernetHeader, Reads_source_destination_and_type_as_hexadecimal) {
  const Bytes record = RecordOf(FrameWithMacs(), 20);
  std::int32_t index = 20;
  const auto header = mod_get_header::ReadEthernetHeader(FrameOf(record), index);
  EXPECT_EQ(header.Destination(), u"A0:A1:A2:A3:A4:A5");
  EXPECT_EQ(header.Source(), u"A6:A7:A8:A9:AA:AB");
  EXPECT_EQ(header.Type(), u"08:00");
}

TEST(ReadEthernetHeader, Moves_the_index_on_by_14) {
  const Bytes record = RecordOf(FrameWithMacs(), 18);
  std::int32_t index = 18;
  mod_get_header::ReadEthernetHeader(FrameOf(record), index);
  EXPECT_EQ(index, 32);
}

TEST(ReadEthernetHeader, Keeps_its_texts_when_the_record_is_gone) {
  auto record = std::make_unique<Bytes>(RecordOf(FrameWithMacs(), 18));
  std::int32_t index = 18;
  const auto header = mod_get_header::ReadEthernetHeader(FrameOf(*record), index);
  record.reset();
  EXPECT_EQ(header.Source(), u"A6:A7:A8:A9:AA:AB");
}

TEST(ReadEthernetHeader, Raises_fault_9_where_the_record_ends_within_it) {
  const Bytes record(33);
  std::int32_t index = 20;
  EXPECT_THROW(mod_get_header::ReadEthernetHeader(FrameOf(record), index), Fault);
}

Bytes IpHeaderBytes() {
  return {0x46, 0x10, 0x05, 0xDC, 0x12, 0x34, 0x40, 0x00, 0x80, 0x06,
          0x00, 0x00, 10,   0,    0,    138,  192,  0,    2,    80};
}

TEST(ReadIpHeader, Reads_each_field_from_its_place) {
  const Bytes bytes = IpHeaderBytes();
  const auto header = mod_get_proto::ReadIpHeader(FrameOf(bytes), 0);
  EXPECT_EQ(header.version, 4);
  EXPECT_EQ(header.headerLength, 6);
  EXPECT_EQ(header.typeOfService, 0x10);
  EXPECT_EQ(header.timeToLive, 0x80);
  EXPECT_EQ(header.protocol, 6);
  EXPECT_EQ(header.source, std::bit_cast<std::uint32_t>(std::array<std::uint8_t, 4>{10, 0, 0, 138}));
  EXPECT_EQ(header.destination, std::bit_cast<std::uint32_t>(std::array<std::uint8_t, 4>{192, 0, 2, 80}));
}

TEST(ReadIpHeader, Takes_one_byte_for_the_total_length_the_high_one_when_it_is_not_0) {
  Bytes bytes = IpHeaderBytes();
  EXPECT_EQ(mod_get_proto::ReadIpHeader(FrameOf(bytes), 0).totalLength, 0x05);
  bytes[2] = 0;
  EXPECT_EQ(mod_get_proto::ReadIpHeader(FrameOf(bytes), 0).totalLength, 0xDC);
}

TEST(ReadIpHeader, Leaves_the_identification_as_its_bytes_lie_in_memory) {
  const Bytes bytes = IpHeaderBytes();
  EXPECT_EQ(mod_get_proto::ReadIpHeader(FrameOf(bytes), 0).identification, 0x3412);
}

TEST(ReadIpHeader, Fills_a_record_of_20_bytes) { EXPECT_EQ(sizeof(mod_get_proto::IpHeader), 20u); }

TEST(ReadIpHeader, Raises_fault_9_where_the_record_ends_within_it) {
  Bytes bytes = IpHeaderBytes();
  bytes.pop_back();
  EXPECT_THROW(mod_get_proto::ReadIpHeader(FrameOf(bytes), 0), Fault);
}

} // namespace
} // namespace quendra::capture
