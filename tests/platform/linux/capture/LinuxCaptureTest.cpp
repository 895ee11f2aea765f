#include "platform/linux/capture/LinuxCaptureFixture.h"

#include "runtime/Text.h"

#include <arpa/inet.h>
#include <cstring>
#include <fcntl.h>
#include <linux/if_tun.h>
#include <sys/ioctl.h>
#include <sys/wait.h>

namespace quendra::platform::linux_ {

using integration::Bytes;
using integration::RawLink;
using integration::RunCommand;
using integration::TcpFrame;

namespace {

std::string DescriptionOf(const AdapterInfo& info) { return info.AdapterDescription.data(); }

/// A tunnel device without Ethernet: what is written to it arrives on the link.
class Tunnel {
 public:
  explicit Tunnel(const std::string& name) : descriptor_(open("/dev/net/tun", O_RDWR | O_CLOEXEC)) {
    ifreq request{};
    name.copy(request.ifr_name, IFNAMSIZ - 1);
    request.ifr_flags = IFF_TUN | IFF_NO_PI;
    made_ = descriptor_ >= 0 && ioctl(descriptor_, TUNSETIFF, &request) == 0;
  }
  ~Tunnel() { close(descriptor_); }
  bool Made() const { return made_; }
  void Arrive(const Bytes& packet) {
    ASSERT_EQ(write(descriptor_, packet.data(), packet.size()), ssize_t(packet.size()));
  }

 private:
  int descriptor_;
  bool made_ = false;
};

} // namespace

using LinuxCaptureTest = LinuxCaptureFixture;

TEST_F(LinuxCaptureTest, The_adapters_are_the_interfaces_that_are_up) {
  RunCommand("ip link add down0 type veth peer name down1");
  EXPECT_EQ(IndexOf("qv1"), 0);
  EXPECT_EQ(IndexOf("qv0"), 1);
  EXPECT_EQ(IndexOf("down0"), -1);
  EXPECT_EQ(capture->availability(), CaptureLibrary::Availability::Available);
}

TEST_F(LinuxCaptureTest, Loopback_is_the_last_adapter) {
  RunCommand("ip link set lo up");
  EXPECT_EQ(IndexOf("lo"), 2);
  EXPECT_EQ(DescriptionOf(InfoOf(2)), "Loopback (lo)");
}

TEST_F(LinuxCaptureTest, The_adapter_of_the_default_route_is_the_first) {
  AddLink("qw0", "qw1", "10.8.0.1/24");
  RunCommand("ip route add default via 10.8.0.7 dev qw0");
  EXPECT_EQ(IndexOf("qw0"), 0);
  EXPECT_GT(IndexOf("qv0"), 0);
}

TEST_F(LinuxCaptureTest, A_description_tells_the_kind_of_link_and_its_name) {
  EXPECT_EQ(DescriptionOf(InfoOf(IndexOf("qv0"))), "Virtual Ethernet (qv0)");
}

TEST_F(LinuxCaptureTest, A_name_outside_Latin_stands_in_the_code_page) {
  RunCommand("ip link set qv0 down && ip link set qv0 name רשת && ip link set רשת up");
  const int index = IndexOf("רשת");
  ASSERT_GE(index, 0);
  EXPECT_EQ(DescriptionOf(InfoOf(index)), ToCodePage(u"Virtual Ethernet (רשת)"));
}

TEST_F(LinuxCaptureTest, An_index_that_the_library_lacks_leaves_the_record_as_it_was) {
  const int last = capture->VBPcapInit();
  AdapterInfo info;
  info.AdapterName[0] = 'x';
  for (const int index : {-1, last + 1, 32767, -32768})
    capture->vpGetAdapterInfo(static_cast<std::int16_t>(index), info);
  EXPECT_STREQ(info.AdapterName.data(), "x");
}

TEST_F(LinuxCaptureTest, A_control_gives_the_address_of_any_adapter) {
  control = capture->Create();
  auto address = Ipv4Address::FromHost(1);
  std::uint32_t second = 1;
  std::string name = "qv0";
  name.resize(255, '\0');
  control->AdapterAddress(name, address, second);
  EXPECT_EQ(address.AsAscii(), "10.9.0.1");
  control->AdapterAddress("qv1", address, second);
  EXPECT_TRUE(address.IsAny());
  control->AdapterAddress("nothing", address, second);
  EXPECT_TRUE(address.IsAny());
}

TEST_F(LinuxCaptureTest, Without_an_interface_that_is_up_a_session_delivers_nothing) {
  RunCommand("ip link del qv0");
  EXPECT_GE(capture->VBPcapInit(), 0);
  EXPECT_EQ(capture->availability(), CaptureLibrary::Availability::NoAdapters);
  capture->VBPcapTerminate();
  capture->vpSetCurrentAdapter(0);
  capture->vpBegin(1000);
  FrameBytes frame;
  CaptureHeader header{};
  EXPECT_LT(capture->vpCapture(frame, header), 0);
  EXPECT_EQ(frame.UpperBound(), 59);
}

TEST_F(LinuxCaptureTest, Without_a_session_vpCapture_fails_with_a_blank_frame) {
  FrameBytes frame;
  CaptureHeader header{};
  EXPECT_LT(capture->vpCapture(frame, header), 0);
  EXPECT_EQ(frame.UpperBound(), 59);
  EXPECT_EQ(frame[12], 0);
}

TEST_F(LinuxCaptureTest, With_nothing_waiting_vpCapture_gives_0_and_60_zero_bytes) {
  Start("qv0");
  FrameBytes frame;
  CaptureHeader header{};
  EXPECT_EQ(capture->vpCapture(frame, header), 0);
  ASSERT_EQ(frame.UpperBound(), 59);
  for (int i = 0; i < 60; ++i) EXPECT_EQ(frame[i], 0);
}

TEST_F(LinuxCaptureTest, Each_frame_of_the_link_is_delivered_once_in_its_order) {
  Start("qv0");
  RawLink far("qv1");
  for (unsigned i = 0; i < 3000; ++i) far.Send(TcpFrame(i + 1, 80, 60));
  std::vector<unsigned> ports;
  WaitUntil(
      [&] {
        while (const auto frame = NextFrame()) ports.push_back(SourcePort(*frame));
        return ports.size() >= 3000;
      },
      "3000 frames");
  Settle();
  EXPECT_EQ(Drain(), 0);
  ASSERT_EQ(ports.size(), 3000u);
  for (unsigned i = 0; i < 3000; ++i) ASSERT_EQ(ports[i], i + 1);
  EXPECT_EQ(capture->Counters().received, 3000u);
}

TEST_F(LinuxCaptureTest, Frames_sent_from_this_side_are_delivered_once_too) {
  Start("qv0");
  RawLink("qv0").Send(TcpFrame(1025, 80));
  WaitUntil([&] { return events > 0; }, "the frame");
  EXPECT_EQ(Drain(), 1);
  Settle();
  EXPECT_EQ(Drain(), 0);
}

TEST_F(LinuxCaptureTest, Packets_on_loopback_are_delivered_once) {
  RunCommand("ip link set lo up");
  Start("lo");
  const int client = socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0);
  sockaddr_in target{};
  target.sin_family = AF_INET;
  target.sin_port = htons(4000);
  target.sin_addr.s_addr = inet_addr("127.0.0.1");
  ASSERT_NE(connect(client, reinterpret_cast<sockaddr*>(&target), sizeof target), 0);
  close(client);
  WaitUntil([&] { return events > 0; }, "the packets");
  std::vector<int> flags;
  while (const auto frame = NextFrame()) flags.push_back((*frame)[47]);
  constexpr int kSyn = 0x02;
  constexpr int kAckAndReset = 0x14;
  EXPECT_EQ(flags, (std::vector<int>{kSyn, kAckAndReset}));
}

TEST_F(LinuxCaptureTest, Frames_are_cut_to_what_the_decoders_need_but_tell_their_length) {
  Start("qv0");
  RawLink("qv1").Send(TcpFrame(1025, 80, 1500));
  WaitUntil([&] { return events > 0; }, "the frame");
  FrameBytes frame;
  CaptureHeader header{};
  EXPECT_EQ(capture->vpCapture(frame, header), 96);
  EXPECT_EQ(frame.UpperBound(), 95);
  EXPECT_EQ(header[3], 1514u);
}

TEST_F(LinuxCaptureTest, Packets_of_a_tunnel_get_an_Ethernet_header) {
  Tunnel tunnel("qt0");
  if (!tunnel.Made()) GTEST_SKIP() << "this machine has no tunnel devices";
  RunCommand("ip addr add 10.7.0.1/24 dev qt0 && ip link set qt0 up");
  Start("qt0");
  EXPECT_EQ(DescriptionOf(InfoOf(IndexOf("qt0"))), "Tunnel (qt0)");
  const Bytes packet = integration::Ipv4Packet(6, "10.7.0.2", 1025, "10.7.0.1", 80, 60);
  tunnel.Arrive(packet);
  WaitUntil([&] { return events > 0; }, "the packet");
  const auto frame = NextFrame();
  ASSERT_TRUE(frame);
  EXPECT_EQ(Big16(*frame, 12), 0x0800);
  EXPECT_EQ(Bytes(frame->begin() + 14, frame->end()), packet);
}

TEST_F(LinuxCaptureTest, A_packet_of_64_KB_is_delivered_in_frames_that_add_up) {
  RunCommand("ip link set qv0 mtu 65535 && ip link set qv1 mtu 65535");
  Start("qv0");
  RawLink("qv1").Send(TcpFrame(1025, 80, 65000));
  WaitUntil([&] { return events > 0; }, "the packet");
  int sum = 0;
  while (const auto frame = NextFrame()) {
    const int total = Big16(*frame, 16);
    EXPECT_LE(total, 32767);
    EXPECT_EQ(SourcePort(*frame), 1025u);
    sum += total;
  }
  EXPECT_EQ(sum, 65000);
  EXPECT_EQ(capture->Counters().received, 1u);
}

TEST_F(LinuxCaptureTest, A_session_that_was_ended_and_begun_again_goes_on) {
  Start("qv0");
  capture->vpEnd();
  RawLink far("qv1");
  far.Send(TcpFrame(1, 80));
  EXPECT_FALSE(NextFrame());
  capture->vpBegin(1000);
  far.Send(TcpFrame(2, 80));
  WaitUntil([&] { return events > 0; }, "the frame of the second session");
  const auto frame = NextFrame();
  ASSERT_TRUE(frame);
  EXPECT_EQ(SourcePort(*frame), 2u);
}

TEST_F(LinuxCaptureTest, The_session_follows_a_change_of_the_adapter) {
  AddLink("qw0", "qw1", "10.8.0.1/24");
  Start("qv0");
  StopControl();
  control.reset();
  capture->vpSetCurrentAdapter(static_cast<std::int16_t>(IndexOf("qw0")));
  StartControl("qw0");
  RawLink("qv1").Send(TcpFrame(1, 80));
  RawLink("qw1").Send(TcpFrame(2, 80));
  WaitUntil([&] { return events > 0; }, "the new adapter's frame");
  const auto frame = NextFrame();
  ASSERT_TRUE(frame);
  EXPECT_EQ(SourcePort(*frame), 2u);
  Settle();
  EXPECT_EQ(Drain(), 0);
}

TEST_F(LinuxCaptureTest, Counters_span_the_sessions) {
  AddLink("qw0", "qw1", "10.8.0.1/24");
  Start("qv0");
  RawLink("qv1").Send(TcpFrame(1, 80));
  WaitUntil([&] { return events > 0; }, "the first frame");
  capture->vpSetCurrentAdapter(static_cast<std::int16_t>(IndexOf("qw0")));
  StartControl("qw0");
  RawLink("qw1").Send(TcpFrame(2, 80));
  WaitUntil([&] { return events > 1; }, "the second frame");
  capture->vpEnd();
  EXPECT_EQ(capture->Counters().received, 2u);
}

TEST_F(LinuxCaptureTest, An_interface_that_goes_ends_the_session_without_a_busy_loop) {
  Start("qv0");
  RunCommand("ip link del qv0");
  // A descriptor still watched would be found readable in every round.
  Settle();
  EXPECT_NO_THROW(desktop.RunUntilIdle());
  FrameBytes frame;
  CaptureHeader header{};
  EXPECT_LT(capture->vpCapture(frame, header), 0);
  EXPECT_EQ(frame.UpperBound(), 59);
  EXPECT_EQ(events, 0);
}

TEST_F(LinuxCaptureTest, An_interface_that_goes_down_and_comes_up_is_heard_again) {
  Start("qv0");
  RunCommand("ip link set qv0 down");
  Settle();
  EXPECT_NO_THROW(desktop.RunUntilIdle());
  RunCommand("ip link set qv0 up");
  RawLink far("qv1");
  // The far end learns a little later that the link is there, and sends nothing until then.
  WaitUntil(
      [&] {
        far.Send(TcpFrame(1, 80));
        return events > 0;
      },
      "a frame after the break");
  EXPECT_GE(Drain(), 1);
}

TEST_F(LinuxCaptureTest, Two_million_frames_pass_without_a_drop) {
  Start("qv0");
  int received = 0;
  onEvent = [&] { received += Drain(); };
  constexpr int kFrames = 2000000;
  RawLink far("qv1");
  const Bytes frame = TcpFrame(1025, 80, 60);
  for (int sent = 0; sent < kFrames;) {
    for (int i = 0; i < 5000; ++i, ++sent) far.Send(frame);
    desktop.Advance(50);
  }
  WaitUntil([&] { return received >= kFrames; }, "all frames");
  EXPECT_EQ(received, kFrames);
  EXPECT_EQ(capture->Counters().droppedByKernel, 0u);
  EXPECT_EQ(capture->Counters().droppedByQueue, 0u);
}

TEST_F(LinuxCaptureTest, Frames_that_the_kernel_had_no_room_for_are_counted) {
  Start("qv0");
  RawLink far("qv1");
  const Bytes frame = TcpFrame(1025, 80, 500);
  constexpr std::uint64_t kFrames = 400000;
  for (std::uint64_t sent = 0; sent < kFrames; ++sent) far.Send(frame);
  onEvent = [&] { Drain(); };
  WaitUntil([&] { return capture->Counters().received + capture->Counters().droppedByKernel >= kFrames; },
            "all frames");
  const auto counters = capture->Counters();
  EXPECT_GT(counters.droppedByKernel, 0u);
  EXPECT_EQ(counters.received + counters.droppedByKernel, kFrames);
}

TEST_F(LinuxCaptureTest, Without_rights_the_adapters_are_listed_and_a_session_delivers_nothing) {
  const pid_t child = fork();
  ASSERT_GE(child, 0);
  if (child == 0) {
    if (setgid(65534) != 0 || setuid(65534) != 0) _exit(10);
    if (capture->VBPcapInit() < 1) _exit(11);
    if (capture->availability() != CaptureLibrary::Availability::NoRights) _exit(12);
    capture->vpSetCurrentAdapter(0);
    capture->vpBegin(1000);
    StartControl(InfoOf(0).AdapterName.data());
    desktop.PumpOnce();
    if (capture->availability() != CaptureLibrary::Availability::NoRights) _exit(16);
    FrameBytes frame;
    CaptureHeader header{};
    if (capture->vpCapture(frame, header) >= 0 || frame.UpperBound() != 59) _exit(13);
    if (DescriptionOf(InfoOf(0)) != "Virtual Ethernet (qv1)") _exit(14);
    Ipv4Address address;
    std::uint32_t second = 0;
    control->AdapterAddress("qv0", address, second);
    _exit(address.AsAscii() == "10.9.0.1" ? 0 : 15);
  }
  int status = 0;
  ASSERT_EQ(waitpid(child, &status, 0), child);
  EXPECT_TRUE(WIFEXITED(status));
  EXPECT_EQ(WEXITSTATUS(status), 0);
}

} // namespace quendra::platform::linux_
