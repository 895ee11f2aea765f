#include "capture/dormant/Sniffer.h"

#include "capture/CaptureProgram.h"
#include "forms/MessageWindows.h"

namespace quendra::capture {
namespace {

constexpr platform::SocketHandle kSocket{77};
constexpr std::uint32_t kReadable = 1;

/// An IPv4 packet of `size` bytes as a raw socket gives it; the ports stand at `portsAt`.
Bytes PacketOf(int protocol, const std::string& source, unsigned sourcePort, unsigned destinationPort,
               std::size_t portsAt = 20, unsigned totalLength = 1064, std::size_t size = 100) {
  Bytes packet(size);
  packet[0] = 0x45;
  PutBig16(packet, 2, totalLength);
  packet[9] = static_cast<std::uint8_t>(protocol);
  PutAddress(packet, 12, source);
  PutBig16(packet, portsAt, sourcePort);
  PutBig16(packet, portsAt + 2, destinationPort);
  return packet;
}

SniffedPacket Read(Bytes packet) {
  packet.resize(2000);
  return ReadSniffedPacket(std::span<const std::uint8_t, 2000>(packet.data(), 2000));
}

TEST(SniffedPackets, Icmp_has_a_name_a_header_of_20_bytes_and_no_ports) {
  const SniffedPacket packet = Read(PacketOf(1, kServer, 1, 2));
  EXPECT_EQ(packet.protocolName, u"ICMP");
  EXPECT_EQ(packet.payloadSize, 1044);
  EXPECT_FALSE(packet.ports);
}

TEST(SniffedPackets, Tcp_has_its_ports_at_byte_20_and_a_header_of_40_bytes) {
  const SniffedPacket packet = Read(PacketOf(6, kServer, 80, 50000));
  EXPECT_EQ(packet.payloadSize, 1024);
  EXPECT_EQ(packet.ports->source, 80);
  EXPECT_EQ(packet.ports->destination, -15536);
}

TEST(SniffedPackets, Udp_has_a_name_its_ports_at_byte_20_and_a_header_of_28_bytes) {
  const SniffedPacket packet = Read(PacketOf(17, kServer, 53, 1025));
  EXPECT_EQ(packet.protocolName, u"UDP");
  EXPECT_EQ(packet.payloadSize, 1036);
  EXPECT_EQ(packet.ports->source, 53);
}

TEST(SniffedPackets, Any_other_protocol_takes_its_number_as_name) {
  const SniffedPacket packet = Read(PacketOf(50, kServer, 1, 2));
  EXPECT_EQ(packet.protocolName, u"50");
  EXPECT_EQ(packet.payloadSize, 1044);
  EXPECT_FALSE(packet.ports);
}

Bytes TunnelledPacket(int innerProtocol) {
  Bytes packet = PacketOf(47, "1.1.1.1", 9, 9);
  PutBig16(packet, 38, 540);
  packet[45] = static_cast<std::uint8_t>(innerProtocol);
  PutAddress(packet, 48, kServer);
  return packet;
}

TEST(SniffedPackets, Behind_protocol_47_the_header_stands_36_bytes_further_on) {
  Bytes bytes = TunnelledPacket(6);
  PutBig16(bytes, 56, 80);
  PutBig16(bytes, 58, 1025);
  const SniffedPacket packet = Read(bytes);
  EXPECT_TRUE(packet.tunnelled);
  EXPECT_EQ(packet.source, platform::simulated::AddressOf(kServer));
  EXPECT_EQ(packet.payloadSize, 500);
  EXPECT_EQ(packet.ports->source, 80);
  EXPECT_EQ(packet.ports->destination, 1025);
}

TEST(SniffedPackets, Protocol_47_in_a_tunnel_takes_its_ports_from_byte_28) {
  Bytes bytes = TunnelledPacket(47);
  PutBig16(bytes, 28, 5);
  PutBig16(bytes, 30, 6);
  const SniffedPacket packet = Read(bytes);
  EXPECT_EQ(packet.payloadSize, 520);
  EXPECT_EQ(packet.ports->source, 5);
  EXPECT_EQ(packet.ports->destination, 6);
}

TEST(SniffedPackets, In_a_tunnel_udp_still_takes_its_ports_from_byte_20) {
  Bytes bytes = TunnelledPacket(17);
  PutBig16(bytes, 20, 53);
  PutBig16(bytes, 22, 1025);
  PutBig16(bytes, 56, 7);
  const SniffedPacket packet = Read(bytes);
  EXPECT_EQ(packet.protocolName, u"UDP");
  EXPECT_EQ(packet.payloadSize, 512);
  EXPECT_EQ(packet.ports->source, 53);
  EXPECT_EQ(packet.ports->destination, 1025);
}

TEST(SniffedPackets, In_a_tunnel_other_protocols_have_a_header_of_20_bytes_and_no_ports) {
  for (const auto& [protocol, name] : {std::pair{1, u"ICMP"}, std::pair{50, u"50"}}) {
    const SniffedPacket packet = Read(TunnelledPacket(protocol));
    EXPECT_EQ(packet.protocolName, name);
    EXPECT_EQ(packet.payloadSize, 520);
    EXPECT_FALSE(packet.ports);
  }
}

TEST(SniffedPackets, A_packet_shorter_than_its_headers_has_a_payload_below_0) {
  EXPECT_EQ(Read(PacketOf(6, kServer, 80, 1025, 20, 39)).payloadSize, -1);
}

TEST(SniffedPackets, An_empty_packet_is_no_fault) { EXPECT_EQ(Read({}).payloadSize, -20); }

struct SnifferTest : CaptureProgram {
  SnifferTest() {
    addresses.Read();
    sniffer.Sockets = {platform::SocketHandle(7), platform::SocketHandle(8)};
    sniffer.Window = WindowHandle(9);
    AddRow(1, u".1025.");
  }
  void Sniff() {
    std::int32_t result = 0;
    sniffer.Despues(result, WindowHandle(), 1025, kSocket.Value(), kReadable);
  }
  forms::ListRow& Row() { return form.main_ListView1.Row(1); }

  forms::Timer main_Timer1{form, u"main_Timer1", 1000, true};
  Sniffer sniffer{machine.sockets, form.main_ListView1, main_Timer1, addresses};
};

TEST_F(SnifferTest, A_readable_socket_is_read_and_its_packet_charged_by_its_payload) {
  machine.sockets.Receive(kSocket, PacketOf(6, kOwnAddress, 1025, 80));
  Sniff();
  EXPECT_EQ(Upload(Row()), 1);
}

TEST_F(SnifferTest, Any_other_event_of_a_socket_is_passed_over) {
  machine.sockets.Receive(kSocket, PacketOf(6, kOwnAddress, 1025, 80));
  std::int32_t result = 5;
  sniffer.Despues(result, WindowHandle(), 1025, kSocket.Value(), 2);
  EXPECT_EQ(Upload(Row()), 0);
  EXPECT_EQ(result, 5);
}

TEST_F(SnifferTest, A_readable_event_that_brings_an_error_number_is_passed_over) {
  machine.sockets.Receive(kSocket, PacketOf(6, kOwnAddress, 1025, 80));
  std::int32_t result = 0;
  sniffer.Despues(result, WindowHandle(), 1025, kSocket.Value(), 10054U << 16 | kReadable);
  EXPECT_EQ(Upload(Row()), 0);
}

TEST_F(SnifferTest, Before_the_windows_procedure_nothing_is_done) {
  machine.sockets.Receive(kSocket, PacketOf(6, kOwnAddress, 1025, 80));
  std::int32_t handled = 0;
  std::int32_t result = 0;
  sniffer.Antes(handled, result, WindowHandle(), 1025, kSocket.Value(), kReadable);
  EXPECT_EQ(handled, 0);
  EXPECT_EQ(Upload(Row()), 0);
}

TEST_F(SnifferTest, Full_buffers_are_read_on_and_a_shorter_one_is_the_last) {
  machine.sockets.Receive(kSocket, PacketOf(6, kOwnAddress, 1025, 80, 20, 1064, 2000));
  machine.sockets.Receive(kSocket, PacketOf(6, kOwnAddress, 1025, 80, 20, 1064, 1999));
  machine.sockets.Receive(kSocket, PacketOf(6, kOwnAddress, 1025, 80));
  Sniff();
  EXPECT_EQ(Upload(Row()), 2);
  Sniff();
  EXPECT_EQ(Upload(Row()), 3);
}

TEST_F(SnifferTest, A_read_of_0_or_a_failed_one_ends_the_reading) {
  Sniff();
  machine.sockets.FailReceive(kSocket);
  machine.sockets.Receive(kSocket, PacketOf(6, kOwnAddress, 1025, 80));
  Sniff();
  EXPECT_EQ(Upload(Row()), 0);
}

TEST_F(SnifferTest, A_short_packet_is_not_completed_with_bytes_of_the_one_before) {
  machine.sockets.Receive(kSocket, PacketOf(6, kOwnAddress, 1025, 80, 20, 1064, 2000));
  machine.sockets.Receive(kSocket, Bytes(4));
  Sniff();
  EXPECT_EQ(Upload(Row()), 1);
}

TEST_F(SnifferTest, Three_addresses_are_local_here_the_gateways_among_them) {
  addresses.GatewayAddress = u"10.0.0.1";
  for (const std::string source : {kOwnAddress, "192.168.7.1", "10.0.0.1"})
    machine.sockets.Receive(kSocket, PacketOf(6, source, 1025, 80, 20, 1064, 2000));
  Sniff();
  EXPECT_EQ(Upload(Row()), 3);
}

TEST_F(SnifferTest, A_packet_from_elsewhere_is_a_download_by_its_destination_port) {
  machine.sockets.Receive(kSocket, PacketOf(6, kServer, 80, 1025));
  Sniff();
  EXPECT_EQ(Download(Row()), 1);
}

TEST_F(SnifferTest, The_first_row_with_the_port_is_charged_and_no_other) {
  AddRow(2, u".80.1025.");
  machine.sockets.Receive(kSocket, PacketOf(6, kOwnAddress, 1025, 80));
  Sniff();
  EXPECT_EQ(Upload(Row()), 1);
  EXPECT_EQ(Upload(form.main_ListView1.Row(2)), 0);
}

TEST_F(SnifferTest, What_is_sent_counts_by_its_source_port_alone_and_what_comes_by_its_destination_port) {
  machine.sockets.Receive(kSocket, PacketOf(6, kOwnAddress, 80, 1025, 20, 1064, 2000));
  machine.sockets.Receive(kSocket, PacketOf(6, kServer, 1025, 80));
  Sniff();
  EXPECT_EQ(Upload(Row()), 0);
  EXPECT_EQ(Download(Row()), 0);
}

TEST_F(SnifferTest, Blanks_around_an_own_address_do_not_count_and_an_empty_one_is_nobodys) {
  addresses.LocalAddressLast = u" 192.0.2.80 ";
  addresses.LocalAddressPrevious = u"  ";
  addresses.GatewayAddress = u" 10.0.0.1 ";
  for (const std::string source : {"192.0.2.80", "10.0.0.1", "0.0.0.0"})
    machine.sockets.Receive(kSocket, PacketOf(6, source, 1025, 1025, 20, 1064, 2000));
  Sniff();
  EXPECT_EQ(Upload(Row()), 2);
  EXPECT_EQ(Download(Row()), 1);
}

TEST_F(SnifferTest, A_packet_without_an_owner_goes_to_the_row_p_minus_1) {
  auto& nobody = monitor::AddBareRow(form.main_ListView1, u"p-1");
  machine.sockets.Receive(kSocket, PacketOf(1, kOwnAddress, 1025, 80, 20, 1044));
  Sniff();
  EXPECT_EQ(Upload(nobody), 1);
  EXPECT_EQ(Upload(Row()), 0);
}

TEST_F(SnifferTest, Without_that_row_a_packet_without_an_owner_is_dropped) {
  machine.sockets.Receive(kSocket, PacketOf(6, kOwnAddress, 2000, 80));
  Sniff();
  EXPECT_EQ(Upload(Row()) + Download(Row()), 0);
}

TEST_F(SnifferTest, The_teardown_of_a_sleeping_sniffer_does_nothing) {
  sniffer.Teardown();
  EXPECT_EQ(machine.Calls, Calls{});
  EXPECT_TRUE(main_Timer1.Enabled());
}

TEST_F(SnifferTest, The_teardown_goes_in_this_order_and_once) {
  forms::MessageWindows& windows = desktop.Windows;
  const WindowHandle window = windows.Create();
  const auto own = windows.Procedure(window);
  sniffer.Active = true;
  sniffer.Subclass = std::make_unique<foundation::cSubCls>(windows);
  sniffer.Subclass->SubClass(window, sniffer, kTrue16);
  machine.sockets.Blocking = true;
  sniffer.Teardown();
  const Calls selectAndClose{"WSAAsyncSelect 7 9 1025 0", "WSAAsyncSelect 8 9 1025 0", "closesocket 7",
                             "closesocket 8"};
  Calls expected = selectAndClose;
  for (const char* call : {"WSAIsBlocking", "WSACancelBlockingCall", "WSACleanup"})
    expected.emplace_back(call);
  expected.insert(expected.end(), selectAndClose.begin(), selectAndClose.end());
  EXPECT_EQ(machine.Calls, expected);
  EXPECT_FALSE(main_Timer1.Enabled());
  EXPECT_EQ(windows.Procedure(window), own);
  EXPECT_EQ(sniffer.Subclass, nullptr);
  sniffer.Teardown();
  EXPECT_EQ(machine.Calls, expected);
}

TEST_F(SnifferTest, A_message_of_the_window_that_it_is_attached_to_reaches_it) {
  forms::MessageWindows& windows = desktop.Windows;
  const WindowHandle window = windows.Create();
  sniffer.Subclass = std::make_unique<foundation::cSubCls>(windows);
  sniffer.Subclass->AddMsg(1025, kFalse16);
  sniffer.Subclass->SubClass(window, sniffer, kFalse16);
  machine.sockets.Receive(kSocket, PacketOf(6, kOwnAddress, 1025, 80));

  windows.Dispatch(window, 1025, kSocket.Value(), kReadable);

  EXPECT_EQ(Upload(Row()), 1);
}

TEST_F(SnifferTest, The_teardown_cancels_no_blocking_call_when_none_is_under_way) {
  sniffer.Active = true;
  sniffer.Teardown();
  EXPECT_EQ(std::count(machine.Calls.begin(), machine.Calls.end(), "WSACancelBlockingCall"), 0);
}

} // namespace
} // namespace quendra::capture
