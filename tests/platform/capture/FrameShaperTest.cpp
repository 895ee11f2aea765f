#include "platform/capture/FrameShaper.h"

#include "integration/Packets.h"

#include <gtest/gtest.h>

namespace quendra::platform {

using integration::Bytes;
using integration::EthernetFrame;
using integration::Ipv4Packet;
using integration::Joined;
using integration::TcpFrame;

namespace {

class PcapFrameShaperTest : public testing::Test {
 protected:
  void Deliver(const Bytes& packet, std::uint32_t wire = 0) {
    shaper.Deliver({7, 8}, packet, wire != 0 ? wire : static_cast<std::uint32_t>(packet.size()));
  }
  Bytes Next() {
    const FrameRecord* record = queue.Pop();
    if (record == nullptr) return {};
    return {record->bytes.begin(), record->bytes.begin() + record->captured};
  }
  /// The total lengths of all frames that wait.
  std::vector<unsigned> TotalLengths() {
    std::vector<unsigned> lengths;
    for (Bytes frame = Next(); !frame.empty(); frame = Next()) lengths.push_back(Big16(frame, 16));
    return lengths;
  }

  FrameQueue queue;
  FrameShaper shaper{queue};
};

Bytes TruncatedTcp(unsigned total) {
  Bytes frame = TcpFrame(1025, 80, 100);
  PutBig16(frame, 16, total);
  return frame;
}

} // namespace

TEST_F(PcapFrameShaperTest, An_Ethernet_frame_stays_as_it_is) {
  const Bytes frame = TcpFrame(1025, 80, 80);
  Deliver(frame);
  EXPECT_EQ(Next(), frame);
  EXPECT_TRUE(queue.Empty());
}

TEST_F(PcapFrameShaperTest, A_record_tells_when_the_frame_came_and_how_long_it_was) {
  Deliver(TcpFrame(1025, 80, 80), 1514);
  const FrameRecord* record = queue.Newest();
  EXPECT_EQ(record->seconds, 7u);
  EXPECT_EQ(record->microseconds, 8u);
  EXPECT_EQ(record->captured, 94u);
  EXPECT_EQ(record->wire, 1514u);
}

TEST_F(PcapFrameShaperTest, A_frame_shorter_than_60_bytes_is_filled_with_zeros) {
  Bytes frame = TcpFrame(1025, 80, 40);
  Deliver(TcpFrame(1026, 81, 120));
  Deliver(frame);
  Next();
  frame.resize(60);
  EXPECT_EQ(Next(), frame);
}

TEST_F(PcapFrameShaperTest, A_frame_without_bytes_becomes_60_zero_bytes) {
  shaper.Deliver({}, {}, 0);
  EXPECT_EQ(Next(), Bytes(60));
}

TEST_F(PcapFrameShaperTest, A_frame_longer_than_its_record_is_cut) {
  Deliver(TcpFrame(1025, 80, 1000));
  EXPECT_EQ(Next().size(), FrameRecord::kRoom);
}

TEST_F(PcapFrameShaperTest, A_VLAN_tag_is_left_where_it_is) {
  const Bytes frame =
      EthernetFrame(Joined({0, 5, 8, 0}, Ipv4Packet(6, "1.2.3.4", 1, "5.6.7.8", 2, 60)), 0x8100);
  Deliver(frame);
  EXPECT_EQ(Next(), frame);
}

TEST_F(PcapFrameShaperTest, A_raw_IPv4_packet_gets_an_Ethernet_header) {
  const Bytes packet = Ipv4Packet(6, "1.2.3.4", 1025, "5.6.7.8", 80, 60);
  shaper.SetForm(LinkForm::RawIp);
  Deliver(packet);
  EXPECT_EQ(queue.Newest()->wire, 74u);
  EXPECT_EQ(Next(), Joined({0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 8, 0}, packet));
}

TEST_F(PcapFrameShaperTest, A_raw_IPv6_packet_gets_the_type_of_IPv6) {
  shaper.SetForm(LinkForm::RawIp);
  Deliver(Bytes(60, 0x60));
  const Bytes frame = Next();
  EXPECT_EQ(frame[12], 0x86);
  EXPECT_EQ(frame[13], 0xDD);
}

TEST_F(PcapFrameShaperTest, A_raw_packet_of_no_known_version_gets_the_type_0) {
  shaper.SetForm(LinkForm::RawIp);
  Deliver(Bytes(60, 0x10));
  const Bytes frame = Next();
  EXPECT_EQ(frame[12], 0);
  EXPECT_EQ(frame[13], 0);
}

TEST_F(PcapFrameShaperTest, Headers_of_other_links_give_way_to_an_Ethernet_header) {
  const Bytes packet = Ipv4Packet(6, "1.2.3.4", 1025, "5.6.7.8", 80, 60);
  const Bytes expected = Joined({0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 8, 0}, packet);
  Bytes cooked(16);
  PutBig16(cooked, 14, 0x0800);
  Bytes cooked2(20);
  PutBig16(cooked2, 0, 0x0800);
  const std::pair<LinkForm, Bytes> links[] = {
      {LinkForm::Family, {2, 0, 0, 0}},  {LinkForm::LinuxCooked, cooked},
      {LinkForm::LinuxCooked2, cooked2}, {LinkForm::Ppp, {0xFF, 0x03, 0x00, 0x21}},
      {LinkForm::Ppp, {0x00, 0x21}},     {LinkForm::Ppp, {0x21}},
  };
  for (const auto& [form, header] : links) {
    shaper.SetForm(form);
    Deliver(Joined(header, packet));
    EXPECT_EQ(queue.Newest()->wire, 74u) << static_cast<int>(form);
    EXPECT_EQ(Next(), expected) << static_cast<int>(form);
  }
}

TEST_F(PcapFrameShaperTest, A_long_packet_shows_as_many_bytes_whatever_the_header_of_its_link) {
  const Bytes packet = Ipv4Packet(6, "1.2.3.4", 1025, "5.6.7.8", 80, 200);
  Bytes cooked(16);
  PutBig16(cooked, 14, 0x0800);
  Bytes cooked2(20);
  PutBig16(cooked2, 0, 0x0800);
  const std::pair<LinkForm, Bytes> links[] = {
      {LinkForm::Ethernet, {0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 8, 0}},
      {LinkForm::RawIp, {}},
      {LinkForm::Family, {2, 0, 0, 0}},
      {LinkForm::LinuxCooked, cooked},
      {LinkForm::LinuxCooked2, cooked2},
      {LinkForm::Ppp, {0xFF, 0x03, 0x00, 0x21}},
  };
  for (const auto& [form, header] : links) {
    shaper.SetForm(form);
    Bytes captured = Joined(header, packet);
    captured.resize(FrameShaper::kMostBytes);
    Deliver(captured);
    const Bytes frame = Next();
    EXPECT_EQ(frame.size(), 96u) << static_cast<int>(form);
    EXPECT_EQ(Bytes(frame.begin() + 14, frame.end()), Bytes(packet.begin(), packet.begin() + 82))
        << static_cast<int>(form);
  }
}

TEST_F(PcapFrameShaperTest, Packets_shorter_than_their_links_header_become_blank_frames) {
  for (const LinkForm form : {LinkForm::RawIp, LinkForm::Family, LinkForm::LinuxCooked,
                              LinkForm::LinuxCooked2, LinkForm::Ppp, LinkForm::Ethernet}) {
    shaper.SetForm(form);
    for (std::size_t length = 0; length < 20; ++length) {
      Deliver(Bytes(length, 0));
      EXPECT_EQ(Next().size(), 60u);
    }
  }
}

TEST_F(PcapFrameShaperTest, Links_are_known_by_their_types) {
  constexpr int kWirelessFrames = 105;
  EXPECT_EQ(LinkFormOf(link_type::kEthernet), LinkForm::Ethernet);
  EXPECT_EQ(LinkFormOf(link_type::kRawIp), LinkForm::RawIp);
  EXPECT_EQ(LinkFormOf(link_type::kLinuxCooked2), LinkForm::LinuxCooked2);
  EXPECT_EQ(LinkFormOf(link_type::kPpp), LinkForm::Ppp);
  EXPECT_EQ(LinkFormOf(link_type::kFamily), LinkForm::Family);
  EXPECT_EQ(LinkFormOf(kWirelessFrames), std::nullopt);
}

TEST_F(PcapFrameShaperTest, A_total_length_of_32767_stays_one_frame) {
  Deliver(TruncatedTcp(32767), 14 + 32767);
  EXPECT_EQ(TotalLengths(), std::vector<unsigned>{32767});
}

TEST_F(PcapFrameShaperTest, A_TCP_packet_of_32768_bytes_comes_as_two_frames) {
  Deliver(TruncatedTcp(32768), 14 + 32768);
  EXPECT_EQ(TotalLengths(), (std::vector<unsigned>{32767, 1}));
}

TEST_F(PcapFrameShaperTest, A_TCP_packet_of_64_KB_comes_as_frames_that_add_up) {
  Deliver(TruncatedTcp(65535), 14 + 65535);
  EXPECT_EQ(TotalLengths(), (std::vector<unsigned>{32767, 32767, 1}));
}

TEST_F(PcapFrameShaperTest, The_frames_of_one_packet_share_its_addresses_and_ports) {
  Deliver(TruncatedTcp(60000), 14 + 60000);
  const Bytes first = Next();
  const Bytes second = Next();
  EXPECT_EQ(Bytes(first.begin(), first.begin() + 16), Bytes(second.begin(), second.begin() + 16));
  EXPECT_EQ(Bytes(first.begin() + 18, first.end()), Bytes(second.begin() + 18, second.end()));
}

TEST_F(PcapFrameShaperTest, A_packet_beyond_64_KB_is_measured_on_the_link) {
  Deliver(TruncatedTcp(0), 14 + 100000);
  EXPECT_EQ(TotalLengths(), (std::vector<unsigned>{32767, 32767, 32767, 1699}));
}

TEST_F(PcapFrameShaperTest, The_largest_packet_of_a_host_fits_in_the_pieces_that_are_allowed) {
  Deliver(TruncatedTcp(0), 14 + 8 * 65535);
  const auto lengths = TotalLengths();
  EXPECT_EQ(lengths.size(), FrameShaper::kMostPieces);
  unsigned sum = 0;
  for (const unsigned length : lengths) sum += length;
  EXPECT_EQ(sum, 8u * 65535);
}

TEST_F(PcapFrameShaperTest, A_total_length_that_the_frame_doesnt_have_stays_untouched) {
  Deliver(TruncatedTcp(0xFFFF), 114);
  Deliver(TruncatedTcp(0), 114);
  Deliver(TruncatedTcp(0xFFFF), 14 + 40000);
  EXPECT_EQ(TotalLengths(), (std::vector<unsigned>{0xFFFF, 0, 0xFFFF}));
}

TEST_F(PcapFrameShaperTest, Long_packets_of_other_protocols_stay_one_frame) {
  Bytes udp = TruncatedTcp(60000);
  udp[23] = 17;
  Deliver(udp, 14 + 60000);
  Bytes six = TruncatedTcp(60000);
  PutBig16(six, 12, 0x86DD);
  Deliver(six, 14 + 60000);
  EXPECT_EQ(TotalLengths(), (std::vector<unsigned>{60000, 60000}));
}

TEST_F(PcapFrameShaperTest, A_long_packet_of_a_link_without_Ethernet_is_split_too) {
  Bytes packet = Ipv4Packet(6, "1.2.3.4", 1025, "5.6.7.8", 80, 100);
  PutBig16(packet, 2, 40000);
  shaper.SetForm(LinkForm::RawIp);
  Deliver(packet, 40000);
  EXPECT_EQ(TotalLengths(), (std::vector<unsigned>{32767, 7233}));
}

} // namespace quendra::platform
