#include "report/SupportExchange.h"

#include "report/SupportExchangeFixture.h"

namespace quendra::report::tests {

TEST_F(SupportExchange, Opening_the_page_makes_four_closed_sockets) {
  OpenPage();

  ASSERT_NE(program.supportExchange.Sockets(), nullptr);
  EXPECT_EQ(program.supportExchange.Sockets()->ArrayCount(), 4);
  for (std::int16_t index = 1; index <= 4; ++index) EXPECT_EQ(StateOf(index), foundation::sckClosed) << index;
  EXPECT_FALSE(program.supportExchange.Sockets()->ArrayIndexInUse(std::int16_t{0}));
  EXPECT_FALSE(program.supportExchange.Sockets()->ArrayIndexInUse(std::int16_t{5}));
}

TEST_F(SupportExchange, Opening_the_page_connects_nothing) {
  OpenPage();
  Run();

  EXPECT_EQ(machine.sockets.Count("socket"), 0);
  EXPECT_EQ(ConnectionCount(), 0u);
}

TEST_F(SupportExchange, A_click_connects_to_port_80_of_the_server_by_its_name) {
  Server();
  OpenPage();

  ClickReport();

  EXPECT_EQ(program.supportExchange.Sockets()->RemoteHost(std::int16_t{2}), settings::SupportServerHost);
  EXPECT_EQ(program.supportExchange.Sockets()->RemotePort(std::int16_t{2}), 80);
  Run();
  EXPECT_EQ(StateOf(2), foundation::sckConnected);
  EXPECT_EQ(ConnectionCount(), 1u);
}

TEST_F(SupportExchange, The_connection_sends_the_request_for_a_number_byte_for_byte) {
  Server();
  OpenPage();

  ClickReport();
  Run();

  EXPECT_EQ(Connection(0).Received, "GET http://" + host +
                                        "/getid.asp HTTP/1.1 \r\n"
                                        "Host: " +
                                        foreignHost + "\r\nConnection: Close\r\nAccept: */*\r\n\r\n");
}

TEST_F(SupportExchange, A_number_in_one_piece_is_shown_once) {
  Server();
  OpenPage();

  AskForNumberAndAnswer("HTTP/1.1 200 OK\r\nConnection: close\r\n\r\n~~~~~~~~\r\n4711");

  EXPECT_EQ(desktop.Boxes, (Boxes{{kNumberIs + u"4711", kHebrewInformation, kTitle}}));
  EXPECT_EQ(program.supportExchange.ReportNumber, u"4711");
}

TEST_F(SupportExchange, The_number_is_kept_and_the_post_begins_only_when_its_box_is_closed) {
  Server();
  OpenPage();
  std::size_t connectionsBehindTheBox = 0;
  Text numberBehindTheBox = u"unset";
  desktop.WhileBoxStands.push_back([&] {
    Run();
    connectionsBehindTheBox = ConnectionCount();
    numberBehindTheBox = program.supportExchange.ReportNumber;
  });

  GetNumber();

  EXPECT_EQ(connectionsBehindTheBox, 1u);
  EXPECT_EQ(numberBehindTheBox, u"");
  EXPECT_EQ(ConnectionCount(), 2u);
  EXPECT_EQ(program.supportExchange.ReportNumber, u"4711");
}

TEST_F(SupportExchange, The_post_is_sent_byte_for_byte) {
  Server();
  OpenPage();
  AddRow(u"Browser", {u"browser.exe", u"User", u".80.1025.", u"001.50", u"012.25", u"0013.75"});

  GetNumber();

  const std::string body = "id=4711&procs=Browser|browser.exe|User|.80.1025.|001.50|012.25|0013.75}";
  EXPECT_EQ(Connection(1).Received, "POST http://" + host +
                                        "/procreport.asp HTTP/1.1 \r\n"
                                        "Host: " +
                                        webHost +
                                        "\r\n"
                                        "Content-Type: application/x-www-form-urlencoded\r\n"
                                        "Content-Length: " +
                                        std::to_string(body.size()) +
                                        "\r\n"
                                        "Connection: Close\r\n"
                                        "Accept: */*\r\n"
                                        "\r\n" +
                                        body + "\r\n\r\n");
}

TEST_F(SupportExchange, An_empty_table_is_posted_with_nothing_behind_its_field) {
  Server();
  OpenPage();

  GetNumber();

  EXPECT_EQ(BodyOf(Connection(1).Received), "id=4711&procs=");
}

TEST_F(SupportExchange, The_report_holds_the_table_as_it_is_when_the_post_connects) {
  Server();
  OpenPage();
  AddRow(u"Old", {u"old.exe", u"", u"", u"", u"", u""});
  desktop.WhileBoxStands.push_back([&] {
    program.monitorPage.table.main_ListView1.Clear();
    AddRow(u"New", {u"new.exe", u"", u"", u"", u"", u""});
  });

  GetNumber();

  EXPECT_EQ(BodyOf(Connection(1).Received), "id=4711&procs=New|new.exe|||||}");
}

TEST_F(SupportExchange, Hebrew_names_go_out_in_code_page_1255_and_count_as_one_character_each) {
  Server();
  OpenPage();
  AddRow(u"דפדפן, חדש", {u"דפדפן, חדש.exe", u"", u"", u"", u"", u""});

  GetNumber();

  const std::string& request = Connection(1).Received;
  const std::string body =
      "id=4711&procs=\xE3\xF4\xE3\xF4\xEF, \xE7\xE3\xF9|\xE3\xF4\xE3\xF4\xEF~ \xE7\xE3\xF9.exe|||||}";
  EXPECT_EQ(BodyOf(request), body);
  EXPECT_NE(request.find("Content-Length: " + std::to_string(body.size()) + "\r\n"), std::string::npos);
}

TEST_F(SupportExchange, What_the_code_page_lacks_goes_out_as_one_question_mark) {
  Server();
  OpenPage();
  AddRow(u"\u4E2D\u00C9", {u"a", u"", u"", u"", u"", u""});

  GetNumber();

  EXPECT_EQ(BodyOf(Connection(1).Received), "id=4711&procs=??|a|||||}");
  EXPECT_NE(Connection(1).Received.find("Content-Length: 24\r\n"), std::string::npos);
}

TEST_F(SupportExchange, A_number_in_Hebrew_is_shown_and_posted_as_it_came) {
  Server();
  OpenPage();

  AskForNumberAndAnswer("~~~~~~~~\r\n\xE0-7");

  EXPECT_EQ(desktop.Boxes.at(0).text, kNumberIs + u"א-7");
  EXPECT_EQ(BodyOf(Connection(1).Received), "id=\xE0-7&procs=");
}

TEST_F(SupportExchange, A_large_report_goes_out_whole_through_a_small_send_buffer) {
  Server().TakeAtMost(1000);
  machine.sockets.SendBufferSize = 512;
  OpenPage();
  for (int row = 0; row < 500; ++row) AddRow(u"Application", {u"name.exe", u"User", u".1.2.", u"", u"", u""});

  GetNumber();

  std::string body = "id=4711&procs=";
  for (int row = 0; row < 500; ++row) body += "Application|name.exe|User|.1.2.|||}";
  EXPECT_EQ(BodyOf(Connection(1).Received), body);
}

TEST_F(SupportExchange, The_end_of_the_first_connection_closes_its_socket_without_a_box) {
  Server();
  OpenPage();
  GetNumber();

  Connection(0).Close();
  Run();

  EXPECT_EQ(StateOf(2), foundation::sckClosed);
  EXPECT_EQ(desktop.Boxes.size(), 1u);
}

TEST_F(SupportExchange, An_accepted_report_is_told_when_its_connection_ends) {
  Server();
  OpenPage();
  GetNumber();
  Connection(1).Send("HTTP/1.1 200 OK\r\n\r\n~OK");
  Run();
  EXPECT_EQ(desktop.Boxes.size(), 1u);

  Connection(1).Close();
  Run();

  EXPECT_EQ(desktop.Boxes.size(), 2u);
  EXPECT_EQ(desktop.Boxes.back(), (Box{kSuccess, kHebrewInformation, kTitle}));
  EXPECT_EQ(StateOf(3), foundation::sckClosed);
}

TEST_F(SupportExchange, The_socket_of_the_post_is_closed_only_behind_the_result_box) {
  Server();
  OpenPage();
  GetNumber();
  foundation::SocketState behindTheBox = foundation::sckOpen;
  desktop.WhileBoxStands.push_back([&] { behindTheBox = StateOf(3); });

  AnswerReport({"~OK"});

  EXPECT_EQ(behindTheBox, foundation::sckClosing);
  EXPECT_EQ(StateOf(3), foundation::sckClosed);
}

TEST_F(SupportExchange, A_reply_in_several_pieces_is_gathered) {
  Server();
  OpenPage();
  GetNumber();

  AnswerReport({"HTTP/1.1 200 OK\r\n", "Content-Length: 3\r\n\r\n", "~", "O", "K"});

  EXPECT_EQ(program.supportExchange.ReportReply, u"HTTP/1.1 200 OK\r\nContent-Length: 3\r\n\r\n~OK");
  EXPECT_EQ(desktop.Boxes.back().text, kSuccess);
}

TEST_F(SupportExchange, The_acceptance_counts_in_the_headers_alone) {
  Server();
  OpenPage();
  GetNumber();

  AnswerReport({"HTTP/1.1 500 Broken\r\nX-Report: ~OK\r\n\r\nfailed"});

  EXPECT_EQ(desktop.Boxes.back(), (Box{kSuccess, kHebrewInformation, kTitle}));
}

TEST_F(SupportExchange, A_reply_without_the_acceptance_is_a_failure_whatever_its_status) {
  Server();
  OpenPage();
  GetNumber();

  AnswerReport({"HTTP/1.1 200 OK\r\n\r\nOK ~ok ~ OK"});

  EXPECT_EQ(desktop.Boxes.back(), (Box{kFailure, kHebrewCritical, kTitle}));
  EXPECT_EQ(StateOf(3), foundation::sckClosed);
}

TEST_F(SupportExchange, A_connection_that_ends_before_a_byte_of_reply_is_a_failure) {
  Server();
  OpenPage();
  GetNumber();

  AnswerReport({});

  EXPECT_EQ(desktop.Boxes.back(), (Box{kFailure, kHebrewCritical, kTitle}));
}

TEST_F(SupportExchange, The_reply_of_the_report_before_is_forgotten_when_the_next_post_connects) {
  Server();
  OpenPage();
  GetNumber();
  AnswerReport({"~OK"});
  Connection(0).Close();
  Run();

  ClickReport();
  Run();
  Connection(2).Send("~~~~~~~~\r\n4712");
  Run();
  Connection(3).Close();
  Run();

  EXPECT_EQ(program.supportExchange.ReportReply, u"");
  EXPECT_EQ(desktop.Boxes.back().text, kFailure);
}

} // namespace quendra::report::tests
