#include "report/SupportExchangeFixture.h"

namespace quendra::report::tests {

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

} // namespace quendra::report::tests
