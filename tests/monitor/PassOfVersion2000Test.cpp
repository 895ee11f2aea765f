#include "monitor/MonitorFixture.h"

namespace quendra::monitor {

namespace {

const char16_t* kTcp = u"\\Device\\Tcp";
const char16_t* kUdp = u"\\Device\\Udp";

/// The version whose ports come from the handles of all processes.
struct PassOfVersion2000 : MonitorFixture {
  PassOfVersion2000() {
    version.OsVersionCode = 2000;
    machine.AddProcess({10, 1, "a.exe", ""});
    machine.AddProcess({70000, 1, "b.exe", ""});
    // Two handles of no socket, so that the table never fits in the first room.
    machine.AddHandle({10, 0x900, u"", 0});
    machine.AddHandle({10, 0x904, u"", 0});
  }
};

} // namespace

TEST_F(PassOfVersion2000, A_new_row_has_its_ports_from_the_lowest_to_the_highest) {
  machine.AddHandle({10, 4, kTcp, 1025});
  machine.AddHandle({10, 8, kTcp, 80});
  machine.AddHandle({70000, 4, kTcp, 40000});
  Pass();
  EXPECT_EQ(PortsOf(10), u".80.1025.");
  EXPECT_EQ(PortsOf(70000), u".40000.");
}

TEST_F(PassOfVersion2000, A_port_over_32767_comes_out_positive_in_the_row) {
  machine.AddHandle({10, 4, kTcp, 65535});
  Pass();
  EXPECT_EQ(PortsOf(10), u".65535.");
}

TEST_F(PassOfVersion2000, Udp_ports_are_not_shown) {
  machine.AddHandle({10, 4, kUdp, 53});
  Pass();
  EXPECT_EQ(PortsOf(10), u"");
}

TEST_F(PassOfVersion2000, A_socket_opened_after_the_rows_creation_never_shows_on_it) {
  Pass();
  machine.AddHandle({10, 4, kTcp, 80});
  Pass();
  Pass();
  EXPECT_EQ(PortsOf(10), u"");
}

TEST_F(PassOfVersion2000, A_row_created_after_the_scan_has_the_ports_that_its_process_id_left_behind) {
  machine.AddHandle({70000, 4, kTcp, 80});
  Pass();
  machine.EndProcess(70000);
  table.PrepareTable();
  machine.AddProcess({70000, 1, "c.exe", ""});
  Pass();
  EXPECT_EQ(PortsOf(70000), u".80.");
}

TEST_F(PassOfVersion2000, The_tcp_owner_table_is_not_fetched) {
  Pass();
  EXPECT_EQ(machine.ipHelper.TablesFetched, 0);
}

TEST_F(PassOfVersion2000, The_debug_privilege_is_enabled_once) {
  Pass();
  Pass();
  EXPECT_EQ(machine.tokens.Adjusted, (std::vector<std::string>{"SeDebugPrivilege 2"}));
  EXPECT_EQ(ports.SeDebugEnabled, kTrue16);
}

TEST_F(PassOfVersion2000, Without_the_debug_privilege_the_scan_runs_and_no_port_is_shown) {
  machine.tokens.AdjustTokenPrivilegesError = 1300;
  machine.AddHandle({10, 4, kTcp, 80});
  Pass();
  EXPECT_EQ(procPort.PortOwnerTable[80].tcpOwner, 10);
  EXPECT_EQ(PortsOf(10), u"");
  EXPECT_EQ(ports.SeDebugEnabled, kFalse16);
}

TEST_F(PassOfVersion2000, Without_the_debug_privilege_every_pass_says_so) {
  machine.tokens.AdjustTokenPrivilegesError = 1300;
  Pass();
  machine.processes.LeaveError(0);
  Pass();
  ASSERT_EQ(desktop.Boxes.size(), 2u);
  EXPECT_EQ(desktop.Boxes[1].text, u"AdjustTokenPrivileges, Error: 1300");
}

TEST_F(PassOfVersion2000, A_privilege_enabled_elsewhere_is_not_enabled_again) {
  ports.SeDebugEnabled = kTrue16;
  Pass();
  EXPECT_TRUE(machine.tokens.Adjusted.empty());
}

TEST_F(PassOfVersion2000, A_failed_snapshot_scans_nothing) {
  machine.processes.FailSnapshots = true;
  Pass();
  EXPECT_TRUE(machine.handles.TableQueries.empty());
}

} // namespace quendra::monitor
