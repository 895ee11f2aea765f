#include "report/ReportFixture.h"

namespace quendra::report {
namespace {

class LoadDownload : public ReportTest {
 protected:
  void StartLoad() {
    LoadServer();
    OpenPage();
    ASSERT_TRUE(desktop.DoubleClick(program.monitorPage.table.main_Label3));
    Run();
    ASSERT_EQ(LoadServer().Connections.size(), 1u);
  }
  platform::simulated::SimulatedPeer& Load() { return *LoadServer().Connections.back(); }
  std::int32_t Waiting() { return program.supportExchange.Sockets()->BytesReceived(std::int16_t{4}); }
};

TEST_F(LoadDownload, A_double_click_on_the_download_caption_asks_for_the_file_byte_for_byte) {
  StartLoad();

  EXPECT_EQ(Load().Received, "GET http://" + ToUtf8(settings::SupportServerAddress) +
                                 "/files/big.zip HTTP/1.1 \r\n"
                                 "Host: " +
                                 ToUtf8(settings::RequestHostHeader) +
                                 "\r\nConnection: Close\r\nAccept: */*\r\n\r\n");
}

TEST_F(LoadDownload, The_server_is_reached_by_its_address_without_a_look_up) {
  StartLoad();

  EXPECT_EQ(machine.sockets.Count("WSAAsyncGetHostByName"), 0);
}

TEST_F(LoadDownload, What_arrives_stays_in_the_buffer) {
  StartLoad();

  Load().Send(std::string(5000, 'a'));
  Run();
  Load().Send(std::string(20'000, 'b'));
  Run();

  EXPECT_EQ(Waiting(), 25'000);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(LoadDownload, A_double_click_on_the_upload_caption_stops_it_at_once) {
  StartLoad();
  Load().Send("data");
  Run();

  EXPECT_TRUE(desktop.DoubleClick(program.monitorPage.table.main_Label2));

  EXPECT_TRUE(Load().Ended);
  EXPECT_EQ(StateOf(4), foundation::sckClosed);
  EXPECT_EQ(Waiting(), 0);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(LoadDownload, It_can_be_started_again_after_it_was_stopped) {
  StartLoad();
  desktop.DoubleClick(program.monitorPage.table.main_Label2);

  EXPECT_TRUE(desktop.DoubleClick(program.monitorPage.table.main_Label3));
  Run();

  EXPECT_EQ(LoadServer().Connections.size(), 2u);
  EXPECT_EQ(StateOf(4), foundation::sckConnected);
}

TEST_F(LoadDownload, The_servers_end_closes_the_socket_and_drops_the_data) {
  StartLoad();
  Load().Send("data");
  Load().Close();
  Run();

  EXPECT_EQ(StateOf(4), foundation::sckClosed);
  EXPECT_EQ(Waiting(), 0);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(LoadDownload, A_stop_without_a_download_does_nothing) {
  OpenPage();

  EXPECT_TRUE(desktop.DoubleClick(program.monitorPage.table.main_Label2));

  EXPECT_EQ(StateOf(4), foundation::sckClosed);
  EXPECT_TRUE(desktop.Boxes.empty());
  EXPECT_FALSE(desktop.Ended);
  EXPECT_EQ(machine.sockets.Count("closesocket"), 0);
}

TEST_F(LoadDownload, A_second_start_during_a_download_ends_the_program_with_the_run_times_message) {
  StartLoad();

  desktop.DoubleClick(program.monitorPage.table.main_Label3);

  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 1);
  EXPECT_EQ(desktop.Boxes.back().text, u"Run-time error '40020':\n\nInvalid operation at current state");
}

TEST_F(LoadDownload, A_report_can_be_sent_beside_it) {
  StartLoad();
  Server();
  ClickReport();
  Run();
  auto& number = *Server().Connections.back();
  number.Send("~~~~~~~~\r\n12");
  Load().Send("data");
  Run();
  auto& report = *Server().Connections.back();
  report.Send("~OK");
  report.Close();
  Run();

  EXPECT_EQ(desktop.Boxes.back().text, kSuccess);
  EXPECT_EQ(Waiting(), 4);
}

TEST_F(LoadDownload, Leaving_the_page_stops_it) {
  StartLoad();

  LeavePage();

  EXPECT_TRUE(Load().Ended);
  EXPECT_EQ(machine.sockets.OpenSockets(), 0);
}

TEST_F(LoadDownload, The_captions_take_single_clicks_for_nothing_and_show_no_hand) {
  OpenPage();

  for (forms::Label* caption :
       {&program.monitorPage.table.main_Label2, &program.monitorPage.table.main_Label3}) {
    EXPECT_FALSE(static_cast<bool>(caption->Click)) << ToUtf8(caption->Name());
    EXPECT_FALSE(static_cast<bool>(caption->MouseMove)) << ToUtf8(caption->Name());
    EXPECT_EQ(caption->Style(), forms::Label::Look::Plain) << ToUtf8(caption->Name());
  }
  EXPECT_EQ(program.monitorPage.table.main_Label2.Caption(), u"העלאה:");
  EXPECT_EQ(program.monitorPage.table.main_Label3.Caption(), u"הורדה:");
}

} // namespace
} // namespace quendra::report
