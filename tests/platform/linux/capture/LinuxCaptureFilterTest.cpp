#include "platform/linux/capture/LinuxCaptureFixture.h"
#include "platform/linux/capture/PcapSession.h"

namespace quendra::platform::linux_ {

using integration::Bytes;
using integration::EthernetFrame;
using integration::Ipv4Packet;
using integration::Joined;
using integration::RawLink;
using integration::RunCommand;
using integration::TcpFrame;
using integration::UdpFrame;

namespace {

constexpr unsigned kTypeArp = 0x0806;
constexpr unsigned kTypeIpv6 = 0x86DD;
constexpr unsigned kTypeVlan = 0x8100;

Bytes PacketOf(int protocol, std::size_t total = 60) {
  return Ipv4Packet(protocol, "10.9.0.2", 1025, "10.9.0.1", 80, total);
}

Bytes Tagged(const Bytes& packet) { return EthernetFrame(Joined({0, 5, 8, 0}, packet), kTypeVlan); }

class LinuxCaptureFilterTest : public LinuxCaptureFixture {
 protected:
  void SetUp() override {
    LinuxCaptureFixture::SetUp();
    if (!IsSkipped()) Start("qv0");
  }
  /// Sends these frames and one more that is certain to be delivered, and gives those that came before it.
  std::vector<Bytes> Delivered(const std::vector<Bytes>& sent) {
    RawLink far("qv1");
    for (const Bytes& frame : sent) far.Send(frame);
    const Bytes last = TcpFrame(4711, 80);
    far.Send(last);
    std::vector<Bytes> frames;
    WaitUntil(
        [&] {
          while (const auto frame = NextFrame()) frames.push_back(*frame);
          return !frames.empty() && SourcePort(frames.back()) == 4711;
        },
        "the last frame");
    if (!frames.empty()) frames.pop_back();
    return frames;
  }
};

} // namespace

TEST_F(LinuxCaptureFilterTest, Nothing_but_TCP_and_tunnels_over_IPv4_raises_an_event_or_is_delivered) {
  RawLink far("qv1");
  Bytes six(60, 6);
  six[0] = 0x60;
  for (const Bytes& frame :
       {UdpFrame(1025, 53), EthernetFrame(PacketOf(1)), EthernetFrame(PacketOf(50)),
        EthernetFrame(Bytes(46, 6), kTypeArp), EthernetFrame(Bytes(46, 47), kTypeArp),
        EthernetFrame(six, kTypeIpv6), EthernetFrame(PacketOf(6), 0x88B5), Bytes(14, 0), Bytes(60, 6)})
    far.Send(frame);
  Settle();
  EXPECT_EQ(events, 0);
  EXPECT_EQ(Drain(), 0);
  EXPECT_EQ(capture->Counters().received, 0u);
}

TEST_F(LinuxCaptureFilterTest, TCP_and_tunnels_are_delivered_from_between_other_traffic) {
  const Bytes tcp = EthernetFrame(PacketOf(6));
  const Bytes tunnel = EthernetFrame(PacketOf(47, 82));
  EXPECT_EQ(Delivered({UdpFrame(1, 2), tcp, UdpFrame(1, 2), tunnel, EthernetFrame(PacketOf(1))}),
            (std::vector<Bytes>{tcp, tunnel}));
}

TEST_F(LinuxCaptureFilterTest, The_fragments_of_a_TCP_packet_are_delivered_all) {
  constexpr unsigned kMore = 0x2000;
  Bytes first = EthernetFrame(PacketOf(6));
  PutBig16(first, 20, kMore);
  Bytes middle = first;
  PutBig16(middle, 20, kMore | 100);
  Bytes last = first;
  PutBig16(last, 20, 200);
  EXPECT_EQ(Delivered({first, middle, last}), (std::vector<Bytes>{first, middle, last}));
}

TEST_F(LinuxCaptureFilterTest, A_TCP_packet_with_options_is_delivered) {
  Bytes options = EthernetFrame(PacketOf(6, 80));
  options[14] = 0x4F;
  EXPECT_EQ(Delivered({options}), std::vector<Bytes>{options});
}

// The tag stands where the type of a frame is looked for, and would end a drain. Who wants such frames
// follows the adapter of the virtual network.
TEST_F(LinuxCaptureFilterTest, A_tagged_frame_is_not_delivered) {
  EXPECT_TRUE(Delivered({Tagged(PacketOf(6)), Tagged(PacketOf(47)), Tagged(PacketOf(17))}).empty());
}

TEST_F(LinuxCaptureFilterTest, A_tagged_frame_sent_from_this_side_is_not_delivered_either) {
  RawLink near("qv0");
  near.Send(Tagged(PacketOf(6)));
  near.Send(TcpFrame(1025, 80));
  WaitUntil([&] { return events > 0; }, "the frame without a tag");
  EXPECT_EQ(Drain(), 1);
}

/// A capture whose packets come with a header of 16 bytes that is no Ethernet header.
class CookedCaptureTest : public LinuxCaptureFixture {
 protected:
  void SetUp() override {
    LinuxCaptureFixture::SetUp();
    if (IsSkipped()) return;
    session = PcapSession::Open(library, desktop, "any", shaper);
    ASSERT_NE(session, nullptr);
  }
  const FrameRecord* Next() {
    desktop.WaitFor([&] { return session->Fill() > 0 || !queue.Empty(); }, 1000);
    return queue.Pop();
  }

  PcapLibrary library;
  FrameQueue queue;
  FrameShaper shaper{queue};
  std::unique_ptr<PcapSession> session;
};

TEST_F(CookedCaptureTest, A_decoder_sees_as_many_bytes_as_on_a_link_with_Ethernet_headers) {
  Bytes packet = PacketOf(47, 200);
  for (std::size_t i = 20; i < packet.size(); ++i) packet[i] = static_cast<std::uint8_t>(i);
  RawLink("qv1").Send(EthernetFrame(packet));
  const FrameRecord* record = Next();
  ASSERT_NE(record, nullptr);
  EXPECT_EQ(record->captured, 96u);
  EXPECT_EQ(record->wire, 214u);
  EXPECT_TRUE(std::equal(packet.begin(), packet.begin() + 82, record->bytes.begin() + 14));
}

TEST_F(CookedCaptureTest, Nothing_but_TCP_and_tunnels_over_IPv4_is_delivered) {
  RawLink far("qv1");
  far.Send(UdpFrame(1025, 53));
  far.Send(EthernetFrame(Bytes(46, 6), kTypeArp));
  far.Send(TcpFrame(4711, 80));
  const FrameRecord* record = Next();
  ASSERT_NE(record, nullptr);
  EXPECT_EQ(record->bytes[34] * 256 + record->bytes[35], 4711);
}

} // namespace quendra::platform::linux_
