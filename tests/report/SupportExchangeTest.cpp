#include "report/SupportExchange.h"

#include "report/ReportFixture.h"

namespace quendra::report {
namespace {

class SupportExchange : public ReportTest {
 protected:
  const std::string webHost = ToUtf8(settings::SupportServerWebHost);
  const std::string foreignHost = ToUtf8(settings::RequestHostHeader);
};

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

TEST_F(SupportExchange, A_reply_without_the_mark_shows_and_posts_its_text_from_the_tenth_character_on) {
  Server();
  OpenPage();

  AskForNumberAndAnswer("HTTP/1.1 404 Not Found\r\n\r\n");

  EXPECT_EQ(desktop.Boxes.at(0), (Box{kNumberIs + u"404 Not Found\r\n\r\n", kHebrewInformation, kTitle}));
  EXPECT_EQ(BodyOf(Connection(1).Received), "id=404 Not Found\r\n\r\n&procs=");
}

TEST_F(SupportExchange, A_reply_of_fewer_than_ten_characters_shows_and_posts_an_empty_number) {
  Server();
  OpenPage();

  AskForNumberAndAnswer("~~~~~~~~");

  EXPECT_EQ(desktop.Boxes.at(0).text, kNumberIs);
  EXPECT_EQ(BodyOf(Connection(1).Received), "id=&procs=");
}

TEST_F(SupportExchange, A_reply_in_two_pieces_gives_two_numbers_two_boxes_and_two_posts) {
  Server();
  OpenPage();
  GetNumber();
  AnswerReport({"~OK"});

  Connection(0).Send("second piece of it");
  Run();

  ASSERT_EQ(ConnectionCount(), 3u);
  EXPECT_EQ(BodyOf(Connection(1).Received), "id=4711&procs=");
  EXPECT_EQ(BodyOf(Connection(2).Received), "id=ece of it&procs=");
  EXPECT_EQ(desktop.Boxes, (Boxes{{kNumberIs + u"4711", kHebrewInformation, kTitle},
                                  {kSuccess, kHebrewInformation, kTitle},
                                  {kNumberIs + u"ece of it", kHebrewInformation, kTitle}}));
}

TEST_F(SupportExchange, A_mark_that_is_split_over_two_pieces_is_in_neither) {
  Server();
  OpenPage();
  AskForNumberAndAnswer("HTTP/1.1 200 OK\r\n\r\n~~~~");
  AnswerReport({"~OK"});

  Connection(0).Send("~~~~\r\n4711");
  Run();

  EXPECT_EQ(desktop.Boxes.at(0).text, kNumberIs + u"200 OK\r\n\r\n~~~~");
  EXPECT_EQ(desktop.Boxes.back().text, kNumberIs + u"1");
}

TEST_F(SupportExchange, A_second_piece_behind_the_first_ones_box_is_shown_and_posted_first) {
  Server();
  OpenPage();
  desktop.WhileBoxStands.push_back([&] {
    Connection(0).Send("~~~~~~~~\r\n2");
    Run();
    AnswerReport({"~OK"});
  });

  AskForNumberAndAnswer("~~~~~~~~\r\n1");

  EXPECT_EQ(desktop.Boxes, (Boxes{{kNumberIs + u"1", kHebrewInformation, kTitle},
                                  {kNumberIs + u"2", kHebrewInformation, kTitle},
                                  {kSuccess, kHebrewInformation, kTitle}}));
  ASSERT_EQ(ConnectionCount(), 3u);
  EXPECT_EQ(BodyOf(Connection(1).Received), "id=2&procs=");
  EXPECT_EQ(BodyOf(Connection(2).Received), "id=1&procs=");
}

TEST_F(SupportExchange,
       A_second_piece_during_the_post_of_the_first_ends_the_program_with_the_run_times_message) {
  Server();
  OpenPage();
  GetNumber();

  Connection(0).Send("~~~~~~~~\r\n2");
  Run();

  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 1);
  EXPECT_NE(desktop.Boxes.back().text.find(u"40020"), Text::npos);
}

TEST_F(
    SupportExchange,
    A_second_click_that_reaches_its_handler_during_an_exchange_ends_the_program_with_the_run_times_message) {
  Server();
  OpenPage();
  ClickReport();
  Run();

  ClickReportAllTheSame();

  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 1);
  ASSERT_EQ(desktop.Boxes.size(), 1u);
  EXPECT_EQ(desktop.Boxes[0].text, u"Run-time error '40020':\n\nInvalid operation at current state");
}

TEST_F(SupportExchange, A_click_behind_a_finished_exchange_makes_another) {
  Server();
  OpenPage();
  for (std::size_t round = 0; round < 3; ++round) {
    ClickReport();
    Run();
    Connection(2 * round).Send("~~~~~~~~\r\n" + std::to_string(round));
    Run();
    Connection(2 * round).Close();
    Connection(2 * round + 1).Send("~OK");
    Connection(2 * round + 1).Close();
    Run();

    EXPECT_EQ(BodyOf(Connection(2 * round + 1).Received), "id=" + std::to_string(round) + "&procs=");
    EXPECT_EQ(desktop.Boxes.back().text, kSuccess);
  }
  EXPECT_EQ(desktop.Boxes.size(), 6u);
}

TEST_F(SupportExchange, Leaving_the_page_releases_the_sockets_and_the_library) {
  Server();
  OpenPage();
  GetNumber();
  ASSERT_EQ(machine.sockets.OpenSockets(), 2);

  LeavePage();

  EXPECT_EQ(program.supportExchange.Sockets(), nullptr);
  EXPECT_EQ(machine.sockets.OpenSockets(), 0);
  EXPECT_EQ(machine.sockets.Count("WSAStartup"), 1);
  EXPECT_EQ(std::count(machine.Calls.begin(), machine.Calls.end(), "WSACleanup"), 1);
}

TEST_F(SupportExchange, Leaving_the_page_while_the_name_is_looked_up_cancels_the_look_up) {
  machine.sockets.NeverAnswer(host);
  OpenPage();
  ClickReport();
  ASSERT_EQ(machine.sockets.LookUpsUnderWay(), 1);

  LeavePage();
  Run();

  EXPECT_EQ(machine.sockets.LookUpsUnderWay(), 0);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(SupportExchange, Leaving_the_page_in_the_middle_of_an_exchange_ends_it_without_a_message) {
  Server();
  OpenPage();
  GetNumber();
  const std::size_t boxes = desktop.Boxes.size();

  LeavePage();
  Connection(0).Send("~~~~~~~~\r\n4712");
  Connection(1).Send("~OK");
  Connection(1).Close();
  Run();

  EXPECT_EQ(desktop.Boxes.size(), boxes);
  EXPECT_FALSE(desktop.Ended);
  EXPECT_EQ(ConnectionCount(), 2u);
}

TEST_F(SupportExchange, Leaving_the_page_behind_the_box_of_the_number_ends_the_exchange_without_a_message) {
  Server();
  OpenPage();
  desktop.WhileBoxStands.push_back([&] { LeavePage(); });

  GetNumber();

  EXPECT_EQ(desktop.Boxes.size(), 1u);
  EXPECT_FALSE(desktop.Ended);
  EXPECT_EQ(ConnectionCount(), 1u);
}

TEST_F(SupportExchange, Leaving_the_page_behind_the_box_of_the_result_ends_the_exchange_without_a_message) {
  Server();
  OpenPage();
  GetNumber();
  desktop.WhileBoxStands.push_back([&] { LeavePage(); });

  AnswerReport({"~OK"});

  EXPECT_EQ(desktop.Boxes.size(), 2u);
  EXPECT_FALSE(desktop.Ended);
}

TEST_F(SupportExchange, A_page_that_was_left_and_opened_again_behind_a_box_takes_nothing_over_from_it) {
  Server();
  OpenPage();
  desktop.WhileBoxStands.push_back([&] {
    LeavePage();
    ASSERT_TRUE(desktop.Click(menu.lblCaption[0]));
  });

  GetNumber();

  EXPECT_EQ(ConnectionCount(), 1u);
  EXPECT_EQ(StateOf(3), foundation::sckClosed);
  EXPECT_TRUE(program.monitorPage.reporting.main_cmdRpt.Enabled());
}

TEST_F(SupportExchange, Closing_the_window_in_the_middle_of_an_exchange_ends_the_program_as_usual) {
  Server();
  OpenPage();
  GetNumber();

  desktop.CloseBox(menu);

  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 0);
  EXPECT_EQ(machine.sockets.OpenSockets(), 0);
}

TEST_F(SupportExchange, Coming_back_to_the_page_after_an_exchange_that_was_left_starts_afresh) {
  Server();
  OpenPage();
  ClickReport();
  Run();
  LeavePage();

  ASSERT_TRUE(desktop.Click(menu.lblCaption[0]));
  ClickReport();
  Run();
  Connection(1).Send("~~~~~~~~\r\n9");
  Run();

  EXPECT_EQ(desktop.Boxes.back().text, kNumberIs + u"9");
}

TEST_F(SupportExchange, Choosing_the_page_again_makes_new_sockets) {
  Server();
  OpenPage();
  ClickReport();
  Run();

  ASSERT_TRUE(desktop.Click(menu.lblCaption[5]));

  for (std::int16_t index = 1; index <= 4; ++index) EXPECT_EQ(StateOf(index), foundation::sckClosed) << index;
  EXPECT_EQ(machine.sockets.Count("WSAStartup"), 2);
}

TEST_F(SupportExchange, Leaving_the_page_closes_the_sockets_in_the_order_of_their_indexes) {
  Server();
  LoadServer();
  OpenPage();
  ASSERT_TRUE(desktop.DoubleClick(program.monitorPage.table.main_Label3));
  ClickReport();
  Run();
  const auto closing = [&](std::int16_t index) {
    return "closesocket " + std::to_string(program.supportExchange.Sockets()->SocketHandle(index));
  };
  const std::vector<std::string> expected{closing(2), closing(4)};
  machine.Calls.clear();

  LeavePage();

  std::vector<std::string> closed;
  std::copy_if(machine.Calls.begin(), machine.Calls.end(), std::back_inserter(closed),
               [](const std::string& call) { return call.starts_with("closesocket"); });
  EXPECT_EQ(closed, expected);
}

} // namespace
} // namespace quendra::report
