#include "monitor/ProcessRow.h"
#include "report/live/LiveFixture.h"

namespace quendra::report {
namespace {

class StandIn : public LiveReportTest {
 protected:
  std::unique_ptr<Peer> Start(int megabytes = 4) {
    auto peer = std::make_unique<Peer>(std::vector<std::string>{
        "python3", QUENDRA_SOURCE_DIR "/tests/standins/support_server.py", "80", "--reports",
        folder + "/reports", "--seconds", "60", "--megabytes", std::to_string(megabytes)});
    EXPECT_EQ(peer->FirstLine(), "80");
    return peer;
  }
  std::string Kept(const std::string& name) const { return ContentOf(folder + "/reports/" + name); }
  static constexpr std::int32_t kEnough = 8 << 20;
  /// The whole load may come in one turn of the loop, so what is to happen in its middle is done right after
  /// the event that tells of so many bytes.
  void WhenLoaded(std::int32_t bytes, std::function<void()> action) {
    loaded = false;
    auto& arrival = program->supportExchange.Sockets()->Events.DataArrival;
    arrival = [this, bytes, action = std::move(action), handler = arrival](const Variant& index,
                                                                           std::int32_t total) {
      handler(index, total);
      if (loaded || total < bytes) return;
      loaded = true;
      waitingThen = total;
      action();
    };
  }
  bool loaded = false;
  std::int32_t waitingThen = 0;
  std::int32_t Waiting() { return program->supportExchange.Sockets()->BytesReceived(std::int16_t{4}); }
};

TEST_F(StandIn, A_click_shows_a_number_posts_the_table_and_shows_the_success) {
  const auto server = Start();
  OpenPage();

  ASSERT_TRUE(ClickAndAwaitBoxes(2));

  EXPECT_EQ(desktop.Boxes[0].text, kNumberIs + u"1001");
  EXPECT_EQ(desktop.Boxes[1].text, kSuccess);
}

TEST_F(StandIn, The_servers_copy_is_the_table_at_that_moment_byte_for_byte) {
  const auto server = Start();
  OpenPage();

  ASSERT_TRUE(ClickAndAwaitBoxes(2));

  const std::string copy = Kept("00001.body");
  EXPECT_EQ(copy, bodySent);
  EXPECT_EQ(copy.rfind("id=1001&procs=", 0), 0u);
  EXPECT_NE(copy.find("|report_live_test|"), std::string::npos) << "this process has no row";
  EXPECT_NE(Kept("00001.head").find("\r\nContent-Length: " + std::to_string(copy.size()) + "\r\n"),
            std::string::npos);
}

TEST_F(StandIn, Each_exchange_gets_a_number_of_its_own) {
  const auto server = Start();
  OpenPage();

  for (std::size_t round = 0; round < 3; ++round) {
    ASSERT_TRUE(ClickAndAwaitBoxes(2 * round + 2));
    ASSERT_TRUE(Await([&] { return StateOf(2) == foundation::sckClosed; }));

    EXPECT_EQ(desktop.Boxes[2 * round].text,
              kNumberIs + DecimalText(static_cast<std::int64_t>(1001 + round)));
    EXPECT_EQ(desktop.Boxes[2 * round + 1].text, kSuccess);
  }
  EXPECT_EQ(Kept("00003.body").rfind("id=1003&procs=", 0), 0u);
}

TEST_F(StandIn, Without_a_server_the_click_shows_that_the_connection_was_refused) {
  OpenPage();

  ASSERT_TRUE(ClickAndAwaitBoxes(1));

  EXPECT_EQ(desktop.Boxes[0].text, u"winsock error: 10061 - Connection refused.");
  EXPECT_EQ(desktop.Boxes[0].title, u"Quendra");
}

TEST_F(StandIn, The_load_gathers_in_the_buffer_until_its_stop) {
  const auto server = Start(64);
  OpenPage();
  WhenLoaded(kEnough, [&] { desktop.DoubleClick(program->monitorPage.table.main_Label2); });

  desktop.DoubleClick(program->monitorPage.table.main_Label3);

  ASSERT_TRUE(Await([&] { return loaded; }));
  EXPECT_GE(waitingThen, kEnough);
  EXPECT_EQ(Waiting(), 0);
  EXPECT_EQ(StateOf(4), foundation::sckClosed);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(StandIn, The_capture_sees_the_load_and_moves_a_meter) {
  const auto server = Start(64);
  OpenPage();
  const auto load = [&] {
    WhenLoaded(kEnough, [&] { desktop.DoubleClick(program->monitorPage.table.main_Label2); });
    desktop.DoubleClick(program->monitorPage.table.main_Label3);
    ASSERT_TRUE(Await([&] { return loaded; }));
  };

  load();
  // Passes are a second apart and come with packets.
  desktop.WaitFor([] { return false; }, 1100);
  load();

  EXPECT_TRUE(Await([&] {
    const auto rate = [](const forms::Label& meter) { return std::stod(ToUtf8(meter.Caption())); };
    return rate(program->monitorPage.table.main_lblUpload) +
               rate(program->monitorPage.table.main_lblDownload) >
           1000;
  })) << ToUtf8(program->monitorPage.table.main_lblUpload.Caption())
      << " up, " << ToUtf8(program->monitorPage.table.main_lblDownload.Caption()) << " down";
}

TEST_F(StandIn, A_load_that_the_server_ends_closes_its_socket) {
  const auto server = Start(4);
  OpenPage();
  WhenLoaded(4 << 20, [] {});

  desktop.DoubleClick(program->monitorPage.table.main_Label3);

  ASSERT_TRUE(Await([&] { return loaded && StateOf(4) == foundation::sckClosed; }));
  EXPECT_EQ(Waiting(), 0);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(StandIn, Leaving_the_page_in_the_middle_of_a_load_closes_every_socket) {
  const auto server = Start(64);
  OpenPage();
  WhenLoaded(kEnough, [&] { desktop.Click(program->frmMenu.lblCaption[2]); });

  desktop.DoubleClick(program->monitorPage.table.main_Label3);

  ASSERT_TRUE(Await([&] { return loaded; }));
  EXPECT_EQ(program->supportExchange.Sockets(), nullptr);
  EXPECT_TRUE(desktop.Boxes.empty());
  EXPECT_FALSE(desktop.Ended);
}

} // namespace
} // namespace quendra::report
