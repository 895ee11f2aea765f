#include "capture/CaptureProgram.h"

namespace quendra::capture {
namespace {

struct PacketAttributionTest : CaptureProgram {
  PacketAttributionTest() { StartCapture(); }
};

TEST_F(PacketAttributionTest, An_outgoing_packet_adds_to_the_upload_total_of_the_row_of_its_source_port) {
  AddRow(1, u".80.");
  const auto& row = AddRow(2, u".1025.");
  Receive({Outgoing(1025, 1500)});
  EXPECT_EQ(Upload(row), 1.46484375);
  EXPECT_EQ(Download(row), 0);
}

TEST_F(PacketAttributionTest,
       An_incoming_packet_adds_to_the_download_total_of_the_row_of_its_destination_port) {
  const auto& row = AddRow(1, u".80.1025.");
  Receive({Incoming(80, 512)});
  EXPECT_EQ(Download(row), 0.5);
  EXPECT_EQ(Upload(row), 0);
}

TEST_F(PacketAttributionTest, A_total_length_of_1024_adds_exactly_1) {
  const auto& row = AddRow(1, u".1025.");
  Receive({Outgoing(1025, 1024)});
  EXPECT_EQ(Upload(row), 1.0);
}

TEST_F(PacketAttributionTest, Totals_run_on_from_packet_to_packet) {
  const auto& row = AddRow(1, u".1025.");
  Receive({Outgoing(1025, 1024), Outgoing(1025, 512), Incoming(1025, 256)});
  EXPECT_EQ(Upload(row), 1.5);
  EXPECT_EQ(Download(row), 0.25);
}

TEST_F(PacketAttributionTest, A_source_port_that_stands_in_no_row_adds_nothing) {
  const auto& row = AddRow(1, u".1025.");
  Receive({Outgoing(1026)});
  EXPECT_EQ(Upload(row), 0);
  EXPECT_EQ(Download(row), 0);
}

TEST_F(PacketAttributionTest, A_foreign_packet_with_a_matching_destination_port_counts_as_a_download) {
  const auto& row = AddRow(1, u".1025.");
  TestFrame frame;
  frame.source = "192.0.2.1";
  frame.destination = "192.0.2.2";
  frame.destinationPort = 1025;
  Receive({frame.Build()});
  EXPECT_EQ(Download(row), 1);
}

TEST_F(PacketAttributionTest, A_foreign_packet_with_a_matching_source_port_adds_nothing) {
  const auto& row = AddRow(1, u".1025.");
  TestFrame frame;
  frame.source = "192.0.2.1";
  frame.sourcePort = 1025;
  Receive({frame.Build()});
  EXPECT_EQ(Upload(row) + Download(row), 0);
}

TEST_F(PacketAttributionTest, A_local_packet_with_a_matching_destination_port_alone_adds_nothing) {
  const auto& row = AddRow(1, u".80.");
  Receive({Outgoing(1025)});
  EXPECT_EQ(Upload(row) + Download(row), 0);
}

TEST_F(PacketAttributionTest, The_address_before_the_last_is_local_too) {
  const auto& row = AddRow(1, u".1025.");
  TestFrame frame;
  frame.source = "192.168.7.1";
  Receive({frame.Build()});
  EXPECT_EQ(Upload(row), 1);
}

TEST_F(PacketAttributionTest, The_gateway_plays_no_part_in_the_direction) {
  addresses.GatewayAddress = u"10.0.0.1";
  const auto& row = AddRow(1, u".1025.");
  TestFrame frame;
  frame.source = "10.0.0.1";
  Receive({frame.Build()});
  EXPECT_EQ(Upload(row), 0);
}

TEST_F(PacketAttributionTest, Blanks_around_a_local_address_do_not_count) {
  addresses.LocalAddressLast = u"  10.0.0.138 ";
  const auto& row = AddRow(1, u".1025.");
  Receive({Outgoing(1025)});
  EXPECT_EQ(Upload(row), 1);
}

TEST_F(PacketAttributionTest, An_empty_local_address_equals_no_source) {
  addresses.LocalAddressLast = addresses.LocalAddressPrevious = {};
  const auto& row = AddRow(1, u".1025.");
  TestFrame frame;
  frame.source = "0.0.0.0";
  Receive({frame.Build()});
  EXPECT_EQ(Upload(row), 0);
}

TEST_F(PacketAttributionTest, A_local_address_that_changes_during_a_drain_counts_from_then_on) {
  const auto& row = AddRow(1, u".1025.");
  desktop.OnYield = [this, yields = 0]() mutable {
    if (++yields == 3) addresses.LocalAddressLast = u"10.0.0.99";
  };
  Receive({Outgoing(1025), Outgoing(1025)});
  EXPECT_EQ(Upload(row), 1);
}

TEST_F(PacketAttributionTest, A_port_of_32768_or_above_matches_only_its_negative_number) {
  const auto& positive = AddRow(1, u".50000.");
  const auto& negative = AddRow(2, u".-15536.");
  Receive({Outgoing(50000)});
  EXPECT_EQ(Upload(positive), 0);
  EXPECT_EQ(Upload(negative), 1);
}

TEST_F(PacketAttributionTest, Port_80_does_not_match_8080) {
  const auto& row = AddRow(1, u".8080.");
  Receive({Outgoing(80)});
  EXPECT_EQ(Upload(row), 0);
}

TEST_F(PacketAttributionTest, A_port_in_two_rows_goes_to_the_first_of_them) {
  const auto& first = AddRow(1, u".80.1025.");
  const auto& second = AddRow(2, u".1025.");
  Receive({Outgoing(1025)});
  EXPECT_EQ(Upload(first), 1);
  EXPECT_EQ(Upload(second), 0);
}

TEST_F(PacketAttributionTest, The_first_row_is_that_of_the_order_after_the_last_sort) {
  auto& first = AddRow(1, u".1025.");
  auto& second = AddRow(2, u".1025.");
  Receive({Outgoing(1025)});
  second.SetCellText(monitor::kDownloadCell, u"9");
  form.main_ListView1.Sort(monitor::kDownloadCell, forms::SortOrder::Descending);
  Receive({Outgoing(1025)});
  EXPECT_EQ(Upload(first), 1);
  EXPECT_EQ(Upload(second), 1);
}

TEST_F(PacketAttributionTest, Rows_that_go_and_come_between_packets_are_seen) {
  AddRow(1, u".1025.");
  Receive({Outgoing(1025)});
  form.main_ListView1.Clear();
  Receive({Outgoing(1025)});
  const auto& row = AddRow(2, u"");
  form.main_ListView1.Row(1).SetCellText(monitor::kPortsCell, u".1025.");
  Receive({Outgoing(1025)});
  EXPECT_EQ(Upload(row), 1);
}

TEST_F(PacketAttributionTest, An_empty_total_counts_as_0) {
  auto& row = AddRow(1, u".1025.");
  row.CellTag(monitor::kUploadCell) = u"";
  Receive({Outgoing(1025)});
  EXPECT_EQ(Upload(row), 1);
}

TEST_F(PacketAttributionTest, A_total_that_is_a_text_counts_as_its_number) {
  auto& row = AddRow(1, u".1025.");
  row.CellTag(monitor::kUploadCell) = u"2.5";
  Receive({Outgoing(1025)});
  EXPECT_EQ(row.CellTag(monitor::kUploadCell), Variant(3.5));
}

TEST_F(PacketAttributionTest, A_total_that_is_no_number_is_a_type_mismatch) {
  auto& row = AddRow(1, u".1025.");
  row.CellTag(monitor::kUploadCell) = u"much";
  machine.Deliver(Outgoing(1025));
  EXPECT_THROW(machine.SignalPackets(), Fault);
}

TEST_F(PacketAttributionTest, A_total_length_of_32768_or_above_takes_away) {
  const auto& row = AddRow(1, u".1025.");
  Receive({Outgoing(1025, 65536 - 1024)});
  EXPECT_EQ(Upload(row), -1);
}

TEST_F(PacketAttributionTest, The_texts_of_the_cells_stay_those_of_the_last_pass) {
  auto& row = AddRow(1, u".1025.");
  const auto before = form.main_ListView1.Revision();
  Receive({Outgoing(1025)});
  EXPECT_EQ(row.CellText(monitor::kUploadCell), u"0");
  EXPECT_EQ(form.main_ListView1.Revision(), before);
}

TEST_F(PacketAttributionTest, Udp_and_icmp_count_for_nothing) {
  const auto& row = AddRow(1, u".1025.");
  machine.Deliver(Udp());
  machine.Deliver(Icmp());
  for (int i = 0; i < 4; ++i) Receive({Outgoing(999)});
  EXPECT_EQ(Upload(row) + Download(row), 0);
}

Bytes TunnelledOutgoing(std::size_t size) {
  TestFrame frame;
  frame.size = size;
  Bytes bytes = frame.BuildTunnelled();
  PutBig16(bytes, 34, 7);
  return bytes;
}

TEST_F(PacketAttributionTest, Tcp_in_a_tunnel_is_charged_by_the_inner_ports) {
  const auto& row = AddRow(1, u".1025.");
  Receive({TunnelledOutgoing(95)});
  EXPECT_EQ(Upload(row), 1);
}

TEST_F(PacketAttributionTest, A_short_tunnelled_frame_takes_its_ports_from_the_outer_positions) {
  const auto& inner = AddRow(1, u".1025.");
  const auto& outer = AddRow(2, u".7.");
  Receive({TunnelledOutgoing(94)});
  EXPECT_EQ(Upload(inner), 0);
  EXPECT_EQ(Upload(outer), 1);
}

TEST_F(PacketAttributionTest, The_tunnel_flag_comes_from_the_newest_record_and_not_from_the_frame) {
  const auto& inner = AddRow(1, u".1025.");
  const auto& outer = AddRow(2, u".7.");
  Receive({TunnelledOutgoing(95), Outgoing(999)});
  EXPECT_EQ(Upload(inner), 0);
  EXPECT_EQ(Upload(outer), 1);
}

TEST_F(PacketAttributionTest,
       Another_page_stops_all_counting_and_a_row_that_still_stands_counts_on_afterwards) {
  const auto& row = AddRow(1, u".1025.");
  Receive({Outgoing(1025)});
  form.frameMain.Visible = false;
  Receive({Outgoing(1025)});
  EXPECT_EQ(Upload(row), 1);
  form.frameMain.Visible = true;
  machine.SignalPackets();
  EXPECT_EQ(Upload(row), 2);
}

TEST_F(PacketAttributionTest, Totals_live_as_long_as_their_row_through_an_adapter_change) {
  machine.AddCaptureAdapter({"eth1", "Card B", "192.0.2.1"});
  session.StopCapture();
  StartCapture();
  const auto& row = AddRow(1, u".1025.");
  Receive({Outgoing(1025)});
  adapters.main_cmbAdapters.SelectItem(1);
  Receive({Outgoing(1025)});
  EXPECT_EQ(Upload(row), 2);
}

} // namespace
} // namespace quendra::capture
