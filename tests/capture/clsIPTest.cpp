#include "capture/clsIP.h"

#include "capture/TestFrames.h"

#include <gtest/gtest.h>

namespace quendra::capture {
namespace {

Bytes FullFrame() {
  TestFrame parts;
  parts.totalLength = 1500;
  Bytes frame = parts.Build();
  PutBig16(frame, 20, 0x6123);
  PutBig16(frame, 24, 0x0A0B);
  return frame;
}

int FaultOf(clsIP& ip, const Bytes& frame) {
  try {
    ip.Decode(FrameOf(frame));
    return 0;
  } catch (const Fault& fault) {
    return fault.number;
  }
}

TEST(clsIP, Starts_with_empty_texts_and_zeros) {
  const clsIP ip;
  EXPECT_EQ(ip.Ver(), 0);
  EXPECT_EQ(ip.IHL(), 0);
  EXPECT_EQ(ip.TotalLength(), 0);
  EXPECT_EQ(ip.Identification(), 0);
  EXPECT_EQ(ip.FragmentOffset(), 0);
  EXPECT_EQ(ip.TTL(), 0);
  EXPECT_EQ(ip.Protocol(), 0);
  EXPECT_EQ(ip.sProtocol(), u"");
  EXPECT_EQ(ip.HD_Cheksum(), u"");
  EXPECT_EQ(ip.SrcIP(), u"");
  EXPECT_EQ(ip.DestIP(), u"");
  EXPECT_EQ(ip.Options(), 0);
}

TEST(clsIP, Reads_each_field_from_its_place) {
  clsIP ip;
  ip.Decode(FrameOf(FullFrame()));
  EXPECT_EQ(ip.Ver(), 4);
  EXPECT_EQ(ip.IHL(), 5);
  EXPECT_EQ(ip.TotalLength(), 1500);
  EXPECT_EQ(ip.FragmentOffset(), 0x0123);
  EXPECT_EQ(ip.TTL(), 64);
  EXPECT_EQ(ip.Protocol(), 6);
  EXPECT_EQ(ip.HD_Cheksum(), u"A0B");
  EXPECT_EQ(ip.DestIP(), u"192.0.2.80");
  EXPECT_EQ(ip.Options(), 0);
}

TEST(clsIP, Decode_has_an_empty_result) {
  clsIP ip;
  EXPECT_EQ(ip.Decode(FrameOf(FullFrame())), u"");
}

TEST(clsIP, An_address_reads_without_leading_zeros) {
  clsIP ip;
  ip.Decode(FrameOf(FullFrame()));
  EXPECT_EQ(ip.SrcIP(), u"10.0.0.138");
}

TEST(clsIP, The_header_length_plays_no_part) {
  clsIP ip;
  Bytes frame = FullFrame();
  frame[14] = 0x4F;
  ip.Decode(FrameOf(frame));
  EXPECT_EQ(ip.IHL(), 15);
  EXPECT_EQ(ip.SrcIP(), u"10.0.0.138");
}

TEST(clsIP, Identification_of_any_untunnelled_frame_is_4627) {
  clsIP ip;
  Bytes frame = FullFrame();
  PutBig16(frame, 18, 0xBEEF);
  ip.Decode(FrameOf(frame));
  EXPECT_EQ(ip.Identification(), 4627);
}

TEST(clsIP, Identification_of_any_tunnelled_frame_is_14907) {
  clsIP ip;
  TestFrame parts;
  parts.size = 100;
  ip.Decode(FrameOf(parts.BuildTunnelled()));
  EXPECT_EQ(ip.Identification(), 14907);
}

TEST(clsIP, A_total_length_of_32768_and_above_is_negative) {
  clsIP ip;
  TestFrame parts;
  parts.totalLength = 65535;
  ip.Decode(FrameOf(parts.Build()));
  EXPECT_EQ(ip.TotalLength(), -1);
}

TEST(clsIP, The_checksum_is_hexadecimal_without_leading_zeros_and_without_a_sign) {
  clsIP ip;
  Bytes frame = FullFrame();
  PutBig16(frame, 24, 0xFFFE);
  ip.Decode(FrameOf(frame));
  EXPECT_EQ(ip.HD_Cheksum(), u"FFFE");
  PutBig16(frame, 24, 0);
  ip.Decode(FrameOf(frame));
  EXPECT_EQ(ip.HD_Cheksum(), u"0");
}

TEST(clsIP, Names_three_protocols_and_calls_any_other_unknown) {
  const std::pair<int, const char16_t*> names[] = {
      {1, u"ICMP"}, {6, u"TCP"}, {17, u"UDP"}, {0, u"UNKNOWN"}, {255, u"UNKNOWN"}};
  for (const auto& [number, name] : names) {
    clsIP ip;
    TestFrame parts;
    parts.protocol = number;
    ip.Decode(FrameOf(parts.Build()));
    EXPECT_EQ(ip.sProtocol(), name) << number;
  }
}

TEST(clsIP, Byte_23_of_47_reads_every_field_40_bytes_further_on) {
  clsIP ip;
  TestFrame parts;
  parts.protocol = 17;
  parts.size = 74;
  parts.totalLength = 77;
  parts.destinationPort = parts.sourcePort = 0;
  Bytes frame(78);
  PutBig16(frame, 12, 0x0800);
  frame[23] = 47;
  parts.PutPacket(frame, 54);
  frame.resize(74);
  ip.Decode(FrameOf(frame));
  EXPECT_EQ(ip.Protocol(), 17);
  EXPECT_EQ(ip.sProtocol(), u"UDP");
  EXPECT_EQ(ip.TotalLength(), 77);
  EXPECT_EQ(ip.SrcIP(), u"10.0.0.138");
  EXPECT_EQ(ip.DestIP(), u"192.0.2.80");
}

TEST(clsIP, The_tunnel_rule_applies_to_byte_23_also_when_the_frame_is_not_IPv4) {
  clsIP ip;
  TestFrame parts;
  parts.type = 0x0806;
  parts.size = 100;
  ip.Decode(FrameOf(parts.BuildTunnelled()));
  EXPECT_EQ(ip.Protocol(), 6);
  EXPECT_EQ(ip.Identification(), 14907);
}

TEST(clsIP, An_ordinary_frame_is_read_up_to_index_33) {
  clsIP ip;
  Bytes frame = FullFrame();
  frame.resize(34);
  EXPECT_EQ(FaultOf(ip, frame), 0);
  frame.resize(33);
  EXPECT_EQ(FaultOf(ip, frame), Fault::kSubscript);
}

TEST(clsIP, A_tunnelled_frame_is_read_up_to_index_73) {
  clsIP ip;
  TestFrame parts;
  parts.size = 100;
  Bytes frame = parts.BuildTunnelled();
  frame.resize(74);
  EXPECT_EQ(FaultOf(ip, frame), 0);
  frame.resize(73);
  EXPECT_EQ(FaultOf(ip, frame), Fault::kSubscript);
}

TEST(clsIP, A_minimum_frame_with_byte_23_of_47_raises_fault_9) {
  clsIP ip;
  Bytes frame = FullFrame();
  frame[23] = 47;
  EXPECT_EQ(FaultOf(ip, frame), Fault::kSubscript);
}

TEST(clsIP, A_frame_that_ends_before_byte_23_changes_nothing) {
  clsIP ip;
  ip.Decode(FrameOf(FullFrame()));
  EXPECT_EQ(FaultOf(ip, Bytes(23, 0x11)), Fault::kSubscript);
  EXPECT_EQ(ip.TTL(), 64);
  EXPECT_EQ(ip.Ver(), 4);
}

TEST(clsIP, A_fault_in_the_middle_leaves_new_fields_before_it_and_old_ones_behind) {
  clsIP ip;
  ip.Decode(FrameOf(FullFrame()));
  TestFrame parts;
  parts.totalLength = 99;
  parts.protocol = 17;
  parts.source = "1.2.3.4";
  Bytes frame = parts.Build();
  PutBig16(frame, 24, 0x1111);
  frame.resize(25);
  EXPECT_EQ(FaultOf(ip, frame), Fault::kSubscript);
  EXPECT_EQ(ip.TotalLength(), 99);
  EXPECT_EQ(ip.sProtocol(), u"UDP");
  EXPECT_EQ(ip.HD_Cheksum(), u"A0B");
  EXPECT_EQ(ip.SrcIP(), u"10.0.0.138");
}

TEST(clsIP, Texts_hold_when_the_frame_is_gone) {
  auto frame = std::make_unique<Bytes>(FullFrame());
  clsIP ip;
  ip.Decode(FrameOf(*frame));
  frame.reset();
  EXPECT_EQ(ip.SrcIP(), u"10.0.0.138");
  EXPECT_EQ(ip.HD_Cheksum(), u"A0B");
}

} // namespace
} // namespace quendra::capture
