#include "report/ReportFixture.h"

namespace quendra::report {
namespace {

class SupportFailures : public ReportTest {
 protected:
  static constexpr const char16_t* kApplication = u"Quendra";
};

TEST_F(SupportFailures, A_refused_connection_shows_the_error_without_the_providers_title) {
  Server().Refuse();
  OpenPage();

  ClickReport();
  Run();

  EXPECT_EQ(desktop.Boxes, (Boxes{{u"winsock error: 10061 - Connection refused.", kOkOnly, kApplication}}));
}

TEST_F(SupportFailures, A_handler_that_leaves_the_display_to_the_socket_class_gets_its_plain_box) {
  Server().Refuse();
  OpenPage();
  program.supportExchange.Sockets()->Events.Error = [](const Variant&, std::int16_t, const Text&,
                                                       std::int32_t, const Text&, const Text&, std::int32_t,
                                                       bool& cancelDisplay) { cancelDisplay = false; };

  ClickReport();
  Run();

  EXPECT_EQ(desktop.Boxes, (Boxes{{u"Connection refused.", kOkOnly, u"CSocketPlus.PostSocket"}}));
}

TEST_F(SupportFailures, The_page_may_be_left_while_the_socket_class_shows_its_box) {
  Server().Refuse();
  OpenPage();
  program.supportExchange.Sockets()->Events.Error = [](const Variant&, std::int16_t, const Text&,
                                                       std::int32_t, const Text&, const Text&, std::int32_t,
                                                       bool& cancelDisplay) { cancelDisplay = false; };
  desktop.WhileBoxStands.push_back([&] { LeavePage(); });

  ClickReport();
  Run();

  EXPECT_EQ(desktop.Boxes.size(), 1u);
  EXPECT_FALSE(desktop.Ended);
  EXPECT_EQ(program.supportExchange.Sockets(), nullptr);
}

TEST_F(SupportFailures, The_handler_leaves_the_failed_socket_as_it_is) {
  Server().Refuse();
  OpenPage();

  ClickReport();
  Run();

  EXPECT_EQ(StateOf(2), foundation::sckError);
  EXPECT_EQ(machine.sockets.OpenSockets(), 1);
}

TEST_F(
    SupportFailures,
    A_click_that_reaches_its_handler_after_a_failed_connection_ends_the_program_with_the_run_times_message) {
  Server().Refuse();
  OpenPage();
  ClickReport();
  Run();

  ClickReportAllTheSame();

  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.Boxes.back().text, u"Run-time error '40020':\n\nInvalid operation at current state");
}

TEST_F(SupportFailures, Leaving_the_page_and_coming_back_mends_a_failed_socket) {
  Server().Refuse();
  OpenPage();
  ClickReport();
  Run();
  LeavePage();
  ASSERT_TRUE(desktop.Click(menu.lblCaption[0]));

  ClickReport();
  Run();

  EXPECT_FALSE(desktop.Ended);
  EXPECT_EQ(desktop.Boxes.size(), 2u);
}

TEST_F(SupportFailures, A_refused_post_shows_the_error_without_the_providers_title) {
  Server();
  OpenPage();
  desktop.WhileBoxStands.push_back([&] { Server().Refuse(); });

  GetNumber();

  EXPECT_EQ(desktop.Boxes.back(),
            (Box{u"winsock error: 10061 - Connection refused.", kOkOnly, kApplication}));
  EXPECT_EQ(desktop.Boxes.size(), 2u);
}

TEST_F(SupportFailures, A_refused_load_shows_the_error_without_the_providers_title) {
  LoadServer().Refuse();
  OpenPage();

  desktop.DoubleClick(program.monitorPage.table.main_Label3);
  Run();

  EXPECT_EQ(desktop.Boxes, (Boxes{{u"winsock error: 10061 - Connection refused.", kOkOnly, kApplication}}));
}

TEST_F(SupportFailures, An_unknown_name_shows_its_error) {
  machine.sockets.FailName(host, 11001);
  OpenPage();

  ClickReport();
  Run();

  EXPECT_EQ(desktop.Boxes, (Boxes{{u"winsock error: 11001 - Host not found.", kOkOnly, kApplication}}));
}

TEST_F(SupportFailures, An_error_number_that_the_table_lacks_is_shown_as_unknown) {
  Server().Refuse(10066);
  OpenPage();

  ClickReport();
  Run();

  EXPECT_EQ(desktop.Boxes.at(0).text, u"winsock error: 10066 - Unknown error.");
}

TEST_F(SupportFailures, A_reset_before_the_number_shows_its_error_and_posts_nothing) {
  Server();
  OpenPage();
  ClickReport();
  Run();

  Connection(0).Reset();
  Run();

  EXPECT_EQ(desktop.Boxes,
            (Boxes{{u"winsock error: 10054 - Connection reset by peer.", kOkOnly, kApplication}}));
  EXPECT_EQ(ConnectionCount(), 1u);
}

TEST_F(SupportFailures, A_reset_behind_the_number_shows_its_error_beside_the_post) {
  Server();
  OpenPage();
  GetNumber();

  Connection(0).Reset();
  Run();
  AnswerReport({"~OK"});

  EXPECT_EQ(desktop.Boxes.at(1).text, u"winsock error: 10054 - Connection reset by peer.");
  EXPECT_EQ(desktop.Boxes.at(2).text, kSuccess);
}

TEST_F(SupportFailures, A_reset_in_the_middle_of_the_reply_to_the_post_shows_its_error_and_no_result) {
  Server();
  OpenPage();
  GetNumber();
  Connection(1).Send("HTTP/1.1 200 OK\r\n\r\n~O");
  Run();

  Connection(1).Reset();
  Run();

  ASSERT_EQ(desktop.Boxes.size(), 2u);
  EXPECT_EQ(desktop.Boxes[1].text, u"winsock error: 10054 - Connection reset by peer.");
  EXPECT_EQ(StateOf(3), foundation::sckError);
}

TEST_F(SupportFailures, An_end_before_a_byte_of_the_number_ends_the_exchange_without_a_message) {
  Server();
  OpenPage();
  ClickReport();
  Run();

  Connection(0).Close();
  Run();

  EXPECT_TRUE(desktop.Boxes.empty());
  EXPECT_EQ(StateOf(2), foundation::sckClosed);
  EXPECT_EQ(ConnectionCount(), 1u);
}

TEST_F(SupportFailures, A_server_that_stays_silent_leaves_the_exchange_hanging_until_the_page_is_left) {
  Server();
  OpenPage();
  ClickReport();
  Run();

  desktop.Advance(24 * 3'600'000);

  EXPECT_EQ(StateOf(2), foundation::sckConnected);
  EXPECT_TRUE(desktop.Boxes.empty());
  LeavePage();
  EXPECT_EQ(machine.sockets.OpenSockets(), 0);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(SupportFailures, A_server_that_answers_no_connection_is_waited_for_as_long) {
  Server().StaySilent();
  OpenPage();
  ClickReport();
  Run();

  desktop.Advance(24 * 3'600'000);

  EXPECT_EQ(StateOf(2), foundation::sckConnecting);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(SupportFailures, A_socket_that_cannot_be_made_shows_its_error) {
  OpenPage();
  machine.sockets.Fail("socket", 10024);

  ClickReport();

  EXPECT_EQ(desktop.Boxes, (Boxes{{u"winsock error: 10024 - Too many open files.", kOkOnly, kApplication}}));
  EXPECT_EQ(StateOf(2), foundation::sckError);
}

TEST_F(SupportFailures, An_address_that_cannot_be_assigned_ends_the_program_with_the_run_times_message) {
  Server();
  OpenPage();
  machine.sockets.Fail("connect", 10049);

  ClickReport();
  Run();

  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.Boxes.back().text, u"Run-time error '10049':\n\nCannot assign requested address.");
}

TEST_F(SupportFailures,
       A_page_whose_socket_library_does_not_start_ends_the_program_with_the_run_times_message) {
  machine.sockets.Fail("WSAStartup", 10091);

  OpenPage();

  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.Boxes.back().text, u"Run-time error '10091':\n\nNetwork subsystem is unavailable.");
}

TEST_F(SupportFailures,
       A_page_whose_socket_library_does_not_end_ends_the_program_with_the_run_times_message) {
  OpenPage();
  machine.sockets.Fail("WSACleanup", 10091);

  desktop.Click(menu.lblCaption[2]);

  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.Boxes.back().text, u"Run-time error '10091':\n\nNetwork subsystem is unavailable.");
}

TEST_F(SupportFailures, A_failed_read_ends_the_program_with_the_run_times_message) {
  Server();
  OpenPage();
  ClickReport();
  Run();
  machine.sockets.Fail("recv", 10050);

  Connection(0).Send("~~~~~~~~\r\n1");
  Run();

  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.Boxes.back().text, u"Run-time error '10050':\n\nNetwork is down.");
}

TEST_F(SupportFailures,
       A_number_in_a_hundred_pieces_behind_one_another_gives_a_hundred_boxes_that_stand_at_once) {
  Server();
  OpenPage();
  for (int piece = 1; piece < 100; ++piece)
    desktop.WhileBoxStands.push_back([&] {
      Connection(0).Send("x");
      Run();
    });
  desktop.WhileBoxStands.push_back([&] { Server().StaySilent(); });

  AskForNumberAndAnswer("x");

  EXPECT_EQ(
      std::count(desktop.Boxes.begin(), desktop.Boxes.end(), Box{kNumberIs, kHebrewInformation, kTitle}),
      100);
  EXPECT_EQ(desktop.Boxes.back().text, u"Run-time error '40020':\n\nInvalid operation at current state");
}

TEST_F(SupportFailures, A_number_in_ten_thousand_pieces_runs_out_of_room_for_boxes_before_the_stack_ends) {
  Server();
  OpenPage();
  for (int piece = 1; piece < 10'000; ++piece)
    desktop.WhileBoxStands.push_back([&] {
      Connection(0).Send("x");
      Run();
    });

  AskForNumberAndAnswer("x");

  EXPECT_TRUE(desktop.Ended);
  EXPECT_EQ(desktop.EndStatus, 1);
  EXPECT_EQ(desktop.Boxes.size(), 251u);
  EXPECT_EQ(desktop.Boxes.back().text, u"Run-time error '28':\n\nOut of stack space");
}

TEST_F(SupportFailures, Boxes_that_were_closed_make_room_for_others) {
  Server();
  OpenPage();
  for (int round = 0; round < 600; ++round) {
    ClickReport();
    Run();
    Server().Connections.back()->Send("~~~~~~~~\r\n1");
    Run();
    Server().Connections.back()->Close();
    Server().Connections.at(Server().Connections.size() - 2)->Close();
    Run();
  }

  EXPECT_FALSE(desktop.Ended);
  EXPECT_EQ(desktop.Boxes.size(), 1200u);
}

TEST_F(SupportFailures, NUL_bytes_in_the_number_are_shown_kept_and_posted) {
  Server();
  OpenPage();

  AskForNumberAndAnswer(std::string("~~~~~~~~\r\n1\0002", 13));

  EXPECT_EQ(desktop.Boxes.at(0).text, kNumberIs + Text(TextView(u"1\0002", 3)));
  EXPECT_EQ(BodyOf(Connection(1).Received), std::string("id=1\0002&procs=", 13));
}

TEST_F(SupportFailures, The_acceptance_is_found_behind_NUL_bytes) {
  Server();
  OpenPage();
  GetNumber();

  AnswerReport({std::string("\0\0\0~OK", 6)});

  EXPECT_EQ(desktop.Boxes.back().text, kSuccess);
}

TEST_F(SupportFailures, A_reply_to_the_post_in_ten_thousand_pieces_is_gathered) {
  Server();
  OpenPage();
  GetNumber();

  std::vector<std::string> pieces(10'000, "x");
  pieces.push_back("~");
  pieces.push_back("OK");
  AnswerReport(pieces);

  EXPECT_EQ(program.supportExchange.ReportReply.size(), 10'003u);
  EXPECT_EQ(desktop.Boxes.back().text, kSuccess);
}

TEST_F(SupportFailures, A_reply_of_100_MB_to_the_post_is_gathered) {
  machine.sockets.ReceiveBufferSize = 1 << 20;
  Server();
  OpenPage();
  GetNumber();
  const std::string megabyte(1 << 20, 'x');

  for (int i = 0; i < 100; ++i) {
    Connection(1).Send(megabyte);
    Run();
  }
  AnswerReport({"~OK"});

  EXPECT_EQ(program.supportExchange.ReportReply.size(), (100u << 20) + 3);
  EXPECT_EQ(desktop.Boxes.back().text, kSuccess);
}

} // namespace
} // namespace quendra::report
