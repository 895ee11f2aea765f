#include "foundation/SocketSuite.h"

namespace quendra::foundation {
namespace {

class SendAndCloseSuite : public SocketSuite {};

QUENDRA_OVER_BOTH_NETWORKS(SendAndCloseSuite);

// Sending.

TEST_P(SendAndCloseSuite, A_sent_text_is_reported_with_its_length_and_then_complete) {
  const auto far = Connected();
  program->SendData(1, Text(u"hello"));
  ASSERT_TRUE(UntilReceived(*far, "hello"));
  EXPECT_EQ(program.Events, (std::vector<std::string>{"Connect 1", "SendProgress 1 5 0", "SendComplete 1"}));
}

TEST_P(SendAndCloseSuite, An_empty_text_sends_nothing_and_raises_no_event) {
  const auto far = Connected();
  program->SendData(1, Text());
  program->SendData(1, ByteArray());
  world->Settle();
  EXPECT_EQ(program.Events, std::vector<std::string>{"Connect 1"});
  EXPECT_EQ(far->Received(), "");
}

TEST_P(SendAndCloseSuite, Big_data_goes_out_in_parts_whose_progress_adds_up) {
  const auto far = Connected();
  std::int64_t reported = 0;
  std::vector<std::int32_t> left;
  program->Events.SendProgress = [&](const Variant&, std::int32_t sent, std::int32_t remaining) {
    reported += sent;
    left.push_back(remaining);
  };
  std::string big(20'000'000, '\0');
  for (std::size_t i = 0; i < big.size(); ++i) big[i] = static_cast<char>(i * 7 + i / 251);
  program->SendData(1, BytesFrom(big));
  ASSERT_TRUE(
      world->Until([&] { return far->Received().size() == big.size() && program.Saw("SendComplete 1"); }));
  EXPECT_TRUE(far->Received() == big);
  EXPECT_EQ(reported, static_cast<std::int64_t>(big.size()));
  EXPECT_GT(left.size(), 1u);
  EXPECT_EQ(left.back(), 0);
  EXPECT_TRUE(std::is_sorted(left.rbegin(), left.rend()));
}

TEST_P(SendAndCloseSuite, Data_sent_while_data_waits_goes_out_behind_it_with_one_completion) {
  const auto far = Connected();
  const std::string big(10'000'000, 'b');
  program->SendData(1, BytesFrom(big));
  ASSERT_FALSE(program.Saw("SendComplete 1"));
  program->SendData(1, Text(u"tail"));
  ASSERT_TRUE(world->Until([&] { return far->Received().size() == big.size() + 4; }));
  ASSERT_TRUE(program.Until("SendComplete 1"));
  EXPECT_EQ(far->Received().substr(big.size()), "tail");
  EXPECT_EQ(std::count(program.Events.begin(), program.Events.end(), "SendComplete 1"), 1);
}

// Closing.

TEST_P(SendAndCloseSuite, The_peers_close_raises_CloseSck_once_and_waits_for_the_caller) {
  const auto far = Connected();
  far->Close();
  ASSERT_TRUE(program.Until("CloseSck 1"));
  EXPECT_EQ(program->State(1), sckClosing);
  EXPECT_NE(program->SocketHandle(1), -1);
  world->Settle();
  EXPECT_EQ(std::count(program.Events.begin(), program.Events.end(), "CloseSck 1"), 1);
  program->CloseSck(1);
  EXPECT_EQ(program->State(1), sckClosed);
  EXPECT_EQ(program->SocketHandle(1), -1);
}

TEST_P(SendAndCloseSuite, The_last_data_arrives_before_the_close) {
  const auto far = Connected();
  far->Send("last words");
  far->Close();
  ASSERT_TRUE(program.Until("CloseSck 1"));
  EXPECT_EQ(program.Events, (std::vector<std::string>{"Connect 1", "DataArrival 1 10", "CloseSck 1"}));
}

TEST_P(SendAndCloseSuite, Data_that_nobody_took_before_the_close_is_refused_by_GetData_and_lost) {
  const auto far = Connected();
  far->Send("data");
  far->Close();
  ASSERT_TRUE(program.Until("CloseSck 1"));
  EXPECT_EQ(program->BytesReceived(1), 4);
  EXPECT_EQ(FaultOf([&] { program.Take(1); }), 40006);
}

TEST_P(SendAndCloseSuite, A_close_before_a_byte_is_a_close_without_data) {
  const auto far = Connected();
  far->Close();
  ASSERT_TRUE(program.Until("CloseSck 1"));
  EXPECT_EQ(program.Events, (std::vector<std::string>{"Connect 1", "CloseSck 1"}));
}

TEST_P(SendAndCloseSuite, A_reset_raises_Error_10054_behind_the_last_data) {
  const auto far = Connected();
  far->Send("abc");
  world->Settle();
  far->Reset();
  ASSERT_TRUE(program.Until("Error 1 10054 CSocketPlus.PostSocket"));
  EXPECT_EQ(program.Events, (std::vector<std::string>{"Connect 1", "DataArrival 1 3",
                                                      "Error 1 10054 CSocketPlus.PostSocket"}));
  EXPECT_EQ(program->State(1), sckError);
}

TEST_P(SendAndCloseSuite, A_reset_right_behind_data_loses_none_of_it) {
  const auto far = Connected();
  far->Send("abc");
  far->Reset();
  ASSERT_TRUE(program.Until("Error 1 10054 CSocketPlus.PostSocket"));
  EXPECT_TRUE(program.Saw("DataArrival 1 3"));
  EXPECT_FALSE(world->Desktop.Ended);
}

TEST_P(SendAndCloseSuite, CloseSck_ends_the_connection_and_raises_no_event) {
  const auto far = Connected();
  program->CloseSck(1);
  EXPECT_TRUE(world->Until([&] { return far->Ended(); }));
  EXPECT_EQ(program.Events, std::vector<std::string>{"Connect 1"});
}

TEST_P(SendAndCloseSuite, CloseSck_on_a_closed_socket_does_nothing_visible) {
  program->ArrayAdd(1);
  program->CloseSck(1);
  EXPECT_EQ(program->State(1), sckClosed);
  EXPECT_TRUE(program.Events.empty());
}

TEST_P(SendAndCloseSuite, CloseSck_while_a_name_is_looked_up_ends_the_look_up) {
  program->ArrayAdd(1);
  program->Connect(1, Text(u"localhost"), server->Port());
  program->CloseSck(1);
  EXPECT_EQ(program->State(1), sckClosed);
  world->Settle();
  EXPECT_TRUE(program.Events.empty());
  EXPECT_EQ(program.module.ResolveCount(), 1);
}

TEST_P(SendAndCloseSuite, Messages_of_a_socket_closed_a_moment_ago_raise_nothing) {
  const auto far = Connected();
  far->Send("late");
  program->CloseSck(1);
  world->Settle();
  EXPECT_EQ(program.Events, std::vector<std::string>{"Connect 1"});
  EXPECT_FALSE(world->Desktop.Ended);
}

} // namespace
} // namespace quendra::foundation
