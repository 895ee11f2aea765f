#include "report/SupportExchangeFixture.h"

namespace quendra::report::tests {

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

} // namespace quendra::report::tests
