#include "capture/clsTCP.h"

#include "capture/TestFrames.h"

#include <gtest/gtest.h>

namespace quendra::capture {
namespace {

Bytes FullTcpFrame() {
  TestFrame parts;
  parts.sourcePort = 443;
  parts.destinationPort = 50000;
  Bytes frame = parts.Build();
  PutBig16(frame, 38, 0xFFFE);
  PutBig16(frame, 40, 0x8001);
  PutBig16(frame, 42, 0x0001);
  PutBig16(frame, 44, 0xFFFF);
  frame[46] = 0x5F;
  frame[47] = 0x12;
  PutBig16(frame, 48, 0xFFFF);
  PutBig16(frame, 50, 0x1234);
  PutBig16(frame, 52, 0x0007);
  return frame;
}

clsTCP DecodedTcp(const Bytes& frame, bool tunnelled = false, std::int32_t hint = 0) {
  clsTCP tcp;
  tcp.Decode(FrameOf(frame), hint, tunnelled);
  return tcp;
}

TEST(clsTCP, Has_protocol_number_6_from_creation_on) {
  EXPECT_EQ(clsTCP().Protocol(), 6);
  TestFrame parts;
  parts.protocol = 17;
  EXPECT_EQ(DecodedTcp(parts.Build()).Protocol(), 6);
}

TEST(clsTCP, The_protocol_number_can_be_written) {
  clsTCP tcp;
  tcp.Protocol(17);
  EXPECT_EQ(tcp.Protocol(), 17);
}

TEST(clsTCP, Starts_with_empty_texts_and_zeros) {
  const clsTCP tcp;
  EXPECT_EQ(tcp.srcPort(), u"0");
  EXPECT_EQ(tcp.dstPort(), u"0");
  EXPECT_EQ(tcp.seqNumber(), 0);
  EXPECT_EQ(tcp.flagString(), u"");
}

TEST(clsTCP, From_port_443_to_port_50000_the_texts_are_443_and_minus_15536) {
  const clsTCP tcp = DecodedTcp(FullTcpFrame());
  EXPECT_EQ(tcp.srcPort(), u"443");
  EXPECT_EQ(tcp.dstPort(), u"-15536");
  EXPECT_EQ(tcp.DestinationPort(), -15536);
}

TEST(clsTCP, Reads_numbers_flags_window_and_urgent_pointer) {
  const clsTCP tcp = DecodedTcp(FullTcpFrame());
  EXPECT_EQ(static_cast<std::uint32_t>(tcp.seqNumber()), 0xFFFE8001u);
  EXPECT_EQ(tcp.ackNumber(), 0x0001FFFF);
  EXPECT_EQ(tcp.HLEN(), 5);
  EXPECT_EQ(tcp.flags(), 0x12);
  EXPECT_EQ(tcp.window(), -1);
  EXPECT_EQ(tcp.UrgentPointer(), 7);
}

TEST(clsTCP, Four_fields_are_never_written) {
  const clsTCP tcp = DecodedTcp(FullTcpFrame());
  EXPECT_EQ(tcp.HD_Checksum(), 0);
  EXPECT_EQ(tcp.dataoffset(), 0);
  EXPECT_EQ(tcp.Reserved(), 0);
  EXPECT_EQ(tcp.OptPad(), 0);
}

TEST(clsTCP, The_length_hint_is_ignored) {
  EXPECT_EQ(DecodedTcp(FullTcpFrame(), false, 4).srcPort(), DecodedTcp(FullTcpFrame(), false, -1).srcPort());
}

TEST(clsTCP, A_pure_ACK_reads_ACK) {
  Bytes frame = FullTcpFrame();
  frame[47] = 0x10;
  EXPECT_EQ(DecodedTcp(frame).flagString(), u"ACK;");
}

TEST(clsTCP, SYN_stands_before_ACK) { EXPECT_EQ(DecodedTcp(FullTcpFrame()).flagString(), u"SYN;ACK;"); }

TEST(clsTCP, A_segment_without_the_six_flags_reads_the_empty_text) {
  Bytes frame = FullTcpFrame();
  frame[47] = 0xC0;
  EXPECT_EQ(DecodedTcp(frame).flagString(), u"");
}

TEST(clsTCP, All_six_flags_have_a_text_in_the_order_of_their_bits) {
  Bytes frame = FullTcpFrame();
  frame[47] = 0xFF;
  EXPECT_EQ(DecodedTcp(frame).flagString(), u"FIN;SYN;RESET;PUSH;ACK;URGENT;");
}

TEST(clsTCP, The_flag_text_is_cleared_with_each_frame) {
  clsTCP tcp = DecodedTcp(FullTcpFrame());
  Bytes frame = FullTcpFrame();
  frame[47] = 0x01;
  tcp.Decode(FrameOf(frame), 0, false);
  EXPECT_EQ(tcp.flagString(), u"FIN;");
}

Bytes TunnelledFrame(std::size_t size) {
  TestFrame parts;
  parts.size = size;
  Bytes frame = parts.BuildTunnelled();
  PutBig16(frame, 34, 7);
  PutBig16(frame, 36, 8);
  return frame;
}

TEST(clsTCP, A_tunnelled_frame_with_an_upper_bound_of_94_is_read_40_bytes_further_on) {
  const clsTCP tcp = DecodedTcp(TunnelledFrame(95), true);
  EXPECT_EQ(tcp.srcPort(), u"1025");
  EXPECT_EQ(tcp.dstPort(), u"80");
}

TEST(clsTCP, A_tunnelled_frame_with_an_upper_bound_below_94_is_read_at_0) {
  const clsTCP tcp = DecodedTcp(TunnelledFrame(94), true);
  EXPECT_EQ(tcp.srcPort(), u"7");
  EXPECT_EQ(tcp.dstPort(), u"8");
}

TEST(clsTCP, Without_the_tunnel_flag_a_long_frame_is_read_at_0) {
  EXPECT_EQ(DecodedTcp(TunnelledFrame(200), false).srcPort(), u"7");
}

TEST(clsTCP, A_frame_of_54_bytes_is_read_whole_and_one_of_53_raises_fault_9) {
  Bytes frame = FullTcpFrame();
  frame.resize(54);
  EXPECT_EQ(DecodedTcp(frame).UrgentPointer(), 7);
  frame.resize(53);
  EXPECT_THROW(DecodedTcp(frame), Fault);
}

TEST(clsTCP, A_fault_in_the_middle_leaves_new_fields_before_it_and_old_ones_behind) {
  clsTCP tcp = DecodedTcp(FullTcpFrame());
  Bytes frame = FullTcpFrame();
  PutBig16(frame, 34, 99);
  frame[47] = 0x01;
  PutBig16(frame, 48, 5);
  frame.resize(51);
  EXPECT_THROW(tcp.Decode(FrameOf(frame), 0, false), Fault);
  EXPECT_EQ(tcp.srcPort(), u"99");
  EXPECT_EQ(tcp.flags(), 0x01);
  EXPECT_EQ(tcp.window(), 5);
  EXPECT_EQ(tcp.UrgentPointer(), 7);
  EXPECT_EQ(tcp.flagString(), u"SYN;ACK;");
}

} // namespace
} // namespace quendra::capture
