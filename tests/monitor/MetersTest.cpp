#include "monitor/MonitorFixture.h"

namespace quendra::monitor {

namespace {

struct Meters : MonitorFixture {
  Text Upload() { return controls.table.main_lblUpload.Caption(); }
  Text Download() { return controls.table.main_lblDownload.Caption(); }
};

} // namespace

TEST_F(Meters, An_empty_table_gives_both_meters_a_plain_zero) {
  Pass();
  EXPECT_EQ(Upload(), u"0.0");
  EXPECT_EQ(Download(), u"0.0");
}

TEST_F(Meters, A_pass_with_new_rows_alone_gives_both_meters_a_plain_zero) {
  AddProcesses({10, 20});
  Pass();
  EXPECT_EQ(Upload(), u"0.0");
  EXPECT_EQ(Download(), u"0.0");
}

TEST_F(Meters, The_meters_show_the_sums_of_the_rates_in_the_upload_format) {
  AddProcesses({10, 20});
  Pass();
  Charge(10, 1.25, 3);
  Charge(20, 2.25, 120.4);
  Pass();
  EXPECT_EQ(Upload(), u"03.50");
  EXPECT_EQ(Download(), u"123.40");
}

TEST_F(Meters, A_rate_of_exactly_1_kilobyte_a_second_reads_01_00_in_the_meter) {
  AddProcesses({10});
  Pass();
  Charge(10, 1, 1);
  Pass();
  EXPECT_EQ(Upload(), u"01.00");
  EXPECT_EQ(Download(), u"01.00");
}

TEST_F(Meters, Each_pass_begins_its_sums_at_zero) {
  AddProcesses({10});
  Pass();
  Charge(10, 5, 5);
  Pass();
  Pass();
  EXPECT_EQ(Upload(), u"0.0");
  EXPECT_EQ(Download(), u"0.0");
}

TEST_F(Meters, A_dead_row_counts_in_no_sum) {
  AddProcesses({10, 20});
  Pass();
  Charge(10, 5, 5);
  machine.EndProcess(10);
  Pass();
  EXPECT_EQ(Upload(), u"0.0");
}

TEST_F(Meters, The_meters_keep_their_figures_while_no_pass_runs) {
  AddProcesses({10});
  Pass();
  Charge(10, 5, 5);
  Pass();
  machine.AdvanceTick(600000);
  EXPECT_EQ(Upload(), u"05.00");
}

} // namespace quendra::monitor
