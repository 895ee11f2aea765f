#include "platform/windows/capture/WpcapSession.h"

#include "forms/headless/HeadlessDesktop.h"
#include "integration/Packets.h"
#include "platform/windows/capture/StandInWpcapFixture.h"

#include <gtest/gtest.h>

namespace quendra::platform::windows {

namespace {

class WpcapSessionTest : public testing::Test {
 protected:
  WpcapSessionTest() { wpcap.script.devices.push_back({.name = "line", .description = ""}); }

  std::unique_ptr<WpcapSession> Open() { return WpcapSession::Open(library, desktop, "line", shaper); }
  standins::WpcapScript::Device& Line() { return wpcap.script.devices.front(); }

  StandInWpcap wpcap;
  const WpcapLibrary library = StandInWpcap::Library();
  forms::headless::HeadlessDesktop desktop;
  FrameQueue queue;
  FrameShaper shaper{queue};
};

TEST(WpcapLibraryTest, It_is_looked_for_in_the_systems_folder_and_one_below_that_and_nowhere_else) {
  const Text folder = winapi::SystemFolder();
  ASSERT_FALSE(folder.empty());
  EXPECT_EQ(WpcapLibrary::UsualPaths(),
            (std::vector<Text>{folder + u"\\wpcap.dll", folder + u"\\Npcap\\wpcap.dll"}));
}

TEST_F(WpcapSessionTest, The_first_library_that_is_there_and_has_every_function_is_taken) {
  const Text folder = winapi::SystemFolder();
  EXPECT_FALSE(WpcapLibrary(std::vector{folder + u"\\no-such.dll", folder + u"\\kernel32.dll"}).IsThere());
  const WpcapLibrary found(
      std::vector{folder + u"\\no-such.dll", folder + u"\\kernel32.dll", StandInWpcap::Path()});
  EXPECT_TRUE(found.IsThere());
  EXPECT_NE(found.dispatch, nullptr);
}

TEST_F(WpcapSessionTest, A_capture_takes_the_own_traffic_alone_cut_filtered_and_without_waiting) {
  const auto session = Open();
  ASSERT_TRUE(session);
  EXPECT_EQ(Line().promiscuous, 0);
  EXPECT_EQ(Line().snapshot, static_cast<int>(FrameShaper::kMostBytes));
  EXPECT_EQ(Line().filter, CaptureFilterOf(LinkForm::Ethernet));
  EXPECT_GE(Line().bufferBytes, 1 << 20);
  EXPECT_TRUE(Line().isNonBlocking);
}

TEST_F(WpcapSessionTest, Frames_come_into_the_queue_with_their_times_and_lengths) {
  const auto session = Open();
  const auto frame = integration::TcpFrame(1025, 80, 500);
  Line().waiting.push_back(frame);
  EXPECT_EQ(session->Fill(), 1);
  const FrameRecord* record = queue.Pop();
  ASSERT_TRUE(record);
  EXPECT_EQ(record->seconds, 1000u);
  EXPECT_EQ(record->microseconds, 500u);
  EXPECT_EQ(record->wire, frame.size());
  EXPECT_TRUE(std::equal(record->bytes.begin(), record->bytes.end(), frame.begin()));
  EXPECT_EQ(session->Fill(), 0);
}

TEST_F(WpcapSessionTest, A_batch_is_all_that_is_taken_at_a_time) {
  const auto session = Open();
  for (int i = 0; i <= FrameSource::kBatch; ++i) Line().waiting.push_back(integration::TcpFrame(1025, 80));
  EXPECT_EQ(session->Fill(), FrameSource::kBatch);
  EXPECT_EQ(session->Fill(), 1);
}

TEST_F(WpcapSessionTest, A_link_whose_packets_can_not_be_shown_is_closed_again) {
  Line().linkType = 105;
  EXPECT_FALSE(Open());
  EXPECT_EQ(Line().open, 0);
}

TEST_F(WpcapSessionTest, An_adapter_that_can_not_be_opened_has_no_source) {
  Line().canBeOpened = false;
  EXPECT_FALSE(Open());
}

TEST_F(WpcapSessionTest, A_packet_of_a_dialled_line_gets_an_Ethernet_header) {
  Line().linkType = link_type::kRawIp;
  const auto session = Open();
  Line().waiting.push_back(integration::Ipv4Packet(6, "10.9.0.2", 1025, "10.9.0.1", 80, 40));
  EXPECT_EQ(session->Fill(), 1);
  const FrameRecord* record = queue.Pop();
  ASSERT_TRUE(record);
  EXPECT_EQ(record->bytes[12], 0x08);
  EXPECT_EQ(record->bytes[14], 0x45);
}

TEST_F(WpcapSessionTest, A_capture_that_fails_says_so_and_counts_what_was_dropped) {
  const auto session = Open();
  Line().dropped = 17;
  EXPECT_EQ(session->Dropped(), 17u);
  Line().fails = true;
  EXPECT_LT(session->Fill(), 0);
}

TEST_F(WpcapSessionTest, The_line_is_looked_at_by_a_timer_until_nobody_wants_it) {
  const auto session = Open();
  int looks = 0;
  auto watch = session->Watch([&] { ++looks; });
  desktop.Advance(10 * WpcapSession::kWatchMilliseconds);
  EXPECT_EQ(looks, 10);
  watch.reset();
  desktop.Advance(10 * WpcapSession::kWatchMilliseconds);
  EXPECT_EQ(looks, 10);
}

TEST_F(WpcapSessionTest, A_capture_ends_with_its_session) {
  auto session = Open();
  EXPECT_EQ(Line().open, 1);
  session.reset();
  EXPECT_EQ(Line().open, 0);
}

} // namespace

} // namespace quendra::platform::windows
