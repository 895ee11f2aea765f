#include "foundation/SocketSuite.h"

namespace quendra::foundation {
namespace {

class ConnectionSuite : public SocketSuite {};

QUENDRA_OVER_BOTH_NETWORKS(ConnectionSuite);

// Connecting.

TEST_P(ConnectionSuite, A_connection_by_address_goes_through_connecting_to_connected) {
  program->ArrayAdd(1);
  program->Connect(1, Text(u"127.0.0.1"), server->Port());
  EXPECT_EQ(program->State(1), sckConnecting);
  ASSERT_TRUE(program.Until("Connect 1"));
  EXPECT_EQ(program->State(1), sckConnected);
  EXPECT_EQ(program.Events, std::vector<std::string>{"Connect 1"});
}

TEST_P(ConnectionSuite, A_connection_fills_both_addresses_and_empties_the_host) {
  const auto far = Connected();
  EXPECT_EQ(program->RemoteHostIP(1), u"127.0.0.1");
  EXPECT_EQ(program->RemotePort(1), server->Port());
  EXPECT_EQ(program->RemoteHost(1), u"");
  EXPECT_EQ(program->LocalIP(1), u"127.0.0.1");
  EXPECT_GT(program->LocalPort(1), 0);
}

TEST_P(ConnectionSuite, A_connection_by_name_looks_the_name_up_first) {
  program->ArrayAdd(1);
  program->Connect(1, Text(u"localhost"), server->Port());
  EXPECT_EQ(program->State(1), sckResolvingHost);
  EXPECT_EQ(program.module.ResolveCount(), 1);
  ASSERT_TRUE(program.Until("Connect 1"));
  EXPECT_EQ(program->RemoteHostIP(1), u"127.0.0.1");
}

TEST_P(ConnectionSuite, A_name_of_300_characters_is_not_found) {
  program->ArrayAdd(1);
  program->Connect(1, Text(300, u'x'), 80);
  ASSERT_TRUE(UntilState(1, sckError));
  EXPECT_EQ(program.Events, std::vector<std::string>{"Error 1 11001 CSocketPlus.ConnectToIP"});
}

TEST_P(ConnectionSuite, A_refused_connection_raises_Error_10061_and_leaves_the_state_at_error) {
  program->ArrayAdd(1);
  program->Connect(1, Text(u"127.0.0.1"), world->ClosedPort());
  ASSERT_TRUE(program.Until("Error 1 10061 CSocketPlus.PostSocket"));
  EXPECT_EQ(program->State(1), sckError);
  EXPECT_EQ(FaultOf([&] { program->Connect(1); }), 40020);
  program->CloseSck(1);
  EXPECT_EQ(program->State(1), sckClosed);
}

TEST_P(ConnectionSuite, A_closed_socket_connects_again) {
  const auto first = Connected();
  program->CloseSck(1);
  program.Events.clear();
  program->Connect(1, Text(u"127.0.0.1"), server->Port());
  EXPECT_TRUE(program.Until("Connect 1"));
}

TEST_P(ConnectionSuite, Port_0_that_was_set_before_raises_10049_at_the_connection) {
  program->ArrayAdd(1);
  program->SetRemotePort(1, 0);
  EXPECT_EQ(FaultOf([&] { program->Connect(1, Text(u"127.0.0.1")); }), 10049);
  EXPECT_EQ(program->State(1), sckConnecting);
}

TEST_P(ConnectionSuite, Address_0_raises_10049_at_the_connection) {
  program->ArrayAdd(1);
  EXPECT_EQ(FaultOf([&] { program->Connect(1, Text(u"0.0.0.0"), 80); }), 10049);
}

TEST_P(ConnectionSuite, The_local_host_has_a_name_and_an_address) {
  EXPECT_FALSE(program->LocalHostName().empty());
  program->ArrayAdd(1);
  EXPECT_FALSE(program->LocalIP(1).empty());
}

TEST_P(ConnectionSuite, A_connection_reset_before_its_event_raises_Connect_and_then_Error_10054) {
  program->ArrayAdd(1);
  program->Connect(1, Text(u"127.0.0.1"), server->Port());
  std::unique_ptr<FarEnd> far = server->TakeConnection();
  ASSERT_TRUE(far || world->Until([&] { return (far = server->TakeConnection()) != nullptr; }));
  far->Reset();
  ASSERT_TRUE(program.Until("Error 1 10054 CSocketPlus.PostSocket"));
  EXPECT_EQ(program.Events, (std::vector<std::string>{"Connect 1", "Error 1 10054 CSocketPlus.PostSocket"}));
  EXPECT_EQ(program->RemoteHostIP(1), u"127.0.0.1");
  EXPECT_EQ(program->RemotePort(1), server->Port());
  EXPECT_EQ(program->State(1), sckError);
}

// Receiving.

TEST_P(ConnectionSuite, Data_left_in_the_buffer_arrives_with_a_growing_total) {
  const auto far = Connected();
  far->Send("abc");
  ASSERT_TRUE(program.Until("DataArrival 1 3"));
  far->Send("de");
  ASSERT_TRUE(program.Until("DataArrival 1 5"));
  EXPECT_EQ(program->BytesReceived(1), 5);
  EXPECT_EQ(program.Take(1), "abcde");
  EXPECT_EQ(program->BytesReceived(1), 0);
}

TEST_P(ConnectionSuite, Data_taken_in_its_event_arrives_piece_by_piece) {
  std::vector<std::string> pieces;
  const auto far = Connected();
  program->Events.DataArrival = [&](const Variant& index, std::int32_t) {
    pieces.push_back(program.Take(index));
  };
  far->Send("abc");
  ASSERT_TRUE(world->Until([&] { return pieces.size() == 1; }));
  far->Send("de");
  ASSERT_TRUE(world->Until([&] { return pieces.size() == 2; }));
  EXPECT_EQ(pieces, (std::vector<std::string>{"abc", "de"}));
}

TEST_P(ConnectionSuite, A_reply_that_is_longer_than_the_buffer_of_a_read_comes_in_several_events) {
  const auto far = Connected();
  int arrivals = 0;
  std::string taken;
  program->Events.DataArrival = [&](const Variant& index, std::int32_t) {
    ++arrivals;
    taken += program.Take(index);
  };
  std::string sent(100'000, 'x');
  for (std::size_t i = 0; i < sent.size(); ++i) sent[i] = static_cast<char>('a' + i % 26);
  int rounds = 0;
  for (; rounds < 5; ++rounds) {
    far->Send(sent);
    ASSERT_TRUE(
        world->Until([&] { return taken.size() == sent.size() * static_cast<std::size_t>(rounds + 1); }));
  }
  EXPECT_GE(arrivals, 5);
  for (int i = 0; i < rounds; ++i)
    ASSERT_EQ(taken.substr(static_cast<std::size_t>(i) * sent.size(), sent.size()), sent);
}

TEST_P(ConnectionSuite, Nul_bytes_pass_as_they_are) {
  const auto far = Connected();
  const std::string bytes("a\0b\0\0", 5);
  far->Send(bytes);
  ASSERT_TRUE(program.Until("DataArrival 1 5"));
  EXPECT_EQ(program.Take(1), bytes);
  program->SendData(1, BytesFrom(bytes));
  EXPECT_TRUE(UntilReceived(*far, bytes));
}

TEST_P(ConnectionSuite, A_maximum_takes_so_much_and_leaves_the_rest) {
  const auto far = Connected();
  far->Send("abcdef");
  ASSERT_TRUE(program.Until("DataArrival 1 6"));
  Variant data = Text();
  program->PeekData(1, data, DataKind::None, 2);
  EXPECT_EQ(data, Variant(Text(u"ab")));
  program->GetData(1, data, DataKind::None, 4);
  EXPECT_EQ(data, Variant(Text(u"abcd")));
  program->GetData(1, data, DataKind::None, 40);
  EXPECT_EQ(data, Variant(Text(u"ef")));
}

TEST_P(ConnectionSuite, Every_kind_of_element_goes_out_and_comes_back) {
  const auto far = Connected();
  const std::vector<std::pair<Variant, std::string>> elements = {
      {std::uint8_t{200}, std::string("\xC8")},
      {std::int16_t{-2}, std::string("\xFE\xFF")},
      {std::int32_t{66051}, std::string("\x03\x02\x01\0", 4)},
      {1.5f, std::string("\0\0\xC0\x3F", 4)},
      {-2.0, std::string("\0\0\0\0\0\0\0\xC0", 8)},
      {Currency{10000}, std::string("\x10\x27\0\0\0\0\0\0", 8)},
      {Date{2.0}, std::string("\0\0\0\0\0\0\0\x40", 8)},
      {true, std::string("\xFF\xFF")},
      {Text(u"שלום!"), std::string("\xF9\xEC\xE5\xED!")},
      {BytesFrom("raw"), std::string("raw")}};
  std::string all;
  for (const auto& [value, bytes] : elements) {
    program->SendData(1, value);
    all += bytes;
    ASSERT_TRUE(UntilReceived(*far, all)) << bytes.size();
  }
  far->Send(all);
  ASSERT_TRUE(program.Until("DataArrival 1 " + std::to_string(all.size())));
  for (const auto& [value, bytes] : elements) {
    Variant data;
    program->GetData(1, data, value.Kind(), static_cast<std::int32_t>(bytes.size()));
    EXPECT_EQ(data, value);
    EXPECT_EQ(data.Kind(), value.Kind());
  }
  EXPECT_EQ(program->BytesReceived(1), 0);
}

TEST_P(ConnectionSuite, A_fixed_element_with_too_few_bytes_waiting_changes_nothing) {
  const auto far = Connected();
  far->Send("abc");
  ASSERT_TRUE(program.Until("DataArrival 1 3"));
  Variant data = std::int32_t{7};
  program->GetData(1, data);
  EXPECT_EQ(data, Variant(std::int32_t{7}));
  EXPECT_EQ(data.Kind(), DataKind::Long);
  EXPECT_EQ(program->BytesReceived(1), 3);
}

} // namespace
} // namespace quendra::foundation
