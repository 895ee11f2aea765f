#include "capture/clsEthernet.h"

#include "capture/TestFrames.h"

#include <gtest/gtest.h>

namespace quendra::capture {
namespace {

/// Bytes 0 to 11 count up from A0; the type code and the three bytes after it are the test's.
Bytes LinkFrame(unsigned type, std::size_t size = 60, Bytes behind = {}) {
  Bytes frame(size);
  for (std::size_t i = 0; i < 12; ++i) frame[i] = static_cast<std::uint8_t>(0xA0 + i);
  PutBig16(frame, 12, type);
  std::copy(behind.begin(), behind.end(), frame.begin() + 14);
  return frame;
}

clsEthernet Decoded(const Bytes& frame) {
  clsEthernet ethernet;
  ethernet.Decode(FrameOf(frame));
  return ethernet;
}

TEST(clsEthernet, Starts_with_empty_texts_and_zeros) {
  const clsEthernet ethernet;
  EXPECT_EQ(ethernet.DestinationMAC(), u"");
  EXPECT_EQ(ethernet.SourceMAC(), u"");
  EXPECT_EQ(ethernet.TypeCode(), u"0");
  EXPECT_EQ(ethernet.TypeCodeString(), u"");
  EXPECT_EQ(ethernet.LastByte(), 0);
}

TEST(clsEthernet, A_frame_of_22_bytes_leaves_every_field_unchanged) {
  clsEthernet ethernet = Decoded(LinkFrame(0x0806));
  ethernet.Decode(FrameOf(Bytes(22, 0xFF)));
  EXPECT_EQ(ethernet.DestinationMAC(), u"A0:A1:A2:A3:A4:A5");
  EXPECT_EQ(ethernet.SourceMAC(), u"A6:A7:A8:A9:AA:AB");
  EXPECT_EQ(ethernet.TypeCode(), u"2054");
  EXPECT_EQ(ethernet.TypeCodeString(), u"[Arp]");
  EXPECT_EQ(ethernet.LastByte(), 13);
}

TEST(clsEthernet, A_fresh_array_of_two_bytes_leaves_every_field_unchanged) {
  clsEthernet ethernet;
  ethernet.Decode(platform::FrameBytes());
  EXPECT_EQ(ethernet.DestinationMAC(), u"");
  EXPECT_EQ(ethernet.TypeCode(), u"0");
}

TEST(clsEthernet, A_frame_of_23_bytes_decodes_the_addresses_and_the_type_code) {
  const clsEthernet ethernet = Decoded(LinkFrame(0x0800, 23));
  EXPECT_EQ(ethernet.DestinationMAC(), u"A0:A1:A2:A3:A4:A5");
  EXPECT_EQ(ethernet.SourceMAC(), u"A6:A7:A8:A9:AA:AB");
  EXPECT_EQ(ethernet.TypeCode(), u"2048");
}

TEST(clsEthernet, Type_0800_reads_2048_and_is_labelled_IPv4) {
  const clsEthernet ethernet = Decoded(LinkFrame(0x0800));
  EXPECT_EQ(ethernet.TypeCode(), u"2048");
  EXPECT_EQ(ethernet.TypeCodeString(), u"[IPv4]");
  EXPECT_EQ(ethernet.LastByte(), 13);
}

TEST(clsEthernet, Type_86DD_reads_as_a_negative_text_and_is_labelled_as_802_3) {
  const clsEthernet ethernet = Decoded(LinkFrame(0x86DD, 60, {1, 2, 3}));
  EXPECT_EQ(ethernet.TypeCode(), u"-31011");
  EXPECT_EQ(ethernet.TypeCodeString(), u"[Ethernet IEEE 802.3]");
  EXPECT_EQ(ethernet.LastByte(), 21);
}

TEST(clsEthernet, Codes_with_bit_15_never_reach_their_labels) {
  for (const unsigned code : {0x8035u, 0x8137u, 0x86DDu, 0x8037u, 0x809Bu, 0x814Cu})
    EXPECT_EQ(Decoded(LinkFrame(code, 60, {1, 2, 3})).TypeCodeString(), u"[Ethernet IEEE 802.3]") << code;
}

TEST(clsEthernet, Code_1500_takes_the_802_3_branch) {
  const clsEthernet ethernet = Decoded(LinkFrame(1500, 60, {1, 2, 3}));
  EXPECT_EQ(ethernet.TypeCodeString(), u"[Ethernet IEEE 802.3]");
  EXPECT_EQ(ethernet.LastByte(), 21);
}

TEST(clsEthernet, Code_1501_is_an_unknown_type_in_hexadecimal) {
  const clsEthernet ethernet = Decoded(LinkFrame(1501));
  EXPECT_EQ(ethernet.TypeCodeString(), u" Unknown ->TypeCode: 5DD");
  EXPECT_EQ(ethernet.LastByte(), 13);
}

TEST(clsEthernet, Equal_FF_bytes_behind_a_length_are_raw_IPX) {
  EXPECT_EQ(Decoded(LinkFrame(100, 60, {0xFF, 0xFF, 3})).TypeCodeString(),
            u"[Ethernet IEEE 802.3] [IPX RAW 802.3 Encapsulation]");
}

TEST(clsEthernet, Equal_F0_bytes_behind_a_length_are_NETBIOS) {
  EXPECT_EQ(Decoded(LinkFrame(100, 60, {0xF0, 0xF0, 3})).TypeCodeString(),
            u"[Ethernet IEEE 802.3] [NETBIOS LLC Encapsulation]");
}

TEST(clsEthernet, Other_equal_bytes_and_unequal_ones_leave_the_plain_label) {
  EXPECT_EQ(Decoded(LinkFrame(100, 60, {0x42, 0x42, 3})).TypeCodeString(), u"[Ethernet IEEE 802.3]");
  EXPECT_EQ(Decoded(LinkFrame(100, 60, {0xF0, 0xFF, 3})).TypeCodeString(), u"[Ethernet IEEE 802.3]");
}

TEST(clsEthernet, The_label_is_never_empty_behind_the_length_test) {
  for (unsigned type = 0; type < 0x10000; type += 251)
    EXPECT_NE(Decoded(LinkFrame(type, 23)).TypeCodeString(), u"") << type;
}

TEST(clsEthernet, Start_moves_the_addresses_and_not_the_type_code) {
  clsEthernet ethernet;
  ethernet.start(1);
  ethernet.Decode(FrameOf(LinkFrame(0x0800)));
  EXPECT_EQ(ethernet.DestinationMAC(), u"A1:A2:A3:A4:A5:A6");
  EXPECT_EQ(ethernet.SourceMAC(), u"A7:A8:A9:AA:AB:08");
  EXPECT_EQ(ethernet.TypeCode(), u"2048");
}

TEST(clsEthernet, Addresses_that_start_moves_beyond_the_frame_read_0) {
  clsEthernet ethernet;
  ethernet.start(15);
  ethernet.Decode(FrameOf(LinkFrame(0x0800, 23)));
  EXPECT_EQ(ethernet.DestinationMAC(), u"00:00:00:00:00:00");
  EXPECT_EQ(ethernet.SourceMAC(), u"0");
  ethernet.start(-1);
  ethernet.Decode(FrameOf(LinkFrame(0x0800, 23)));
  EXPECT_EQ(ethernet.DestinationMAC(), u"0");
}

TEST(clsEthernet, Texts_hold_when_the_frame_is_gone) {
  auto frame = std::make_unique<Bytes>(LinkFrame(100, 60, {0xFF, 0xFF, 3}));
  const clsEthernet ethernet = Decoded(*frame);
  frame.reset();
  EXPECT_EQ(ethernet.DestinationMAC(), u"A0:A1:A2:A3:A4:A5");
  EXPECT_EQ(ethernet.TypeCodeString(), u"[Ethernet IEEE 802.3] [IPX RAW 802.3 Encapsulation]");
}

} // namespace
} // namespace quendra::capture
