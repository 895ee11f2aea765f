#include "monitor/ProcessTableFixture.h"
#include "runtime/Format.h"

namespace quendra::monitor {

// The elapsed time.

TEST_F(ProcessTableTest, A_rate_is_by_the_seconds_since_the_last_refresh) {
  AddProcesses({10});
  Pass();
  Charge(10, 9, 6);
  Pass(1500);
  EXPECT_EQ(CellOf(10, kUploadCell), u"06.00");
  EXPECT_EQ(CellOf(10, kDownloadCell), u"004.00");
  EXPECT_EQ(CellOf(10, kTotalCell), u"10.00");
}

TEST_F(ProcessTableTest, A_burst_after_a_silence_is_spread_over_the_whole_silence) {
  AddProcesses({10});
  Pass();
  Charge(10, 600, 0);
  Pass(60000);
  EXPECT_EQ(CellOf(10, kUploadCell), u"10.00");
}

TEST_F(ProcessTableTest, The_seconds_run_on_where_the_signed_tick_wraps) {
  AddProcesses({10});
  machine.SetTick(0x7FFFFF00);
  Pass(0);
  Charge(10, 2, 0);
  Pass(1000);
  EXPECT_EQ(CellOf(10, kUploadCell), u"02.00");
}

TEST_F(ProcessTableTest, The_seconds_run_on_where_the_tick_starts_over) {
  AddProcesses({10});
  machine.SetTick(0xFFFFFF00);
  Pass(0);
  Charge(10, 2, 0);
  Pass(1000);
  EXPECT_EQ(CellOf(10, kUploadCell), u"02.00");
}

TEST_F(ProcessTableTest, The_seconds_are_right_while_the_signed_tick_is_below_zero) {
  AddProcesses({10});
  machine.SetTick(0x90000000);
  Pass(0);
  Charge(10, 2, 0);
  Pass(1000);
  EXPECT_EQ(CellOf(10, kUploadCell), u"02.00");
}

TEST_F(ProcessTableTest, The_seconds_since_the_day_number_are_positive_at_any_uptime) {
  AddProcesses({10});
  constexpr std::uint32_t kDay = 24 * 60 * 60 * 1000;
  for (const std::uint32_t day : {1u, 24u, 25u, 30u, 49u}) {
    machine.SetTick(day * kDay);
    Pass(0);
    Charge(10, 1024 * 1024, 0);
    table.LastRefreshTick = machine.system.DayNumber();
    table.RefreshProcessTable(u"");
    const double rate = 1024.0 * 1024 / (day * 86400.0 - machine.system.DayNumber() / 1000.0);
    EXPECT_EQ(CellOf(10, kUploadCell), Format(rate, u"###00.00")) << day;
  }
}

TEST_F(ProcessTableTest, A_pass_at_the_tick_of_the_last_refresh_divides_traffic_by_zero) {
  AddProcesses({10});
  Pass();
  Charge(10, 2, 0);
  EXPECT_EQ(FaultNumberOf([&] { Pass(0); }), Fault::kDivision);
  EXPECT_EQ(machine.processes.OpenHandles(), 0);
}

TEST_F(ProcessTableTest, A_pass_at_the_tick_of_the_last_refresh_divides_silence_by_zero_as_an_overflow) {
  AddProcesses({10});
  Pass();
  EXPECT_EQ(FaultNumberOf([&] { Pass(0); }), Fault::kOverflow);
}

TEST_F(ProcessTableTest, A_pass_of_new_rows_alone_divides_nothing) {
  AddProcesses({10});
  EXPECT_EQ(FaultNumberOf([&] { Pass(0); }), 0);
}

TEST_F(ProcessTableTest, The_pass_never_stores_the_tick_itself) {
  table.LastRefreshTick = 77;
  table.RefreshProcessTable(u"");
  EXPECT_EQ(table.LastRefreshTick, 77);
}

TEST_F(ProcessTableTest, The_day_number_that_the_first_pass_measures_from_does_no_harm) {
  AddProcesses({10});
  table.LastRefreshTick = machine.system.DayNumber();
  table.RefreshProcessTable(u"");
  EXPECT_EQ(CellOf(10, kUploadCell), u"0");
  EXPECT_EQ(controls.table.main_lblUpload.Caption(), u"0.0");
  EXPECT_EQ(controls.table.main_lblDownload.Caption(), u"0.0");
}

TEST_F(ProcessTableTest, The_reason_of_a_pass_is_ignored) {
  AddProcesses({10});
  table.RefreshProcessTable(u"anything");
  EXPECT_TRUE(HasRow(10));
}

// The snapshot.

TEST_F(ProcessTableTest, Rows_come_in_snapshot_order) {
  AddProcesses({30, 10, 20});
  Pass();
  EXPECT_EQ(Order(), (Ids{30, 10, 20}));
}

TEST_F(ProcessTableTest, The_snapshot_is_closed_before_the_ports_are_merged) {
  AddProcesses({10});
  machine.AddConnection({2, "0.0.0.0", 80, "0.0.0.0", 0, 10});
  int openWhileYielding = -1;
  desktop.OnYield = [&] { openWhileYielding = machine.processes.OpenHandles(); };
  Pass();
  EXPECT_EQ(openWhileYielding, 0);
}

TEST_F(ProcessTableTest, A_failed_snapshot_clears_the_marks_and_touches_nothing_else) {
  AddProcesses({10, 20});
  Pass();
  Charge(10, 2, 2);
  list.Sort(0, forms::SortOrder::Ascending);
  controls.table.main_lblUpload.Caption = Text(u"33.00");
  machine.processes.FailSnapshots = true;
  Pass();
  EXPECT_TRUE(Row(10).CellTag(kApplicationCell).IsEmpty());
  EXPECT_EQ(CellOf(10, kUploadCell), u"0");
  EXPECT_EQ(list.Count(), 2);
  EXPECT_EQ(controls.table.main_lblUpload.Caption(), u"33.00");
  EXPECT_EQ(list.SortKey(), 0);
  EXPECT_EQ(machine.ipHelper.TablesFetched, 1);
}

TEST_F(ProcessTableTest, The_pass_after_a_failed_snapshot_repairs_the_marks) {
  AddProcesses({10, 20});
  Pass();
  machine.processes.FailSnapshots = true;
  Pass();
  machine.processes.FailSnapshots = false;
  Pass();
  EXPECT_EQ(Row(10).CellTag(kApplicationCell), Variant(u"1"));
  EXPECT_EQ(Row(20).CellTag(kApplicationCell), Variant(u"1"));
}

TEST_F(ProcessTableTest, A_process_that_the_snapshot_lists_twice_has_one_row) {
  AddProcesses({10, 10});
  Pass();
  EXPECT_EQ(list.Count(), 1);
}

TEST_F(ProcessTableTest, A_process_id_of_32_bits_has_a_row) {
  AddProcesses({4194304, 0xFFFFFFF0});
  Pass();
  EXPECT_TRUE(HasRow(4194304));
  EXPECT_TRUE(HasRow(0xFFFFFFF0));
}

TEST_F(ProcessTableTest, A_process_id_that_comes_back_between_two_passes_keeps_the_old_row) {
  machine.AddProcess({10, 9999, "old.exe", ""});
  Pass();
  Charge(10, 5, 0);
  machine.EndProcess(10);
  machine.AddProcess({10, 9999, "new.exe", ""});
  Pass();
  EXPECT_EQ(CellOf(10, kNameCell), u"old.exe");
  EXPECT_EQ(Row(10).CellTag(kUploadCell), Variant(5.0));
}

TEST_F(ProcessTableTest, A_pass_shows_no_message_and_does_not_yield_without_connections) {
  AddProcesses({10});
  Pass();
  Pass();
  EXPECT_TRUE(desktop.Boxes.empty());
  EXPECT_EQ(desktop.YieldCount, 0);
}

// Versions.

TEST_F(ProcessTableTest, The_version_with_a_tcp_owner_table_fills_the_ports_of_a_new_row_in_the_same_pass) {
  AddProcesses({10});
  machine.AddConnection({2, "0.0.0.0", 80, "0.0.0.0", 0, 10});
  Pass();
  EXPECT_EQ(PortsOf(10), u".80.");
}

TEST_F(ProcessTableTest, The_ports_only_ever_grow) {
  AddProcesses({10});
  machine.AddConnection({2, "0.0.0.0", 80, "0.0.0.0", 0, 10});
  Pass();
  machine.ipHelper.Connections = {{2, "0.0.0.0", 443, "0.0.0.0", 0, 10}};
  Pass();
  EXPECT_EQ(PortsOf(10), u".80.443.");
}

TEST_F(ProcessTableTest, A_failed_fetch_leaves_the_previous_table_to_be_walked_again) {
  AddProcesses({10});
  machine.AddConnection({2, "0.0.0.0", 80, "0.0.0.0", 0, 20});
  Pass();
  AddProcesses({20});
  machine.ipHelper.TableError = 50;
  Pass();
  EXPECT_EQ(PortsOf(20), u".80.");
}

struct OtherVersions : ProcessTableTest, testing::WithParamInterface<std::int32_t> {};

TEST_P(OtherVersions, Leave_the_ports_cells_empty) {
  version.OsVersionCode = GetParam();
  AddProcesses({10});
  machine.AddConnection({2, "0.0.0.0", 80, "0.0.0.0", 0, 10});
  machine.AddHandle({10, 4, u"\\Device\\Tcp", 80});
  Pass();
  Pass();
  EXPECT_EQ(PortsOf(10), u"");
  EXPECT_EQ(machine.ipHelper.TablesFetched, 0);
  EXPECT_TRUE(machine.handles.TableQueries.empty());
}

INSTANTIATE_TEST_SUITE_P(Codes, OtherVersions, testing::Values(0, 32, 95, 98, 351, 40));

// Events that arrive while the ports are merged.

TEST_F(ProcessTableTest, A_pass_that_starts_while_another_yields_runs_to_its_end_and_so_does_the_other) {
  AddProcesses({10, 20});
  machine.AddConnection({2, "0.0.0.0", 80, "0.0.0.0", 0, 10});
  machine.AddConnection({2, "0.0.0.0", 443, "0.0.0.0", 0, 20});
  desktop.OnYield = [&, once = false]() mutable {
    if (std::exchange(once, true)) return;
    AddProcesses({30});
    machine.AddConnection({2, "0.0.0.0", 25, "0.0.0.0", 0, 30});
    machine.AdvanceTick(1000);
    table.RefreshProcessTable(u"");
  };
  Pass();
  EXPECT_EQ(PortsOf(10), u".80.");
  EXPECT_EQ(PortsOf(20), u".443.");
  EXPECT_EQ(PortsOf(30), u".25.");
  EXPECT_EQ(machine.processes.OpenHandles(), 0);
}

TEST_F(ProcessTableTest, The_end_of_the_program_while_a_pass_yields_unwinds_it) {
  AddProcesses({10});
  machine.AddConnection({2, "0.0.0.0", 80, "0.0.0.0", 0, 10});
  desktop.OnYield = [&] { desktop.End(0); };
  EXPECT_THROW(Pass(), forms::ProgramEnded);
  EXPECT_EQ(machine.processes.OpenHandles(), 0);
}

} // namespace quendra::monitor
