#include "monitor/MonitorFixture.h"

#include <cstring>

namespace quendra::monitor {

namespace {

struct TcpPorts : MonitorFixture {
  void AddRow(std::uint32_t id, const Text& ports = {}) { AddBareRow(list, KeyOfProcess(id), ports); }
  void Listen(std::uint32_t owner, std::uint16_t port) {
    machine.AddConnection({2, "0.0.0.0", port, "0.0.0.0", 0, owner});
  }
  bool FetchAndMerge() {
    procPort.FetchTcpOwnerTable();
    return procPort.MergeTcpPorts();
  }
};

} // namespace

TEST_F(TcpPorts, A_port_goes_into_the_cell_of_its_owner) {
  AddRow(10);
  AddRow(20);
  Listen(20, 80);
  EXPECT_TRUE(FetchAndMerge());
  EXPECT_EQ(PortsOf(10), u"");
  EXPECT_EQ(PortsOf(20), u".80.");
}

TEST_F(TcpPorts, Every_port_stands_between_dots_in_the_order_of_the_table) {
  AddRow(10);
  Listen(10, 1025);
  Listen(10, 443);
  FetchAndMerge();
  EXPECT_EQ(PortsOf(10), u".1025.443.");
}

TEST_F(TcpPorts, A_port_over_32767_comes_out_positive) {
  AddRow(10);
  Listen(10, 65535);
  Listen(10, 32768);
  FetchAndMerge();
  EXPECT_EQ(PortsOf(10), u".65535.32768.");
}

TEST_F(TcpPorts, Two_sockets_of_a_process_on_one_port_show_it_once) {
  AddRow(10);
  Listen(10, 80);
  machine.AddConnection({5, "10.0.0.1", 80, "10.0.0.2", 1025, 10});
  FetchAndMerge();
  EXPECT_EQ(PortsOf(10), u".80.");
}

TEST_F(TcpPorts, Port_8_is_never_added_beside_port_80) {
  AddRow(10);
  Listen(10, 80);
  Listen(10, 8);
  FetchAndMerge();
  EXPECT_EQ(PortsOf(10), u".80.");
}

TEST_F(TcpPorts, Port_80_counts_as_present_in_8080) {
  AddRow(10, u".8080.");
  Listen(10, 80);
  FetchAndMerge();
  EXPECT_EQ(PortsOf(10), u".8080.");
}

TEST_F(TcpPorts, Port_80_is_added_beside_port_8) {
  AddRow(10);
  Listen(10, 8);
  Listen(10, 80);
  FetchAndMerge();
  EXPECT_EQ(PortsOf(10), u".8.80.");
}

TEST_F(TcpPorts, Port_0_with_a_remote_peer_is_added) {
  AddRow(10);
  machine.AddConnection({5, "10.0.0.1", 0, "10.0.0.2", 0, 10});
  FetchAndMerge();
  EXPECT_EQ(PortsOf(10), u".0.");
}

TEST_F(TcpPorts, Port_0_with_a_remote_port_alone_is_added) {
  AddRow(10);
  machine.AddConnection({5, "10.0.0.1", 0, "0.0.0.0", 25, 10});
  FetchAndMerge();
  EXPECT_EQ(PortsOf(10), u".0.");
}

TEST_F(TcpPorts, An_entry_without_remote_side_and_local_port_is_passed_over) {
  AddRow(10);
  machine.AddConnection({2, "10.0.0.1", 0, "0.0.0.0", 0, 10});
  Listen(10, 80);
  EXPECT_TRUE(FetchAndMerge());
  EXPECT_EQ(PortsOf(10), u".80.");
}

TEST_F(TcpPorts, A_connection_that_nobody_owns_any_more_goes_to_process_0) {
  AddRow(0);
  machine.AddConnection({11, "10.0.0.1", 1025, "10.0.0.2", 80, 0});
  FetchAndMerge();
  EXPECT_EQ(PortsOf(0), u".1025.");
}

TEST_F(TcpPorts, The_one_entry_past_the_table_gives_process_0_nothing) {
  AddRow(0);
  Listen(10, 80);
  FetchAndMerge();
  EXPECT_EQ(PortsOf(0), u"");
}

TEST_F(TcpPorts, An_owner_with_32_bits_is_found) {
  AddRow(0xFFFFFFFF);
  Listen(0xFFFFFFFF, 80);
  FetchAndMerge();
  EXPECT_EQ(PortsOf(0xFFFFFFFF), u".80.");
}

TEST_F(TcpPorts, An_owner_without_a_row_is_passed_over) {
  AddRow(10);
  Listen(99, 80);
  EXPECT_TRUE(FetchAndMerge());
  EXPECT_EQ(PortsOf(10), u"");
}

TEST_F(TcpPorts, An_empty_table_merges_nothing_and_says_so) {
  AddRow(10, u".80.");
  EXPECT_FALSE(FetchAndMerge());
  EXPECT_EQ(PortsOf(10), u".80.");
  EXPECT_EQ(desktop.YieldCount, 0);
}

TEST_F(TcpPorts, Without_a_table_there_is_nothing_to_merge) { EXPECT_FALSE(procPort.MergeTcpPorts()); }

TEST_F(TcpPorts, The_walk_yields_twice_an_entry_and_reads_one_entry_more) {
  AddRow(10);
  for (std::uint16_t port = 1; port <= 5; ++port) Listen(10, port);
  FetchAndMerge();
  EXPECT_EQ(desktop.YieldCount, 2 * (5 + 1));
}

TEST_F(TcpPorts, Ports_of_the_systems_own_processes_are_gathered_without_dots) {
  fileInfo.SystemPids[2] = 10;
  AddRow(10);
  AddRow(20);
  Listen(10, 80);
  Listen(10, 443);
  Listen(20, 25);
  FetchAndMerge();
  EXPECT_EQ(procPort.SystemPortsText, u"80443");
}

TEST_F(TcpPorts, The_gathered_ports_begin_empty_with_each_walk) {
  procPort.SystemPortsText = u"25";
  AddRow(10);
  Listen(10, 80);
  FetchAndMerge();
  EXPECT_EQ(procPort.SystemPortsText, u"");
}

TEST_F(TcpPorts, A_walk_without_a_new_fetch_reads_on_behind_the_table) {
  AddRow(10);
  Listen(10, 80);
  FetchAndMerge();
  Row(10).SetCellText(kPortsCell, u"");
  EXPECT_TRUE(procPort.MergeTcpPorts());
  EXPECT_EQ(PortsOf(10), u"");
}

// Fetching.

TEST_F(TcpPorts, A_fetch_that_fails_leaves_the_previous_table_with_the_walk_at_its_start) {
  AddRow(10);
  Listen(10, 80);
  FetchAndMerge();
  Row(10).SetCellText(kPortsCell, u"");
  machine.ipHelper.TableError = 87;
  EXPECT_FALSE(procPort.FetchTcpOwnerTable());
  EXPECT_TRUE(procPort.MergeTcpPorts());
  EXPECT_EQ(PortsOf(10), u".80.");
}

TEST_F(TcpPorts, A_first_fetch_that_fails_leaves_nothing_to_walk) {
  machine.ipHelper.TableError = 50;
  EXPECT_FALSE(procPort.FetchTcpOwnerTable());
  EXPECT_FALSE(procPort.MergeTcpPorts());
}

TEST_F(TcpPorts, A_new_table_takes_the_place_of_the_one_before) {
  AddRow(10);
  Listen(10, 80);
  FetchAndMerge();
  machine.ipHelper.Connections = {{2, "0.0.0.0", 443, "0.0.0.0", 0, 10}};
  EXPECT_TRUE(procPort.FetchTcpOwnerTable());
  Row(10).SetCellText(kPortsCell, u"");
  procPort.MergeTcpPorts();
  EXPECT_EQ(PortsOf(10), u".443.");
}

TEST_F(TcpPorts, A_new_empty_table_is_empty) {
  AddRow(10);
  Listen(10, 80);
  FetchAndMerge();
  machine.ipHelper.Connections.clear();
  EXPECT_FALSE(FetchAndMerge());
}

namespace {

/// Hands over tables byte by byte, and knows which are still held.
struct RawTables : platform::simulated::SimulatedIpHelper {
  std::vector<std::uint8_t> Bytes;
  std::vector<std::weak_ptr<const std::vector<std::uint8_t>>> given;

  std::uint32_t AllocateAndGetTcpExTableFromStack(TcpTable& table) override {
    table = std::make_shared<const std::vector<std::uint8_t>>(Bytes);
    given.push_back(table);
    return 0;
  }
};

struct RawTcpPorts : MonitorFixture {
  RawTables tables;
  modProcPort raw{tables, {machine.processes, machine.handles}, desktop, controls.main_ListView1, fileInfo};

  void PutTable(std::uint32_t count, const std::vector<TcpOwnerEntry>& entries, std::size_t extra = 0) {
    tables.Bytes.assign(4 + entries.size() * 24 + extra, 0xAA);
    PutLittle32(tables.Bytes, 0, count);
    for (std::size_t i = 0; i < entries.size(); ++i) entries[i].WriteTo(tables.Bytes, 4 + 24 * i);
  }
};

} // namespace

TEST_F(RawTcpPorts, Only_the_latest_table_is_kept) {
  PutTable(1, {{2, 0, 0x5000, 0, 0, 10}});
  for (int i = 0; i < 10; ++i) raw.FetchTcpOwnerTable();
  int held = 0;
  for (const auto& table : tables.given) held += table.expired() ? 0 : 1;
  EXPECT_EQ(held, 1);
}

TEST_F(RawTcpPorts, A_count_beyond_the_tables_bytes_walks_what_is_there) {
  AddBareRow(list, u"p10");
  PutTable(0xFFFFFFFF, {{2, 0, 0x5000, 0, 0, 10}}, 23);
  raw.FetchTcpOwnerTable();
  EXPECT_TRUE(raw.MergeTcpPorts());
  EXPECT_EQ(PortsOf(10), u".80.");
  EXPECT_EQ(desktop.YieldCount, 4);
}

TEST_F(RawTcpPorts, A_table_shorter_than_its_count_field_is_empty) {
  tables.Bytes = {1, 0, 0};
  EXPECT_TRUE(raw.FetchTcpOwnerTable());
  EXPECT_FALSE(raw.MergeTcpPorts());
  EXPECT_FALSE(raw.SweepConnections());
}

TEST_F(RawTcpPorts, What_stands_in_the_high_half_of_a_port_is_no_part_of_it) {
  AddBareRow(list, u"p10");
  PutTable(1, {{2, 0, 0xDEAD5000, 0, 0, 10}});
  raw.FetchTcpOwnerTable();
  raw.MergeTcpPorts();
  EXPECT_EQ(PortsOf(10), u".80.");
}

// Events that run while the walk yields.

TEST_F(TcpPorts, Rows_may_leave_while_the_walk_yields) {
  for (std::uint32_t id = 1; id <= 20; ++id) {
    AddRow(id);
    Listen(id, static_cast<std::uint16_t>(1000 + id));
  }
  desktop.OnYield = [&] {
    if (list.Count() > 1) list.Remove(1);
  };
  EXPECT_TRUE(FetchAndMerge());
  EXPECT_EQ(Order(), (std::vector<std::int64_t>{20}));
  EXPECT_EQ(PortsOf(20), u".1020.");
}

TEST_F(TcpPorts, The_table_may_be_cleared_and_filled_again_while_the_walk_yields) {
  AddRow(10);
  Listen(10, 80);
  Listen(10, 443);
  desktop.OnYield = [&] {
    if (desktop.YieldCount != 2) return;
    list.Clear();
    AddRow(10);
  };
  EXPECT_TRUE(FetchAndMerge());
  EXPECT_EQ(PortsOf(10), u".443.");
}

TEST_F(TcpPorts, An_entry_that_was_read_before_a_yield_is_merged_after_it) {
  Listen(10, 80);
  desktop.OnYield = [&] {
    if (desktop.YieldCount == 1) AddRow(10);
  };
  FetchAndMerge();
  EXPECT_EQ(PortsOf(10), u".80.");
}

TEST_F(TcpPorts, A_table_fetched_while_the_walk_yields_is_walked_on_in_for_as_many_entries) {
  AddRow(10);
  Listen(10, 1);
  Listen(10, 2);
  desktop.OnYield = [&] {
    if (desktop.YieldCount != 1) return;
    machine.ipHelper.Connections.clear();
    for (std::uint16_t port = 5; port <= 9; ++port) Listen(10, port);
    procPort.FetchTcpOwnerTable();
  };
  FetchAndMerge();
  // The entry in hand, then the second and third of the new table: the walk had three to go through.
  EXPECT_EQ(PortsOf(10), u".1.6.7.");
}

TEST_F(TcpPorts, A_walk_that_runs_while_another_yields_takes_its_place_and_its_entry) {
  AddRow(10);
  Listen(10, 80);
  Listen(10, 443);
  std::vector<Text> seen;
  desktop.OnYield = [&] {
    if (desktop.YieldCount != 1) return;
    FetchAndMerge();
    Row(10).SetCellText(kPortsCell, u"");
  };
  EXPECT_TRUE(FetchAndMerge());
  EXPECT_EQ(PortsOf(10), u"");
}

// Texts.

TEST(TcpTexts, An_address_is_its_four_bytes_as_stored_with_the_first_byte_first) {
  EXPECT_EQ(modProcPort::IpAddressText(0x0100007F), u"127.0.0.1");
  EXPECT_EQ(modProcPort::IpAddressText(0), u"0.0.0.0");
  EXPECT_EQ(modProcPort::IpAddressText(0xFFFFFFFF), u"255.255.255.255");
}

TEST(TcpTexts, States_are_named_from_1_to_12) {
  const std::array<Text, 12> names{u"Closed",      u"Listening",  u"SYN Sent",   u"SYN Recieved",
                                   u"Established", u"FIN Wait 1", u"FIN Wait 2", u"Close Wait",
                                   u"Closing",     u"Last ACK",   u"Time Wait",  u"Delete TCB"};
  for (std::uint32_t state = 1; state <= 12; ++state)
    EXPECT_EQ(modProcPort::StateName(state), names[state - 1]);
}

TEST(TcpTexts, Other_states_have_no_name) {
  for (const std::uint32_t state : {0u, 13u, 0xFFFFFFFFu}) EXPECT_EQ(modProcPort::StateName(state), u"");
}

} // namespace quendra::monitor
