#include "monitor/MonitorFixture.h"

#include "runtime/Settings.h"

namespace quendra::monitor {

namespace {

/// A sweep that is armed, which the program never does.
struct Sweep : MonitorFixture {
  Sweep() {
    procPort.ConnectionDeleteEnabled = kTrue16;
    procPort.SystemPidsLoaded = kTrue16;
    fileInfo.ServicesPid = 900;
    fileInfo.SystemPids = {901, 902, 903, 904, 905};
    fileInfo.OwnPid = 906;
    for (std::uint32_t id = 900; id <= 910; ++id) machine.AddProcess({id, 1, "a.exe", "C:\\a.exe"});
  }
  void Connect(std::uint32_t owner, std::uint16_t localPort = 1025, const std::string& remote = "10.0.0.9",
               const std::string& local = "10.0.0.1") {
    machine.AddConnection({5, local, localPort, remote, 80, owner});
  }
  bool FetchAndSweep() {
    procPort.FetchTcpOwnerTable();
    return procPort.SweepConnections();
  }
  std::size_t Deleted() { return machine.ipHelper.Deleted.size(); }
  /// With a foreign connection on either side.
  void ExpectTheWalkToEndHere(const platform::simulated::Connection& connection) {
    machine.ipHelper.Connections.clear();
    machine.ipHelper.Deleted.clear();
    Connect(910);
    machine.AddConnection(connection);
    Connect(910);
    EXPECT_TRUE(FetchAndSweep());
    EXPECT_EQ(Deleted(), 1u);
  }
};

} // namespace

TEST_F(Sweep, Deletes_the_connections_of_foreign_processes) {
  Connect(910);
  Connect(909);
  EXPECT_TRUE(FetchAndSweep());
  EXPECT_EQ(Deleted(), 2u);
}

TEST_F(Sweep, Passes_over_entries_without_remote_side_and_local_port) {
  machine.AddConnection({2, "0.0.0.0", 0, "0.0.0.0", 0, 0});
  Connect(910);
  FetchAndSweep();
  EXPECT_EQ(Deleted(), 1u);
}

TEST_F(Sweep, Ends_at_an_owner_without_a_module_path) {
  machine.AddProcess({950, 1, "b.exe", ""});
  ExpectTheWalkToEndHere({5, "10.0.0.1", 1025, "10.0.0.9", 80, 950});
}

TEST_F(Sweep, Ends_at_a_remote_address_of_zeros) {
  ExpectTheWalkToEndHere({2, "10.0.0.1", 1025, "0.0.0.0", 0, 910});
}

TEST_F(Sweep, Ends_at_the_remote_address_of_everybody) {
  ExpectTheWalkToEndHere({5, "10.0.0.1", 1025, "255.255.255.255", 80, 910});
}

TEST_F(Sweep, Ends_at_the_exempt_remote_address) {
  ExpectTheWalkToEndHere({5, "10.0.0.1", 1025, ToUtf8(settings::ExemptConnectionAddress), 80, 910});
}

TEST_F(Sweep, Ends_at_the_exempt_local_address) {
  ExpectTheWalkToEndHere({5, ToUtf8(settings::ExemptConnectionAddress), 1025, "10.0.0.9", 80, 910});
}

TEST_F(Sweep, Ends_at_local_port_21) { ExpectTheWalkToEndHere({5, "10.0.0.1", 21, "10.0.0.9", 80, 910}); }

TEST_F(Sweep, Ends_at_an_owner_of_0) { ExpectTheWalkToEndHere({5, "10.0.0.1", 1025, "10.0.0.9", 80, 0}); }

TEST_F(Sweep, Ends_at_each_of_the_systems_own_processes) {
  for (const std::uint32_t id : fileInfo.SystemPids)
    ExpectTheWalkToEndHere({5, "10.0.0.1", 1025, "10.0.0.9", 80, id});
}

TEST_F(Sweep, Ends_at_the_programs_own_connections) {
  ExpectTheWalkToEndHere({5, "10.0.0.1", 1025, "10.0.0.9", 80, 906});
}

TEST_F(Sweep, Leaves_every_connection_behind_the_first_that_must_stay) {
  Connect(901);
  for (int i = 0; i < 5; ++i) Connect(910);
  EXPECT_TRUE(FetchAndSweep());
  EXPECT_EQ(Deleted(), 0u);
}

TEST_F(Sweep, Yields_twice_an_entry_beside_the_deletions_own_yield) {
  Connect(910);
  Connect(910);
  FetchAndSweep();
  EXPECT_EQ(desktop.YieldCount, 2 * (2 + 1) + 2);
}

TEST_F(Sweep, Of_an_empty_table_says_no) { EXPECT_FALSE(FetchAndSweep()); }

TEST_F(Sweep, Without_a_table_says_no) { EXPECT_FALSE(procPort.SweepConnections()); }

TEST_F(Sweep, Does_not_come_back_to_an_end_by_itself) {
  Connect(901);
  Connect(910);
  FetchAndSweep();
  fileInfo.SystemPids = {1, 1, 1, 1, 1};
  EXPECT_TRUE(procPort.SweepConnections());
  EXPECT_EQ(Deleted(), 2u);
}

// One connection.

TEST_F(Sweep, A_deletion_is_a_record_of_state_12_and_the_four_fields_as_they_lie_in_memory) {
  procPort.DeleteConnection(0x0100000A, 0x0104, 0x0900000A, 0x5000);
  ASSERT_EQ(Deleted(), 1u);
  EXPECT_EQ(machine.ipHelper.Deleted[0],
            (std::array<std::uint8_t, 20>{12, 0, 0, 0, 10, 0, 0, 1, 4, 1, 0, 0, 10, 0, 0, 9, 0, 0x50, 0, 0}));
}

TEST_F(Sweep, The_record_of_an_entry_holds_its_own_fields) {
  machine.AddConnection({5, "10.0.0.1", 1025, "10.0.0.9", 80, 910});
  FetchAndSweep();
  ASSERT_EQ(Deleted(), 1u);
  EXPECT_EQ(machine.ipHelper.Deleted[0],
            (std::array<std::uint8_t, 20>{12, 0, 0, 0, 10, 0, 0, 1, 4, 1, 0, 0, 10, 0, 0, 9, 0, 80, 0, 0}));
}

TEST_F(Sweep, Deleting_stays_disarmed_in_the_program) {
  modProcPort fresh{
      machine.ipHelper, {machine.processes, machine.handles}, desktop, controls.main_ListView1, fileInfo};
  EXPECT_EQ(fresh.ConnectionDeleteEnabled, kFalse16);
  EXPECT_EQ(fresh.SystemPidsLoaded, kFalse16);
  fresh.DeleteConnection(1, 2, 3, 4);
  EXPECT_EQ(Deleted(), 0u);
  EXPECT_EQ(machine.processes.SnapshotsTaken, 0);
  EXPECT_EQ(desktop.YieldCount, 0);
}

TEST_F(Sweep, The_first_deletion_loads_the_well_known_ids_once) {
  procPort.SystemPidsLoaded = kFalse16;
  machine.AddProcess({300, 1, "services.exe", ""});
  procPort.DeleteConnection(1, 2, 3, 4);
  procPort.DeleteConnection(1, 2, 3, 4);
  EXPECT_EQ(procPort.SystemPidsLoaded, kTrue16);
  EXPECT_EQ(fileInfo.ServicesPid, 300u);
  EXPECT_EQ(machine.processes.SnapshotsTaken, 1);
}

TEST_F(Sweep, A_deletion_yields_once) {
  procPort.DeleteConnection(1, 2, 3, 4);
  EXPECT_EQ(desktop.YieldCount, 1);
}

} // namespace quendra::monitor
