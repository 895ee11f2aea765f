#include "monitor/Rates.h"

#include "monitor/MonitorControls.h"
#include "monitor/ProcessRow.h"

#include <gtest/gtest.h>

namespace quendra::monitor {

namespace {

struct Rates : testing::Test {
  MonitorControls controls;
  forms::ListRow& row = AddBareRow(controls.main_ListView1, u"p1");
  TrafficSums sums;

  void Totals(double upload, double download) {
    row.CellTag(kUploadCell) = upload;
    row.CellTag(kDownloadCell) = download;
  }
};

} // namespace

TEST_F(Rates, The_upload_is_what_came_since_the_pass_before_by_the_seconds_between) {
  Totals(30, 0);
  row.CellTag(kPreviousUploadCell) = 23.0;
  UpdateRates(row, 2, sums);
  EXPECT_EQ(row.CellText(kUploadCell), u"03.50");
}

TEST_F(Rates, The_download_pads_to_three_places) {
  Totals(0, 7);
  UpdateRates(row, 2, sums);
  EXPECT_EQ(row.CellText(kDownloadCell), u"003.50");
}

TEST_F(Rates, The_total_is_the_sum_of_both_rates_and_pads_to_one_place) {
  Totals(3, 4);
  UpdateRates(row, 2, sums);
  EXPECT_EQ(row.CellText(kTotalCell), u"3.50");
}

TEST_F(Rates, Digits_beyond_a_format_stay) {
  Totals(123456.789, 2345678.25);
  UpdateRates(row, 1, sums);
  EXPECT_EQ(row.CellText(kUploadCell), u"123456.79");
  EXPECT_EQ(row.CellText(kDownloadCell), u"2345678.25");
  EXPECT_EQ(row.CellText(kTotalCell), u"2469135.04");
}

TEST_F(Rates, A_rate_too_small_for_the_format_reads_as_zeros_and_not_as_empty) {
  Totals(0.004, 0.004);
  UpdateRates(row, 1, sums);
  EXPECT_EQ(row.CellText(kUploadCell), u"00.00");
  EXPECT_EQ(row.CellText(kDownloadCell), u"000.00");
  EXPECT_EQ(row.CellText(kTotalCell), u"0.01");
}

TEST_F(Rates, A_row_whose_totals_have_not_moved_shows_three_empty_cells) {
  ASSERT_EQ(row.CellText(kUploadCell), u"0");
  UpdateRates(row, 1, sums);
  EXPECT_EQ(row.CellText(kUploadCell), u"");
  EXPECT_EQ(row.CellText(kDownloadCell), u"");
  EXPECT_EQ(row.CellText(kTotalCell), u"");
}

TEST_F(Rates, The_hidden_overall_cell_keeps_its_first_text) {
  Totals(5, 5);
  UpdateRates(row, 1, sums);
  EXPECT_EQ(row.CellText(kOverallCell), u"0");
}

TEST_F(Rates, The_totals_become_those_of_the_previous_pass) {
  Totals(5.25, 7.5);
  UpdateRates(row, 1, sums);
  EXPECT_EQ(row.CellTag(kPreviousUploadCell), Variant(5.25));
  EXPECT_EQ(row.CellTag(kPreviousDownloadCell), Variant(7.5));
  EXPECT_EQ(row.CellTag(kUploadCell), Variant(5.25));
  EXPECT_EQ(row.CellTag(kDownloadCell), Variant(7.5));
}

TEST_F(Rates, Both_rates_are_added_to_their_sums) {
  sums = {1, 2};
  Totals(5, 8);
  UpdateRates(row, 2, sums);
  EXPECT_DOUBLE_EQ(sums.upload, 3.5);
  EXPECT_DOUBLE_EQ(sums.download, 6);
}

TEST_F(Rates, A_rate_below_zero_leaves_its_cell_empty_but_counts_in_the_sums) {
  Totals(-3, 1);
  UpdateRates(row, 2, sums);
  EXPECT_EQ(row.CellText(kUploadCell), u"");
  EXPECT_EQ(row.CellText(kDownloadCell), u"000.50");
  EXPECT_DOUBLE_EQ(sums.upload, -1.5);
}

TEST_F(Rates, A_total_below_zero_is_shown_because_it_is_not_zero) {
  Totals(-3, 1);
  UpdateRates(row, 2, sums);
  EXPECT_EQ(row.CellText(kTotalCell), u"-1.00");
}

TEST_F(Rates, Two_rates_that_cancel_out_leave_the_total_empty) {
  Totals(-3, 3);
  UpdateRates(row, 2, sums);
  EXPECT_EQ(row.CellText(kTotalCell), u"");
}

TEST_F(Rates, A_total_kept_as_text_counts_as_its_number) {
  row.CellTag(kUploadCell) = u"2.5";
  UpdateRates(row, 1, sums);
  EXPECT_EQ(row.CellText(kUploadCell), u"02.50");
}

struct MeterCase {
  double sum;
  const char16_t* text;
};

struct Meter : testing::TestWithParam<MeterCase> {};

TEST_P(Meter, Shows_a_sum_above_zero_in_its_format_and_any_other_as_a_plain_zero) {
  EXPECT_EQ(MeterText(GetParam().sum), GetParam().text);
}

INSTANTIATE_TEST_SUITE_P(Sums, Meter,
                         testing::Values(MeterCase{0, u"0.0"}, MeterCase{-0.5, u"0.0"},
                                         MeterCase{3.5, u"03.50"}, MeterCase{123.4, u"123.40"},
                                         MeterCase{0.004, u"00.00"}, MeterCase{0.005, u"00.01"},
                                         MeterCase{1, u"01.00"}, MeterCase{99.999, u"100.00"},
                                         MeterCase{100000.5, u"100000.50"}));

TEST(MeterText, A_rate_of_exactly_1_kilobyte_a_second_reads_01_00) { EXPECT_EQ(MeterText(1), u"01.00"); }

TEST(MeterText, A_sum_of_100000_5_is_not_cut) { EXPECT_EQ(MeterText(100000.5), u"100000.50"); }

TEST(MeterText, A_very_small_sum_reads_00_00_and_not_as_a_silent_line) {
  EXPECT_EQ(MeterText(0.004), u"00.00");
}

} // namespace quendra::monitor
