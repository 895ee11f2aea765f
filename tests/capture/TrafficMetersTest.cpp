#include "capture/CaptureProgram.h"

namespace quendra::capture {
namespace {

/// From frames to the two meters. The table holds process 1 with port 1025, of an earlier pass.
struct TrafficMeters : CaptureProgram {
  TrafficMeters() {
    StartCapture();
    machine.AddProcess({1, 0, "client", ""});
    AddRow(1, u".1025.");
  }
  /// A frame of a port that no row holds: it brings a pass and adds nothing.
  void LetPassCome(std::uint32_t afterMilliseconds) {
    machine.AdvanceTick(afterMilliseconds);
    Receive({Outgoing(999)});
  }
  const Text& UploadMeter() const { return form.table.main_lblUpload.Caption(); }
  const Text& DownloadMeter() const { return form.table.main_lblDownload.Caption(); }
};

TEST_F(TrafficMeters, One_kilobyte_a_second_reads_01_00) {
  Receive({Outgoing(1025, 1024)});
  LetPassCome(1000);
  EXPECT_EQ(UploadMeter(), u"01.00");
  EXPECT_EQ(DownloadMeter(), u"0.0");
}

TEST_F(TrafficMeters, Each_direction_has_its_own_meter) {
  Receive({Outgoing(1025, 3584), Incoming(1025, 512)});
  LetPassCome(1000);
  EXPECT_EQ(UploadMeter(), u"03.50");
  EXPECT_EQ(DownloadMeter(), u"00.50");
}

TEST_F(TrafficMeters, Traffic_of_ports_that_stand_in_no_row_is_not_in_them) {
  Receive({Outgoing(2000), Incoming(2000)});
  LetPassCome(1000);
  EXPECT_EQ(UploadMeter(), u"0.0");
  EXPECT_EQ(DownloadMeter(), u"0.0");
}

TEST_F(TrafficMeters, Udp_is_not_in_them) {
  TestFrame udp;
  udp.protocol = 17;
  machine.Deliver(udp.Build());
  LetPassCome(1000);
  machine.SignalPackets();
  EXPECT_EQ(UploadMeter(), u"0.0");
}

TEST_F(TrafficMeters, A_burst_after_a_silence_is_spread_over_the_silent_time) {
  machine.AdvanceTick(10000);
  machine.Deliver(Outgoing(1025, 10240));
  machine.SignalPackets();
  EXPECT_EQ(UploadMeter(), u"01.00");
}

TEST_F(TrafficMeters, On_a_silent_line_the_last_figures_stay) {
  Receive({Outgoing(1025, 1024)});
  LetPassCome(1000);
  machine.AdvanceTick(3600000);
  Receive({Udp()});
  EXPECT_EQ(UploadMeter(), u"01.00");
}

TEST_F(TrafficMeters, The_next_pass_without_traffic_brings_them_back_to_0) {
  Receive({Outgoing(1025, 1024)});
  LetPassCome(1000);
  LetPassCome(1000);
  EXPECT_EQ(UploadMeter(), u"0.0");
}

TEST_F(TrafficMeters, A_pass_with_new_rows_only_reads_0) {
  form.main_ListView1.Clear();
  LetPassCome(1000);
  EXPECT_EQ(form.main_ListView1.Count(), 1);
  EXPECT_EQ(UploadMeter(), u"0.0");
  EXPECT_EQ(DownloadMeter(), u"0.0");
}

TEST_F(TrafficMeters, An_empty_table_reads_0) {
  form.main_ListView1.Clear();
  machine.EndProcess(1);
  LetPassCome(1000);
  EXPECT_EQ(form.main_ListView1.Count(), 0);
  EXPECT_EQ(UploadMeter(), u"0.0");
  EXPECT_EQ(DownloadMeter(), u"0.0");
}

TEST_F(TrafficMeters, A_very_small_sum_reads_00_00_and_not_0_0) {
  Receive({Outgoing(1025, 40)});
  LetPassCome(60000);
  EXPECT_EQ(UploadMeter(), u"00.00");
}

TEST_F(TrafficMeters, A_large_sum_keeps_all_its_digits) {
  form.main_ListView1.Row(1).CellTag(monitor::kUploadCell) = 100000.5;
  LetPassCome(1000);
  EXPECT_EQ(UploadMeter(), u"100000.50");
}

} // namespace
} // namespace quendra::capture
